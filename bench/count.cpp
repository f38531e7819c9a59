// Loaded ahead of a program's libraries, tells on the standard error how often it allocated.
#include <stdio.h>
#include <unistd.h>

#include "tests/support/allocations.h"

namespace {

[[gnu::destructor]] void Tell() {
  char line[32];
  const int length = snprintf(line, sizeof line, "\nallocations %d\n", zor::test::sAllocations);
  if (write(STDERR_FILENO, line, static_cast<size_t>(length)) != length) _exit(1);
}

}  // namespace
