// The tulk executable: wires the layers together and hands over to the
// console runtime.

#include <curses.h>
#include <syslog.h>

#include "host/HostStartup.h"
#include "include/ColorNumbers.h"
#include "include/ProcessFlags.h"
#include "platform/api/HostMgrException.h"
#include "runtime/Console.h"
#include "runtime/KeyInput.h"
#include "runtime/Palette.h"
#include "runtime/RuntimeFrame.h"
#include "runtime/SystemLog.h"

namespace {

// The full-screen frame shown until the welcome screen lands.
class PlainWelcomeFrame : public Tulk::RuntimeFrame {
 public:
  PlainWelcomeFrame() : window_(newwin(LINES, COLS, 0, 0)) {}
  ~PlainWelcomeFrame() override { delwin(window_); }
  PlainWelcomeFrame(const PlainWelcomeFrame&) = delete;
  PlainWelcomeFrame& operator=(const PlainWelcomeFrame&) = delete;

  void Redraw(bool active) override {
    Tulk::SetWindowBackground(window_, active ? Tulk::ColorAttr(Tulk::kBlack, Tulk::kWhite)
                                              : Tulk::ColorAttr(Tulk::kBlack, Tulk::kDarkGrey));
    werase(window_);
    box(window_, 0, 0);
    mvwaddstr(window_, 1, 2, "TULK");
    touchwin(window_);
    wrefresh(window_);
    flushinp();
  }

  void Run() {
    Tulk::currentWindow = this;
    Redraw(true);
    for (;;) {
      Tulk::WaitForKey(this, false);
      clearok(curscr, TRUE);
      Redraw(true);
    }
  }

 private:
  WINDOW* window_;
};

}  // namespace

int main(int argc, char** argv) {
  Tulk::ConsoleHooks hooks;
  hooks.preferenceInit = Tulk::InitPreferences;
  hooks.readIdleTimeout = Tulk::ReadTulkTimeout;
  hooks.initProductLogging = Tulk::InitProductLogging;
  hooks.afterStartup = Tulk::StartHostServices;
  hooks.runWelcome = [] {
    try {
      PlainWelcomeFrame welcome;
      welcome.Run();
    } catch (const HostMgr::Lib::HostMgrException& error) {
      Tulk::Log(LOG_ERR, "TULK aborted by exception: %s", error.what());
    }
  };
  return Tulk::ConsoleMain(argc, argv, hooks);
}
