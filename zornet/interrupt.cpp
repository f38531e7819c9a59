#include "zornet/interrupt.h"

#include <poll.h>
#include <unistd.h>

#include <csignal>

namespace zornet {

namespace {

constexpr int kSignals[] = {SIGINT, SIGTERM};

// All that the handler touches.
std::atomic<bool> raised{false};
volatile std::sig_atomic_t received = 0;
volatile std::sig_atomic_t caught[std::size(kSignals)] = {};
static_assert(std::atomic<bool>::is_always_lock_free);

void Release() {
  for (std::size_t i = 0; i < std::size(kSignals); ++i) {
    if (caught[i] != 0) std::signal(kSignals[i], SIG_DFL);
  }
}

extern "C" void Catch(int signal) {
  received = signal;
  raised = true;
  Release();
}

}  // namespace

Interrupts::Interrupts() {
  for (std::size_t i = 0; i < std::size(kSignals); ++i) {
    struct sigaction before {
    }, action{};
    sigaction(kSignals[i], nullptr, &before);
    if (before.sa_handler == SIG_IGN) continue;
    caught[i] = 1;
    action.sa_handler = Catch;
    action.sa_flags = SA_RESTART;
    for (const int each : kSignals) sigaddset(&action.sa_mask, each);
    sigaction(kSignals[i], &action, nullptr);
  }
}

Interrupts::~Interrupts() { Release(); }

const std::atomic<bool>& Interrupts::Flag() { return raised; }
void Interrupts::Raise() { raised = true; }
int Interrupts::Signal() { return received; }

bool IsReaderGone() {
  pollfd output{STDOUT_FILENO, 0, 0};
  return poll(&output, 1, 0) == 1 && (output.revents & POLLERR) != 0;
}

}  // namespace zornet
