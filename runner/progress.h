// A line on standard error that says how far a long run is.
#pragma once

#include <chrono>
#include <cstdint>

namespace zornet {

class ProgressLine {
 public:
  explicit ProgressLine(bool on) : mOn(on) {}
  ~ProgressLine();  // wipes the line
  ProgressLine(const ProgressLine&) = delete;
  ProgressLine& operator=(const ProgressLine&) = delete;

  // Writes nothing in the first second, and then ten times a second at most.
  void Show(std::uint64_t steps, std::size_t waiting);

 private:
  using Clock = std::chrono::steady_clock;

  bool mOn;
  bool mShown = false;
  Clock::time_point mBegin = Clock::now();
  Clock::time_point mNext = mBegin + std::chrono::seconds(1);
};

}  // namespace zornet
