#include "cli/stop_signals.h"

#include <signal.h>

#include <array>

namespace gridbay::cli {
namespace {

constexpr std::array kSignals{SIGINT, SIGTERM, SIGHUP};

// A handler reaches nothing else.
volatile sig_atomic_t isToStop = 0;

void takeDown(int) {
  isToStop = 1;
}

void handle(void (*handler)(int)) {
  struct sigaction action {};
  action.sa_handler = handler;
  action.sa_flags = static_cast<int>(SA_RESETHAND);
  for (const int number : kSignals) {
    struct sigaction now {};
    ::sigaction(number, nullptr, &now);
    if (now.sa_handler != SIG_IGN) ::sigaction(number, &action, nullptr);
  }
}

}  // namespace

StopSignals::StopSignals() {
  isToStop = 0;
  handle(takeDown);
}

StopSignals::~StopSignals() {
  handle(SIG_DFL);
}

bool StopSignals::isStopped() const {
  return isToStop != 0;
}

}  // namespace gridbay::cli
