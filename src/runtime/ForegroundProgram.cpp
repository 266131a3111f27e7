#include "runtime/ForegroundProgram.h"

#include <curses.h>
#include <poll.h>
#include <signal.h>
#include <sys/ioctl.h>
#include <sys/stat.h>
#include <sys/syscall.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <cstdlib>
#include <initializer_list>

#include "runtime/ChildProcess.h"
#include "runtime/Clock.h"
#include "runtime/KeyInput.h"
#include "runtime/SignalThread.h"

namespace Tulk {
namespace {

constexpr int kTerminal = STDIN_FILENO;
constexpr int kTickMilliseconds = 1000;
constexpr int kGraceMilliseconds = 1000;
constexpr int kTerminateCode = 4;
constexpr int kReloadCode = 1;
constexpr int kExitAfterCode = 2;
constexpr int kResizeCode = 3;

// A background process group may only take the terminal with SIGTTOU
// blocked; otherwise the call stops the whole console.
void GiveTerminalTo(pid_t group) {
  if (!isatty(kTerminal)) {
    return;
  }
  sigset_t ttou;
  sigset_t saved;
  sigemptyset(&ttou);
  sigaddset(&ttou, SIGTTOU);
  pthread_sigmask(SIG_BLOCK, &ttou, &saved);
  tcsetpgrp(kTerminal, group);
  pthread_sigmask(SIG_SETMASK, &saved, nullptr);
}

// Only async-signal-safe calls between fork and exec: the console has
// other threads.
[[noreturn]] void ExecInForeground(const char* program, char* const* argv, char* const* envp) {
  setpgid(0, 0);
  sigset_t ttou;
  sigemptyset(&ttou);
  sigaddset(&ttou, SIGTTOU);
  sigprocmask(SIG_BLOCK, &ttou, nullptr);
  if (isatty(kTerminal)) {
    tcsetpgrp(kTerminal, getpid());
  }
  struct sigaction defaults {};
  defaults.sa_handler = SIG_DFL;
  for (int signal : {SIGHUP, SIGINT, SIGQUIT, SIGPIPE, SIGTERM, SIGCHLD, SIGTSTP, SIGTTIN, SIGTTOU,
                     SIGUSR1, SIGUSR2, SIGWINCH}) {
    sigaction(signal, &defaults, nullptr);
  }
  sigset_t none;
  sigemptyset(&none);
  sigprocmask(SIG_SETMASK, &none, nullptr);
  close_range(3, ~0U, 0);
  execve(program, argv, envp);
  _exit(127);
}

timespec TerminalAccessTime() {
  struct stat status {};
  if (fstat(kTerminal, &status) != 0) {
    return timespec{};
  }
  return status.st_atim;
}

bool SameTime(const timespec& a, const timespec& b) {
  return a.tv_sec == b.tv_sec && a.tv_nsec == b.tv_nsec;
}

bool IsLater(const timeval& a, const timeval& b) {
  return a.tv_sec > b.tv_sec || (a.tv_sec == b.tv_sec && a.tv_usec > b.tv_usec);
}

int RealMillisecondsUntil(const timeval& now, const timeval& until) {
  long seconds = until.tv_sec - now.tv_sec;
  long microseconds = until.tv_usec - now.tv_usec;
  if (microseconds < 0) {
    seconds -= 1;
    microseconds += 1000000;
  }
  return seconds < 0 ? 0 : Clock::RealMilliseconds(seconds, microseconds);
}

class ForegroundWait {
 public:
  ForegroundWait(pid_t pid, bool idleTimeout)
      : pid_(pid),
        pidfd_(static_cast<int>(syscall(SYS_pidfd_open, pid, 0))),
        timeoutActive_(idleTimeout && IdleTimeoutSeconds() != 0) {
    const long seconds = std::max<long>(IdleTimeoutSeconds(), kDimSeconds);
    span_ = timeval{seconds, 0};
    MoveDeadline();
    lastInput_ = TerminalAccessTime();
  }
  ~ForegroundWait() {
    if (pidfd_ >= 0) {
      close(pidfd_);
    }
  }
  ForegroundWait(const ForegroundWait&) = delete;
  ForegroundWait& operator=(const ForegroundWait&) = delete;

  ForegroundEnd Run() {
    for (;;) {
      if (Ended(WNOHANG)) {
        return ForegroundEnd::kEnded;
      }
      const timeval now = Clock::Now();
      int waitMs = kTickMilliseconds;
      if (timeoutActive_) {
        if (const timespec input = TerminalAccessTime(); !SameTime(input, lastInput_)) {
          lastInput_ = input;
          MoveDeadline();
        }
        if (IsLater(now, deadline_)) {
          EndProgram();
          return ForegroundEnd::kIdleTimeout;
        }
        waitMs = std::min(waitMs, RealMillisecondsUntil(now, deadline_) + 1);
      }
      pollfd fds[2] = {{SignalPipeReadFd(), POLLIN, 0}, {pidfd_, POLLIN, 0}};
      if (poll(fds, pidfd_ >= 0 ? 2 : 1, waitMs) > 0 && (fds[0].revents & POLLIN) != 0) {
        TakeSignal();
      }
    }
  }

  /// Hands the signals that wait for the key loop back to the pipe.
  void HandBackSignals() const {
    if (reload_) {
      ForwardSignal(SIGUSR1);
    }
    if (exitAfter_) {
      ForwardSignal(SIGUSR2);
    }
    if (resized_) {
      ForwardSignal(SIGWINCH);
    }
  }

 private:
  void MoveDeadline() {
    deadline_ = Clock::Now();
    deadline_.tv_sec += span_.tv_sec;
  }

  // Reaps the program once it has exited; continues it when it stopped.
  bool Ended(int options) {
    for (;;) {
      int status = 0;
      const pid_t done = waitpid(pid_, &status, options | WUNTRACED);
      if (done < 0 && errno == EINTR) {
        continue;
      }
      if (done == pid_ && WIFSTOPPED(status)) {
        GiveTerminalTo(pid_);
        kill(-pid_, SIGCONT);
        if (options == 0) {
          continue;
        }
        return false;
      }
      return done != 0;
    }
  }

  void EndProgram() {
    kill(-pid_, SIGTERM);
    kill(-pid_, SIGCONT);
    pollfd exited{pidfd_, POLLIN, 0};
    if (pidfd_ < 0 || poll(&exited, 1, kGraceMilliseconds) <= 0) {
      kill(-pid_, SIGKILL);
    }
    Ended(0);
  }

  void TakeSignal() {
    switch (ReadSignalCode()) {
      case kTerminateCode:
        EndProgram();
        GiveTerminalTo(getpgrp());
        std::exit(0);
      case kReloadCode:
        reload_ = true;
        break;
      case kExitAfterCode:
        exitAfter_ = true;
        break;
      case kResizeCode:  // acted on, as in the key loop, once the program has ended
        resized_ = true;
        break;
      default:
        break;
    }
  }

  pid_t pid_;
  int pidfd_;
  bool timeoutActive_;
  timeval span_{};
  timeval deadline_{};
  timespec lastInput_{};
  bool reload_ = false;
  bool exitAfter_ = false;
  bool resized_ = false;
};

}  // namespace

ForegroundEnd RunInForeground(const std::string& program, const std::vector<std::string>& arguments,
                              const std::vector<std::string>& environment, bool idleTimeout) {
  std::vector<std::string> argumentCopy = arguments;
  std::vector<std::string> environmentCopy = environment;
  std::vector<char*> argv = ExecVector(argumentCopy);
  std::vector<char*> envp = ExecVector(environmentCopy);

  const pid_t pid = fork();
  if (pid == 0) {
    ExecInForeground(program.c_str(), argv.data(), envp.data());
  }
  if (pid < 0) {
    return ForegroundEnd::kEnded;
  }
  setpgid(pid, pid);
  GiveTerminalTo(pid);
  ForegroundWait waiter(pid, idleTimeout);
  const ForegroundEnd end = waiter.Run();
  GiveTerminalTo(getpgrp());
  waiter.HandBackSignals();
  return end;
}

void ExitIfResizedMeanwhile() {
  winsize size{};
  if (ioctl(kTerminal, TIOCGWINSZ, &size) != 0 || size.ws_row == 0 || size.ws_col == 0) {
    return;
  }
  if (size.ws_row != LINES || size.ws_col != COLS) {
    HandleResize();
    std::exit(0);
  }
}

}  // namespace Tulk
