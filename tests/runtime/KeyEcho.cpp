// Test-only program: the real console start-up and key loop, with a frame
// that shows every key it receives, the reloads, the deferred-exit flag and
// idle timeouts. The runtime tests drive it in a pseudo-terminal.
//
// Environment:
//   TULK_KEYECHO_IDLE_TIMEOUT  value the idle-timeout reader returns
//                              (unset: the option cannot be read)
//   TULK_KEYECHO_SESSION=1     wait as a logged-in session (idle timeout on)
// Keys: "q" ends the run normally (teardown with the palette reset).

#include <curses.h>

#include <cstdlib>
#include <optional>
#include <string>

#include "include/ColorNumbers.h"
#include "include/ProcessFlags.h"
#include "runtime/Clock.h"
#include "runtime/Console.h"
#include "runtime/KeyInput.h"
#include "runtime/Palette.h"
#include "runtime/RuntimeFrame.h"

namespace {

class KeyEchoFrame : public Tulk::RuntimeFrame {
 public:
  KeyEchoFrame() : window_(newwin(LINES, COLS, 0, 0)) {}
  ~KeyEchoFrame() override { delwin(window_); }
  KeyEchoFrame(const KeyEchoFrame&) = delete;
  KeyEchoFrame& operator=(const KeyEchoFrame&) = delete;

  void Redraw(bool active) override {
    Tulk::SetWindowBackground(
        window_, Tulk::ColorAttr(Tulk::kBlack, active ? Tulk::kWhite : Tulk::kDarkGrey));
    werase(window_);
    box(window_, 0, 0);
    mvwprintw(window_, 1, 2, "KEYECHO %s", active ? "active" : "dimmed");
    mvwprintw(window_, 3, 2, "last key: %s (%d)", lastName_.c_str(), lastKey_);
    mvwprintw(window_, 4, 2, "keys: %d", keys_);
    mvwprintw(window_, 5, 2, "reloads: %d", reloads_);
    mvwprintw(window_, 6, 2, "exitPending: %d", Tulk::exitPending ? 1 : 0);
    mvwprintw(window_, 7, 2, "idle timeout: %u", Tulk::IdleTimeoutSeconds());
    if (timeoutAfter_) {
      mvwprintw(window_, 8, 2, "timeout after: %ld s", *timeoutAfter_);
    }
    wrefresh(window_);
  }

  void ReloadHostInfo() override {
    ++reloads_;
    Redraw(true);
  }

  void Run() {
    Tulk::currentWindow = this;
    bool session = std::getenv("TULK_KEYECHO_SESSION") != nullptr;
    if (session) {
      Tulk::SetLoggedIn(true);
    }
    Redraw(true);
    for (;;) {
      timeval start = Tulk::Clock::Now();
      int key;
      try {
        key = Tulk::WaitForKey(this, session);
      } catch (const Tulk::TulkTimeout&) {
        timeoutAfter_ = Tulk::Clock::Now().tv_sec - start.tv_sec;
        session = false;
        Tulk::SetLoggedIn(false);
        Tulk::currentWindow = this;
        Redraw(true);
        continue;
      }
      if (key == 'q') {
        return;
      }
      lastKey_ = key;
      const char* name = keyname(key);
      lastName_ = name != nullptr ? name : "?";
      ++keys_;
      Redraw(true);
    }
  }

 private:
  WINDOW* window_;
  int lastKey_ = -1;
  std::string lastName_ = "none";
  int keys_ = 0;
  int reloads_ = 0;
  std::optional<long> timeoutAfter_;
};

std::optional<std::uint32_t> ReadIdleTimeout() {
  const char* value = std::getenv("TULK_KEYECHO_IDLE_TIMEOUT");
  if (value == nullptr) {
    return std::nullopt;
  }
  return static_cast<std::uint32_t>(std::strtoul(value, nullptr, 10));
}

}  // namespace

int main(int argc, char** argv) {
  Tulk::ConsoleHooks hooks;
  hooks.readIdleTimeout = ReadIdleTimeout;
  hooks.runWelcome = [] {
    KeyEchoFrame frame;
    frame.Run();
  };
  return Tulk::ConsoleMain(argc, argv, hooks);
}
