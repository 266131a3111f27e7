// Test-only program: the real start-up with a home frame that opens one
// troubleshooting screen directly, as a logged-in "root" would.
// TULK_TROUBLESHOOTING_SCENE: window (default), shell-timeouts,
// tulk-timeout, agents. The home frame then shows "result: N" (-1: the
// idle timeout ended it); "o" opens the scene again.

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

template <typename Scene>
int RunScene(Frame* owner) {
  Scene scene(owner);
  return RunFrame(&scene);
}

class DriverHome : public Frame {
 public:
  DriverHome() : Frame(nullptr, 0, 0, COLS, LINES, kBlack, kWhite) { Box(); }

  int Run() override {
    for (int key = 'o';; key = WaitForKey(this, false)) {
      if (key == 'o') {
        PutText(2, 3, "result: " + std::to_string(Open()) + "  ");
        Redraw(true);
      }
    }
  }

 private:
  int Open() {
    const char* value = std::getenv("TULK_TROUBLESHOOTING_SCENE");
    const std::string scene = value != nullptr ? value : "window";
    SetLoggedIn(true);
    int result = -1;
    try {
      result = scene == "shell-timeouts" ? RunScene<ShellTimeoutDialog>(this)
               : scene == "tulk-timeout" ? RunScene<TulkTimeoutDialog>(this)
               : scene == "agents"       ? RunScene<RestartAgentsDialog>(this)
                                         : RunScene<TroubleShootingWindow>(this);
    } catch (const TulkTimeout&) {
    }
    SetLoggedIn(false);
    return result;
  }
};

}  // namespace

int main(int argc, char** argv) {
  currentUser = "root";
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
