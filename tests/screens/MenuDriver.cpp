// Test-only program: the real console start-up and host services with a
// home frame that opens one of the menu engineer's screens directly, as a
// logged-in session would. The menu's screen tests drive it in a
// pseudo-terminal.
//
//   TULK_MENU_SCENE   menu (default), lockdown, keyboard, restore
//   TULK_MENU_USER    the logged-in user (default "root")
//   TULK_MENU_EMPTY_PASSWORD=1   the login's password was empty
//
// The home frame shows "result: N" after the scene; "o" opens it again.

#include <curses.h>

#include <cstdlib>
#include <string>

#include "host/HostStartup.h"
#include "include/ColorNumbers.h"
#include "include/ProcessFlags.h"
#include "runtime/Console.h"
#include "runtime/KeyInput.h"
#include "screens/GeneralWindow.h"
#include "screens/KeyboardDialog.h"
#include "screens/LockdownDialog.h"
#include "screens/RestoreDialog.h"
#include "screens/SupportValues.h"
#include "toolkit/RunFrame.h"

namespace {

using namespace Tulk;

std::string Env(const char* name, const char* fallback) {
  const char* value = std::getenv(name);
  return value != nullptr ? value : fallback;
}

template <typename Scene>
int RunScene(Frame* owner) {
  auto* scene = new Scene(owner);
  const int result = RunFrame(scene);
  delete scene;
  return result;
}

class DriverHome : public Frame {
 public:
  DriverHome() : Frame(nullptr, 0, 0, COLS, LINES, kBlack, kWhite) {
    Box();
    PutText(2, 1, "MENU DRIVER");
  }

  int Run() override {
    Open();
    for (;;) {
      const int key = WaitForKey(this, false);
      if (key == 'o') {
        Open();
      }
    }
  }

 private:
  void Open() {
    const std::string scene = Env("TULK_MENU_SCENE", "menu");
    SetLoggedIn(true);
    int result = 0;
    try {
      if (scene == "lockdown") {
        result = RunScene<LockdownDialog>(this);
      } else if (scene == "keyboard") {
        result = RunScene<KeyboardDialog>(this);
      } else if (scene == "restore") {
        result = RunScene<RestoreDialog>(this);
      } else {
        result = RunScene<GeneralWindow>(this);
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
  currentUser = Env("TULK_MENU_USER", "root");
  passwordWasEmpty = Env("TULK_MENU_EMPTY_PASSWORD", "0") == "1";
  ConsoleHooks hooks;
  hooks.preferenceInit = InitPreferences;
  hooks.readIdleTimeout = ReadTulkTimeout;
  hooks.initProductLogging = InitProductLogging;
  hooks.afterStartup = [] {
    StartHostServices();
    RegisterSupportValueProviders();
  };
  hooks.runWelcome = [] {
    DriverHome home;
    RunFrame(&home);
  };
  return ConsoleMain(argc, argv, hooks);
}
