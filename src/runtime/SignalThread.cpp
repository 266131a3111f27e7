#include "runtime/SignalThread.h"

#include <fcntl.h>
#include <pthread.h>
#include <signal.h>
#include <unistd.h>

#include <cerrno>
#include <cstdlib>
#include <initializer_list>

#include "runtime/SystemLog.h"

namespace Tulk {
namespace {

int g_pipe[2] = {-1, -1};
sigset_t g_signals;

void* SignalThreadBody(void*) {
  for (;;) {
    int signal = 0;
    int rc = sigwait(&g_signals, &signal);
    if (rc != 0) {
      errno = rc;
      LogErrno("sigwait() failed");
      continue;
    }
    unsigned char code = SignalCode(signal);
    if (code == 0) {
      continue;
    }
    ssize_t written;
    do {
      written = write(g_pipe[1], &code, 1);
    } while (written <= 0 && errno == EINTR);
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
      return 4;
    default:
      return 0;
  }
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
  for (int signal : {SIGINT, SIGQUIT, SIGTERM, SIGUSR1, SIGUSR2, SIGWINCH}) {
    sigaddset(&g_signals, signal);
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
