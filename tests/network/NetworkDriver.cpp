// Test-only program: the real console start-up and host services with a
// home frame that opens one of the network or restore screens directly, as
// the System Customization menu would for a logged-in session. The network
// and restore screen tests drive it in a pseudo-terminal.
//
//   TULK_NETWORK_SCENE   restart, test, restore (default), menu
//
// The home frame shows "result: N" after the scene; "o" opens it again.

#include <curses.h>

#include <cstdlib>
#include <string>

#include "host/HostStartup.h"
#include "host/HostsFileBackup.h"
#include "include/ColorNumbers.h"
#include "include/ProcessFlags.h"
#include "network/RestartNetworkDialog.h"
#include "network/TestDialog.h"
#include "restore/NetworkRestoreWindow.h"
#include "runtime/Console.h"
#include "runtime/KeyInput.h"
#include "screens/GeneralWindow.h"
#include "toolkit/RunFrame.h"

namespace {

using namespace Tulk;

template <typename Scene>
int RunScene(Frame* owner) {
  Scene scene(owner);
  return RunFrame(&scene);
}

class DriverHome : public Frame {
 public:
  DriverHome() : Frame(nullptr, 0, 0, COLS, LINES, kBlack, kWhite) {
    Box();
    PutText(2, 1, "NETWORK DRIVER");
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
    const char* value = std::getenv("TULK_NETWORK_SCENE");
    const std::string scene = value != nullptr ? value : "restore";
    SetLoggedIn(true);
    int result = 0;
    try {
      if (scene == "restart") {
        result = RunScene<RestartNetworkDialog>(this);
      } else if (scene == "test") {
        result = RunScene<TestDialog>(this);
      } else if (scene == "menu") {
        result = RunScene<GeneralWindow>(this);
      } else {
        result = RunScene<NetworkRestoreWindow>(this);
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
  currentUser = "root";
  ConsoleHooks hooks;
  hooks.preferenceInit = InitPreferences;
  hooks.readIdleTimeout = ReadTulkTimeout;
  hooks.initProductLogging = InitProductLogging;
  hooks.afterStartup = [] {
    RecoverHostsFile();
    StartHostServices();
  };
  hooks.runWelcome = [] {
    DriverHome home;
    RunFrame(&home);
  };
  return ConsoleMain(argc, argv, hooks);
}
