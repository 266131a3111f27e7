#include "runtime/KeyInput.h"

#include <curses.h>
#include <poll.h>
#include <sys/ioctl.h>
#include <syslog.h>
#include <unistd.h>

#include <cerrno>
#include <cstdlib>

#include "include/Constants.h"
#include "include/ProcessFlags.h"
#include "runtime/Clock.h"
#include "runtime/RuntimeFrame.h"
#include "runtime/ScreenFlush.h"
#include "runtime/SignalThread.h"
#include "runtime/SystemLog.h"

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

int PollInput(const timeval* limit) {
  FlushScreen();
  if (g_cursesMayHoldInput) {
    int key = ReadKeyNow();
    if (key != ERR) {
      return key;
    }
  }
  pollfd fds[2] = {{0, POLLIN, 0}, {SignalPipeReadFd(), POLLIN, 0}};
  int millis = limit == nullptr ? -1 : Clock::RealMilliseconds(limit->tv_sec, limit->tv_usec);
  int ready = poll(fds, 2, millis);
  if (ready < 0) {
    LogErrno("poll() failed");
    return kPollOther;
  }
  if (ready == 0) {
    return kPollTimeLimit;
  }
  if ((fds[0].revents & (POLLIN | POLLHUP | POLLERR)) != 0) {
    return ReadKeyNow();
  }
  if ((fds[1].revents & POLLIN) != 0) {
    unsigned char code = 0;
    ssize_t got;
    do {
      got = read(fds[1].fd, &code, 1);
    } while (got < 0 && errno == EINTR);
    if (got == 1 && code >= 1 && code <= 4) {
      return -2 - code;
    }
  }
  return kPollOther;
}

int WaitForKey(RuntimeFrame* frame, bool idleTimeout) {
  const bool timeoutActive = idleTimeout && g_idleTimeoutSeconds != 0;
  const timeval start = Clock::Now();
  timeval dimPoint = start;
  dimPoint.tv_sec += kDimSeconds;
  timeval deadline = start;
  deadline.tv_sec +=
      g_idleTimeoutSeconds > kDimSeconds ? static_cast<long>(g_idleTimeoutSeconds) : kDimSeconds;
  bool dimmed = false;

  for (;;) {
    const timeval now = Clock::Now();
    if (timeoutActive && IsLater(now, deadline)) {
      currentWindow = nullptr;
      throw TulkTimeout{};
    }
    int result;
    if (!dimmed && !IsLater(now, dimPoint)) {
      timeval left = Until(now, dimPoint);
      result = PollInput(&left);
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
        result = PollInput(&left);
      } else {
        result = PollInput(nullptr);
      }
    }

    switch (result) {
      case kPollTimeLimit:
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

void HandleResize() {
  winsize size{};
  if (ioctl(0, TIOCGWINSZ, &size) != 0 || size.ws_row == 0 || size.ws_col == 0) {
    return;
  }
  resizeterm(size.ws_row, size.ws_col);
  Log(LOG_INFO, "Resized window to %dx%d", size.ws_col, size.ws_row);
  refresh();
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
