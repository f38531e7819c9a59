// Signals that end a run as a flag, so that what was found is told first.
#pragma once

#include <atomic>

namespace zornet {

// While there is one, the first SIGINT or SIGTERM raises the flag, unless the program was started to ignore it. A
// second one ends the program at once.
class Interrupts {
 public:
  Interrupts();
  ~Interrupts();
  Interrupts(const Interrupts&) = delete;
  Interrupts& operator=(const Interrupts&) = delete;

  static const std::atomic<bool>& Flag();
  static void Raise();  // without a signal
  static int Signal();  // that raised the flag, or 0
};

// Whether nobody reads standard output any more.
bool IsReaderGone();

}  // namespace zornet
