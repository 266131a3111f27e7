#include "host/RepairServices.h"

#include <syslog.h>

#include <memory>
#include <vector>

#include "host/CommandRunner.h"
#include "host/HostTools.h"
#include "platform/api/HostMgrException.h"
#include "platform/api/SystemInfoImpl.h"
#include "runtime/HostPath.h"
#include "runtime/SystemLog.h"

namespace Tulk {
namespace {

constexpr char kShell[] = "/bin/sh";

std::vector<std::string> ScriptArguments(const RepairService& service, const char* verb) {
  return {"sh", HostPath(service.initScript), verb};
}

int RunOskServiceCommand(const char* action, const RepairService& service) {
  return RunOskCmd(
      {"osk-cmd", "-U", ConsoleUser(), std::string("hostsvc/") + action + service.commandSuffix});
}

}  // namespace

bool IsServiceRunning(const RepairService& service) {
  return RunCommand(kShell, ScriptArguments(service, "status"), nullptr, nullptr, nullptr, nullptr,
                    nullptr, 0, kQueryTimeoutSeconds) == 0;
}

int RunServiceScript(const RepairService& service, const char* verb) {
  return RunLoggedCommand(kShell, ScriptArguments(service, verb));
}

ServiceSwitch SwitchService(const RepairService& service, bool on) {
  ServiceSwitch outcome;
  outcome.startStopCode = RunOskServiceCommand(on ? "stop_" : "start_", service);
  if (outcome.startStopCode != 0) {
    Log(LOG_WARNING, "Unable to run osk-cmd to start/stop %s", service.logName);
    outcome.initScriptUsed = true;
    outcome.initScriptCode = RunServiceScript(service, on ? "stop" : "start");
    if (service.firewallRuleset != nullptr) {
      outcome.firewall = SwitchFirewallRuleset(service.firewallRuleset, !on);
    }
  }
  outcome.enableDisableCode = RunOskServiceCommand(on ? "disable_" : "enable_", service);
  if (outcome.enableDisableCode != 0) {
    Log(LOG_WARNING, "Unable to run osk-cmd to enable/disable %s", service.logName);
  }
  return outcome;
}

FirewallChange SwitchFirewallRuleset(const std::string& id, bool open) {
  try {
    std::unique_ptr<HykCtl::System::FirewallRuleset> ruleset =
        HykCtl::System::SystemInfoImpl().GetFirewallRulesetById(id);
    if (!ruleset->IsManagedWithService()) {
      return FirewallChange::kUntouched;
    }
    if (open) {
      ruleset->Enable();
    } else {
      ruleset->Disable();
    }
    return FirewallChange::kSwitched;
  } catch (const HostMgr::Lib::HostMgrException& error) {
    Log(LOG_WARNING, "Failed to update firewall %s ruleset status: %s", id.c_str(), error.what());
    return FirewallChange::kFailed;
  }
}

int RestartRunningRepairServices() {
  int restarted = 0;
  for (const RepairService* service : {&kTaviShellService, &kSshService}) {
    if (IsServiceRunning(*service)) {
      RunServiceScript(*service, "restart");
      ++restarted;
    }
  }
  return restarted;
}

}  // namespace Tulk
