// Whether to end early, at the deadline or when told to. It is asked at each step, and within steps that may take long.
#pragma once

#include <atomic>
#include <chrono>

#include "network/ZORNetwork.h"

namespace zornet {

class Stop {
 public:
  explicit Stop(const Limits& limits)
      : mStop(limits.stop), mDeadline(limits.deadline), mHasDeadline(mDeadline != Clock::time_point::max()) {}

  bool IsAsked() {
    if (mStop == nullptr && !mHasDeadline) return false;
    const bool isLate = mOutcome == Outcome::TimeLimit || (mHasDeadline && mCalls++ % kCallsPerLook == 0 && IsLate());
    const bool isTold = mStop != nullptr && mStop->load(std::memory_order_relaxed);
    mOutcome = isTold ? Outcome::Stopped : isLate ? Outcome::TimeLimit : Outcome::Settled;
    return WasAsked();
  }

  bool WasAsked() const { return mOutcome != Outcome::Settled; }
  Outcome Why() const { return mOutcome; }  // Settled: not to be ended

 private:
  using Clock = std::chrono::steady_clock;
  static constexpr unsigned kCallsPerLook = 64;  // looking at a clock takes longer than some steps

  bool IsLate() const { return Clock::now() >= mDeadline; }

  const std::atomic<bool>* mStop;
  Clock::time_point mDeadline;
  bool mHasDeadline;
  unsigned mCalls = 0;
  Outcome mOutcome = Outcome::Settled;
};

}  // namespace zornet
