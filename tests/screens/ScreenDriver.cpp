// Test-only program: the real console start-up and host services with a
// home frame that opens one screen directly, as the System Customization
// menu would for a logged-in session. The screen tests of the menu, the
// network, restore and troubleshooting folders drive it in a
// pseudo-terminal.
//
//   TULK_SCENE   menu (default), lockdown, keyboard, reset, restart, test,
//                network-restore, troubleshooting, shell-timeouts,
//                tulk-timeout, agents
//   TULK_DRIVER_USER             the logged-in user (default "root")
//   TULK_DRIVER_EMPTY_PASSWORD=1 the login's password was empty
//
// The home frame shows "result: N" after the scene (-1: the idle timeout
// ended it); "o" opens it again.

#include <curses.h>

#include <cstdlib>
#include <functional>
#include <map>
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
#include "screens/KeyboardDialog.h"
#include "screens/LockdownDialog.h"
#include "screens/RestoreDialog.h"
#include "screens/SupportValues.h"
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

const std::map<std::string, std::function<int(Frame*)>> kScenes = {
    {"menu", RunScene<GeneralWindow>},
    {"lockdown", RunScene<LockdownDialog>},
    {"keyboard", RunScene<KeyboardDialog>},
    {"reset", RunScene<RestoreDialog>},
    {"restart", RunScene<RestartNetworkDialog>},
    {"test", RunScene<TestDialog>},
    {"network-restore", RunScene<NetworkRestoreWindow>},
    {"troubleshooting", RunScene<TroubleShootingWindow>},
    {"shell-timeouts", RunScene<ShellTimeoutDialog>},
    {"tulk-timeout", RunScene<TulkTimeoutDialog>},
    {"agents", RunScene<RestartAgentsDialog>},
};

class DriverHome : public Frame {
 public:
  DriverHome() : Frame(nullptr, 0, 0, COLS, LINES, kBlack, kWhite) {
    Box();
    PutText(2, 1, "SCREEN DRIVER");
  }

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
    const auto scene = kScenes.find(Env("TULK_SCENE", "menu"));
    if (scene == kScenes.end()) {
      return -2;
    }
    SetLoggedIn(true);
    int result = -1;
    try {
      result = scene->second(this);
    } catch (const TulkTimeout&) {
    }
    SetLoggedIn(false);
    return result;
  }
};

}  // namespace

int main(int argc, char** argv) {
  currentUser = Env("TULK_DRIVER_USER", "root");
  passwordWasEmpty = Env("TULK_DRIVER_EMPTY_PASSWORD", "0") == "1";
  ConsoleHooks hooks;
  hooks.preferenceInit = InitPreferences;
  hooks.readIdleTimeout = ReadTulkTimeout;
  hooks.initProductLogging = InitProductLogging;
  hooks.afterStartup = [] {
    RecoverHostsFile();
    StartHostServices();
    RegisterSupportValueProviders();
  };
  hooks.runWelcome = [] {
    DriverHome home;
    RunFrame(&home);
  };
  return ConsoleMain(argc, argv, hooks);
}
