// A line on standard error that shows the progress of a long run.
#pragma once

#include <chrono>
#include <cstdint>

namespace zornet {

class ProgressLine {
 public:
  using Clock = std::chrono::steady_clock;

  // Writes nothing before its patience has run out, and then ten times a second at most.
  explicit ProgressLine(bool on, Clock::duration patience = std::chrono::seconds(1))
      : mOn(on), mNext(mBegin + patience) {}
  ~ProgressLine();  // wipes the line
  ProgressLine(const ProgressLine&) = delete;
  ProgressLine& operator=(const ProgressLine&) = delete;

  void Show(std::uint64_t steps, std::size_t waiting);

 private:
  bool mOn;
  bool mShown = false;
  Clock::time_point mBegin = Clock::now();
  Clock::time_point mNext;
};

}  // namespace zornet
