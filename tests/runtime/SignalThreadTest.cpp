// The codes the signal thread puts in the pipe: which signals end the
// console, and how a burst of reload requests is merged.

#include "runtime/SignalThread.h"

#include <gtest/gtest.h>
#include <poll.h>
#include <signal.h>

#include <vector>

namespace {

// The signal thread is started once per process (it blocks the signals in
// this thread too); the tests write through ForwardSignal() as it does.
void StartOnce() {
  static const bool started = [] {
    Tulk::StartSignalThread();
    return true;
  }();
  (void)started;
}

// Every code waiting in the pipe, in order.
std::vector<int> DrainCodes() {
  std::vector<int> codes;
  pollfd fd{Tulk::SignalPipeReadFd(), POLLIN, 0};
  while (poll(&fd, 1, 0) > 0) {
    codes.push_back(Tulk::ReadSignalCode());
  }
  return codes;
}

TEST(SignalThread, EveryEndingSignalSharesTheTerminateCode) {
  for (int signal : {SIGINT, SIGQUIT, SIGTERM, SIGHUP, SIGPIPE}) {
    EXPECT_EQ(Tulk::SignalCode(signal), 4) << signal;
  }
  EXPECT_EQ(Tulk::SignalCode(SIGTSTP), 0);
  EXPECT_EQ(Tulk::SignalCode(SIGCHLD), 0);
}

TEST(SignalThread, ReloadBurstsAreMergedButNothingElseIs) {
  StartOnce();
  DrainCodes();
  struct Case {
    const char* name;
    std::vector<int> signals;
    std::vector<int> codes;
  };
  const Case cases[] = {
      {"a burst of reloads", std::vector<int>(200, SIGUSR1), {1}},
      {"reloads around a terminate", {SIGUSR1, SIGTERM, SIGUSR1, SIGUSR1}, {1, 4}},
      {"terminates and exits are all kept", {SIGTERM, SIGUSR2, SIGTERM, SIGWINCH}, {4, 2, 4, 3}},
      {"a signal that is not forwarded", {SIGTSTP, SIGCHLD}, {}},
  };
  for (const Case& c : cases) {
    for (int signal : c.signals) {
      Tulk::ForwardSignal(signal);
    }
    EXPECT_EQ(DrainCodes(), c.codes) << c.name;
  }
}

TEST(SignalThread, ReadingTheReloadLetsTheNextOneThrough) {
  StartOnce();
  DrainCodes();
  Tulk::ForwardSignal(SIGUSR1);
  EXPECT_EQ(Tulk::ReadSignalCode(), 1);
  // Requests that arrive while the reload runs make one more.
  for (int i = 0; i < 50; ++i) {
    Tulk::ForwardSignal(SIGUSR1);
  }
  EXPECT_EQ(DrainCodes(), std::vector<int>{1});
}

}  // namespace
