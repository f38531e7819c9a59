#include "zornet/progress.h"

#include <fmt/core.h>

#include <cstdio>

namespace zornet {

void ProgressLine::Show(std::uint64_t steps, std::size_t waiting) {
  if (!mOn) return;
  const Clock::time_point now = Clock::now();
  if (now < mNext) return;
  mNext = now + std::chrono::milliseconds(100);
  mShown = true;
  const double seconds = std::chrono::duration<double>(now - mBegin).count();
  fmt::print(stderr, "\r\x1b[K{:.1f} s: {} passes, {} constraints waiting", seconds, steps, waiting);
}

ProgressLine::~ProgressLine() {
  if (mShown) std::fputs("\r\x1b[K", stderr);
}

}  // namespace zornet
