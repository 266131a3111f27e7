// The tulk executable: wires the layers together and hands over to the
// console runtime.

#include <syslog.h>

#include <memory>

#include "host/HostStartup.h"
#include "host/HostsFileBackup.h"
#include "platform/api/HostMgrException.h"
#include "runtime/Console.h"
#include "runtime/SystemLog.h"
#include "screens/SmartCardCheck.h"
#include "screens/SupportValues.h"
#include "screens/WelcomeWindow.h"
#include "toolkit/RunFrame.h"

namespace {

void AfterStartup() {
  // Before anything reads the hosts file: a network test that was cut off
  // between its backup and restore left the real file in the backup.
  Tulk::RecoverHostsFile();
  Tulk::StartHostServices();
  Tulk::RegisterSupportValueProviders();
}

void RunWelcome() {
  auto welcome = std::make_unique<Tulk::WelcomeWindow>();
  try {
    Tulk::RunFrame(welcome.get());
  } catch (const HostMgr::Lib::HostMgrException& error) {
    Tulk::Log(LOG_ERR, "TULK aborted by exception: %s", error.what());
  }
}

}  // namespace

int main(int argc, char** argv) {
  Tulk::ConsoleHooks hooks;
  hooks.preferenceInit = Tulk::InitPreferences;
  hooks.readIdleTimeout = Tulk::ReadTulkTimeout;
  hooks.initProductLogging = Tulk::InitProductLogging;
  hooks.afterStartup = AfterStartup;
  hooks.runWelcome = RunWelcome;
  hooks.smartCardCheck = Tulk::RunSmartCardCheck;
  return Tulk::ConsoleMain(argc, argv, hooks);
}
