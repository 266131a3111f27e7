#include "runtime/SignalThread.h"

#include <fcntl.h>
#include <pthread.h>
#include <signal.h>
#include <unistd.h>

#include <atomic>
#include <cerrno>
#include <cstdlib>
#include <initializer_list>

#include "runtime/SystemLog.h"

namespace Tulk {
namespace {

constexpr unsigned char kReloadCode = 1;

int g_pipe[2] = {-1, -1};
sigset_t g_signals;
// A reload code is in the pipe and not read yet.
std::atomic<bool> g_reloadQueued{false};

bool IgnoredAtStart(int signal) {
  struct sigaction current {};
  return sigaction(signal, nullptr, &current) == 0 && current.sa_handler == SIG_IGN;
}

void* SignalThreadBody(void*) {
  for (;;) {
    int signal = 0;
    int rc = sigwait(&g_signals, &signal);
    if (rc != 0) {
      errno = rc;
      LogErrno("sigwait() failed");
      continue;
    }
    ForwardSignal(signal);
  }
  return nullptr;
}

}  // namespace

unsigned char SignalCode(int signal) {
  switch (signal) {
    case SIGUSR1:
      return 1;
    case SIGUSR2:
      return 2;
    case SIGWINCH:
      return 3;
    case SIGINT:
    case SIGQUIT:
    case SIGTERM:
    case SIGHUP:
    case SIGPIPE:
      return 4;
    default:
      return 0;
  }
}

void ForwardSignal(int signal) {
  const unsigned char code = SignalCode(signal);
  if (code == 0 || g_pipe[1] < 0) {
    return;
  }
  if (code == kReloadCode && g_reloadQueued.exchange(true)) {
    return;
  }
  ssize_t written;
  do {
    written = write(g_pipe[1], &code, 1);
  } while (written <= 0 && errno == EINTR);
  if (written != 1 && code == kReloadCode) {
    g_reloadQueued = false;
  }
}

int ReadSignalCode() {
  unsigned char code = 0;
  ssize_t got;
  do {
    got = read(g_pipe[0], &code, 1);
  } while (got < 0 && errno == EINTR);
  if (got != 1) {
    return 0;
  }
  if (code == kReloadCode) {
    g_reloadQueued = false;
  }
  return code;
}

bool TakeBrokenPipe() {
  sigset_t pipeSignal;
  sigemptyset(&pipeSignal);
  sigaddset(&pipeSignal, SIGPIPE);
  sigset_t pending;
  if (sigpending(&pending) != 0 || sigismember(&pending, SIGPIPE) != 1) {
    return false;
  }
  timespec zero{};
  return sigtimedwait(&pipeSignal, nullptr, &zero) == SIGPIPE;
}

int SignalPipeReadFd() {
  return g_pipe[0];
}

void StartSignalThread() {
  if (pipe2(g_pipe, O_CLOEXEC) != 0) {
    LogErrno("pipe() failed");
    std::exit(1);
  }
  sigemptyset(&g_signals);
  for (int signal : {SIGINT, SIGQUIT, SIGTERM, SIGUSR1, SIGUSR2, SIGWINCH, SIGTSTP}) {
    sigaddset(&g_signals, signal);
  }
  for (int signal : {SIGHUP, SIGPIPE}) {
    if (!IgnoredAtStart(signal)) {
      sigaddset(&g_signals, signal);
    }
  }
  int rc = pthread_sigmask(SIG_BLOCK, &g_signals, nullptr);
  if (rc != 0) {
    errno = rc;
    LogErrno("pthread_sigmask() failed");
  }
  pthread_t thread;
  rc = pthread_create(&thread, nullptr, SignalThreadBody, nullptr);
  if (rc != 0) {
    errno = rc;
    LogErrno("pthread_create() failed");
    std::exit(1);
  }
}

}  // namespace Tulk
