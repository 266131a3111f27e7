#include "runtime/KeyInput.h"

#include <curses.h>
#include <poll.h>
#include <sys/ioctl.h>
#include <syslog.h>
#include <unistd.h>

#include <cerrno>
#include <cstdlib>
#include <ctime>

#include "include/Constants.h"
#include "include/ProcessFlags.h"
#include "runtime/Clock.h"
#include "runtime/ReadySignal.h"
#include "runtime/RuntimeFrame.h"
#include "runtime/ScreenFlush.h"
#include "runtime/SignalThread.h"
#include "runtime/SystemLog.h"
#include "runtime/TerminalOutput.h"
#include "runtime/WorkerResult.h"

namespace Tulk {
namespace {

std::uint32_t g_idleTimeoutSeconds = kDefaultTulkTimeOutSeconds;
std::function<std::optional<std::uint32_t>()> g_idleTimeoutReader;
std::function<void()> g_smartCardCheck;
// While assembling an escape sequence curses may read bytes beyond the key
// it returns; they wait in its own queue, where poll() cannot see them.
bool g_cursesMayHoldInput = false;

int ReadKeyNow() {
  nodelay(stdscr, TRUE);
  int key = wgetch(stdscr);
  nodelay(stdscr, FALSE);
  g_cursesMayHoldInput = key != ERR;
  return key;
}

// Standard input reported readable but gave no key: it has reached its end
// (a hung-up terminal reads 0 bytes or fails with EIO) unless bytes are
// still waiting. A descriptor that cannot be asked (/dev/null) counts as
// ended.
bool InputAtEnd() {
  int waiting = 0;
  return ioctl(0, FIONREAD, &waiting) != 0 || waiting <= 0;
}

// A poll() that keeps failing must not turn the key loop into a busy loop.
void PauseAfterPollFailure() {
  timespec pause{0, 100L * 1000 * 1000};
  nanosleep(&pause, nullptr);
}

bool IsLater(const timeval& a, const timeval& b) {
  return a.tv_sec > b.tv_sec || (a.tv_sec == b.tv_sec && a.tv_usec > b.tv_usec);
}

// The span from `now` to `until` in whole seconds and microseconds,
// borrowing a second when the microseconds would be negative.
timeval Until(const timeval& now, const timeval& until) {
  timeval left{};
  left.tv_sec = until.tv_sec - now.tv_sec;
  left.tv_usec = until.tv_usec - now.tv_usec;
  if (left.tv_usec < 0) {
    left.tv_sec -= 1;
    left.tv_usec += 1000000;
  }
  return left;
}

}  // namespace

int PollInput(const timeval* limit, int wakeFd) {
  FlushScreen();
  if (g_cursesMayHoldInput) {
    int key = ReadKeyNow();
    if (key != ERR) {
      return key;
    }
  }
  pollfd fds[3] = {{0, POLLIN, 0}, {SignalPipeReadFd(), POLLIN, 0}, {wakeFd, POLLIN, 0}};
  const nfds_t count = wakeFd >= 0 ? 3 : 2;
  int millis = limit == nullptr ? -1 : Clock::RealMilliseconds(limit->tv_sec, limit->tv_usec);
  int ready = millis != 0 ? AnnounceReady(fds, count) : 0;
  if (ready == 0) {
    ready = poll(fds, count, millis);
  }
  if (ready < 0) {
    LogErrno("poll() failed");
    if (errno != EINTR) {
      PauseAfterPollFailure();
    }
    return kPollOther;
  }
  if (ready == 0) {
    return kPollTimeLimit;
  }
  if ((fds[0].revents & (POLLHUP | POLLERR | POLLNVAL)) != 0) {
    return kPollHangUp;
  }
  if ((fds[0].revents & POLLIN) != 0) {
    const int key = ReadKeyNow();
    return key == ERR && InputAtEnd() ? kPollHangUp : key;
  }
  if ((fds[1].revents & POLLIN) != 0) {
    const int code = ReadSignalCode();
    return code >= 1 && code <= 4 ? -2 - code : kPollOther;
  }
  if (count == 3 && (fds[2].revents & (POLLIN | POLLHUP | POLLERR)) != 0) {
    return kPollWoken;
  }
  return kPollOther;
}

namespace {

// A worker's result is not a key: the wait that it ended is resumed by the
// frame's next wait, with the same start (dimming point, idle deadline) and
// dimmed state.
struct ResumedWait {
  RuntimeFrame* frame = nullptr;
  timeval start{};
  bool dimmed = false;
};
std::optional<ResumedWait> g_resumedWait;

int WaitFor(RuntimeFrame* frame, bool idleTimeout, const WorkerResult* workerResult) {
  const bool timeoutActive = idleTimeout && g_idleTimeoutSeconds != 0;
  timeval start = Clock::Now();
  bool dimmed = false;
  if (g_resumedWait && g_resumedWait->frame == frame) {
    start = g_resumedWait->start;
    dimmed = g_resumedWait->dimmed;
  }
  g_resumedWait.reset();
  timeval dimPoint = start;
  dimPoint.tv_sec += kDimSeconds;
  timeval deadline = start;
  deadline.tv_sec +=
      g_idleTimeoutSeconds > kDimSeconds ? static_cast<long>(g_idleTimeoutSeconds) : kDimSeconds;
  const int wakeFd = workerResult != nullptr ? workerResult->WakeFd() : -1;

  for (;;) {
    if (TakeBrokenPipe()) {
      std::exit(0);
    }
    const timeval now = Clock::Now();
    if (timeoutActive && IsLater(now, deadline)) {
      currentWindow = nullptr;
      throw TulkTimeout{};
    }
    if (workerResult != nullptr && workerResult->Ready()) {
      g_resumedWait = ResumedWait{frame, start, dimmed};
      return kKeyResultReady;
    }
    int result;
    if (!dimmed && !IsLater(now, dimPoint)) {
      timeval left = Until(now, dimPoint);
      result = PollInput(&left, wakeFd);
    } else {
      if (!dimmed) {
        if (frame != nullptr) {
          frame->Redraw(false);
        }
        dimmed = true;
      }
      if (timeoutActive) {
        timeval left = Until(Clock::Now(), deadline);
        if (left.tv_sec < 0) {
          left = timeval{0, 0};
        }
        result = PollInput(&left, wakeFd);
      } else {
        result = PollInput(nullptr, wakeFd);
      }
    }

    switch (result) {
      case kPollTimeLimit:
      case kPollWoken:
        continue;
      case kPollReload:
        if (currentWindow != nullptr) {
          currentWindow->ReloadHostInfo();
        }
        if (g_smartCardCheck) {
          g_smartCardCheck();
        }
        continue;
      case kPollExitAfter:
        if (loggedIn) {
          exitPending = true;
          continue;
        }
        std::exit(0);
      case kPollResize:
        HandleResize();
        std::exit(0);
      case kPollTerminate:
        std::exit(0);
      case kPollHangUp:
        Log(LOG_INFO, "Terminal hung up");
        std::exit(0);
      default:
        break;
    }
    if (result == KEY_RESIZE) {
      HandleResize();
      std::exit(0);
    }
    if (result < 0) {
      continue;
    }
    if (dimmed && frame != nullptr) {
      clearok(curscr, TRUE);
      frame->Redraw(true);
    }
    return result;
  }
}

}  // namespace

int WaitForKey(RuntimeFrame* frame, bool idleTimeout) {
  return WaitFor(frame, idleTimeout, nullptr);
}

int WaitForKeyOrResult(RuntimeFrame* frame, bool idleTimeout, const WorkerResult& result) {
  return WaitFor(frame, idleTimeout, &result);
}

void HandleResize() {
  winsize size{};
  if (ioctl(0, TIOCGWINSZ, &size) != 0 || size.ws_row == 0 || size.ws_col == 0) {
    return;
  }
  resizeterm(size.ws_row, size.ws_col);
  Log(LOG_INFO, "Resized window to %dx%d", size.ws_col, size.ws_row);
  RefreshTerminal();
}

void SetLoggedIn(bool value) {
  loggedIn = value;
  if (value) {
    ReloadIdleTimeout();
  }
}

void ReloadIdleTimeout() {
  std::optional<std::uint32_t> value;
  if (g_idleTimeoutReader) {
    value = g_idleTimeoutReader();
  }
  g_idleTimeoutSeconds = value.value_or(kDefaultTulkTimeOutSeconds);
}

std::uint32_t IdleTimeoutSeconds() {
  return g_idleTimeoutSeconds;
}

void SetIdleTimeoutReader(std::function<std::optional<std::uint32_t>()> reader) {
  g_idleTimeoutReader = std::move(reader);
}

void SetSmartCardCheck(std::function<void()> check) {
  g_smartCardCheck = std::move(check);
}

}  // namespace Tulk
