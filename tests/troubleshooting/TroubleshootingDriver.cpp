// Test-only program: the real console start-up and host services with a
// home frame that opens one troubleshooting screen directly, as a
// logged-in session would. The troubleshooting screen tests drive it in a
// pseudo-terminal.
//
//   TULK_TROUBLESHOOTING_SCENE   window (default), shell-timeouts,
//                                tulk-timeout, agents
//   TULK_TROUBLESHOOTING_USER    the logged-in user (default "root")
//
// The home frame shows "result: N" after the scene (-1: the idle timeout
// ended it); "o" opens it again.

#include <curses.h>

#include <cstdlib>
#include <string>

#include "host/HostStartup.h"
#include "include/ColorNumbers.h"
#include "include/ProcessFlags.h"
#include "runtime/Console.h"
#include "runtime/KeyInput.h"
#include "toolkit/RunFrame.h"
#include "troubleshooting/RestartAgentsDialog.h"
#include "troubleshooting/ShellTimeoutDialog.h"
#include "troubleshooting/TroubleShootingWindow.h"
#include "troubleshooting/TulkTimeoutDialog.h"

namespace {

using namespace Tulk;

std::string Env(const char* name, const char* fallback) {
  const char* value = std::getenv(name);
  return value != nullptr ? value : fallback;
}

template <typename Scene>
int RunScene(Frame* owner) {
  Scene scene(owner);
  return RunFrame(&scene);
}

class DriverHome : public Frame {
 public:
  DriverHome() : Frame(nullptr, 0, 0, COLS, LINES, kBlack, kWhite) {
    Box();
    PutText(2, 1, "TROUBLESHOOTING DRIVER");
  }

  int Run() override {
    Open();
    for (;;) {
      if (WaitForKey(this, false) == 'o') {
        Open();
      }
    }
  }

 private:
  void Open() {
    const std::string scene = Env("TULK_TROUBLESHOOTING_SCENE", "window");
    SetLoggedIn(true);
    int result = 0;
    try {
      if (scene == "shell-timeouts") {
        result = RunScene<ShellTimeoutDialog>(this);
      } else if (scene == "tulk-timeout") {
        result = RunScene<TulkTimeoutDialog>(this);
      } else if (scene == "agents") {
        result = RunScene<RestartAgentsDialog>(this);
      } else {
        result = RunScene<TroubleShootingWindow>(this);
      }
    } catch (const TulkTimeout&) {
      result = -1;
    }
    SetLoggedIn(false);
    PutText(2, 3, "result: " + std::to_string(result) + "  ");
    Redraw(true);
  }
};

}  // namespace

int main(int argc, char** argv) {
  currentUser = Env("TULK_TROUBLESHOOTING_USER", "root");
  ConsoleHooks hooks;
  hooks.preferenceInit = InitPreferences;
  hooks.readIdleTimeout = ReadTulkTimeout;
  hooks.initProductLogging = InitProductLogging;
  hooks.afterStartup = [] { StartHostServices(); };
  hooks.runWelcome = [] {
    DriverHome home;
    RunFrame(&home);
  };
  return ConsoleMain(argc, argv, hooks);
}
