#include "platform/tool/OskCmd.h"

#include <functional>
#include <map>

#include "platform/sim/SimHost.h"
#include "platform/sim/SimState.h"

namespace Sim::Tools {
namespace {

bool UserMayRun(const json& state, const std::string& user) {
  for (const json& account : ArrayAt(ObjectAt(state, "users"), "accounts")) {
    if (StringAt(account, "name") == user) {
      return account.value("oskCmd", true);
    }
  }
  return true;
}

void SetService(json& state, const char* service, const char* key, bool value) {
  ObjectFor(ObjectFor(state, "services"), service)[key] = value;
}

// Starting or stopping the SSH server opens or closes its firewall
// ruleset when the ruleset follows the service.
void FollowFirewall(json& state, bool open) {
  json& firewall = ObjectFor(ObjectFor(state, "system"), "firewall");
  if (firewall.contains("sshServer") && firewall["sshServer"].value("managedWithService", true)) {
    firewall["sshServer"]["enabled"] = open;
  }
}

using Action = std::function<void(json&)>;

const std::map<std::string, Action>& Actions() {
  static const std::map<std::string, Action> actions = {
      {"hostsvc/start_ssh",
       [](json& s) {
         SetService(s, "SSH", "running", true);
         FollowFirewall(s, true);
       }},
      {"hostsvc/stop_ssh",
       [](json& s) {
         SetService(s, "SSH", "running", false);
         FollowFirewall(s, false);
       }},
      {"hostsvc/enable_ssh", [](json& s) { SetService(s, "SSH", "enabled", true); }},
      {"hostsvc/disable_ssh", [](json& s) { SetService(s, "SSH", "enabled", false); }},
      {"hostsvc/start_tav_shell", [](json& s) { SetService(s, "TavShell", "running", true); }},
      {"hostsvc/stop_tav_shell", [](json& s) { SetService(s, "TavShell", "running", false); }},
      {"hostsvc/enable_tav_shell", [](json& s) { SetService(s, "TavShell", "enabled", true); }},
      {"hostsvc/disable_tav_shell", [](json& s) { SetService(s, "TavShell", "enabled", false); }},
      {"hostsvc/autostartmanager/autostop",
       [](json& s) {
         for (json& vm : ArrayFor(s, "vms")) {
           if (StringAt(vm, "state") == "running" && vm.value("autostart", false)) {
             vm["state"] = "poweredOff";
             vm["lastPowerOff"] = "autostop";
           }
         }
       }},
      {"internalsvc/refresh",
       [](json& s) {
         json& mgmtd = ObjectFor(ObjectFor(s, "services"), "mgmtd");
         mgmtd["refreshes"] = mgmtd.value("refreshes", 0) + 1;
       }},
      {"osksvc/auth/lockdown_exit", [](json& s) { ObjectFor(s, "lockdown")["enabled"] = false; }},
  };
  return actions;
}

}  // namespace

int OskCmd(ToolRun& run) {
  const std::vector<std::string>& args = run.Args();
  if (args.size() < 3 || args[0] != "-U") {
    run.Err("Usage: osk-cmd -U <user> <command> [arguments]\n");
    return 1;
  }
  const std::string& user = args[1];
  SimHost& host = SimHost::Instance();
  if (!UserMayRun(host.State(), user)) {
    run.Err("Failed to log in as user " + user + "\n");
    return 255;
  }
  const std::string& command = args[2];
  if (command == "get") {
    const std::string what = args.size() > 3 ? args[3] : "";
    const json& lockdown = ObjectAt(host.State(), "lockdown");
    if (what == "osksvc/auth/lockdown_is_enabled") {
      run.Out(lockdown.value("enabled", false) ? "true\n" : "false\n");
    } else if (what == "osksvc/auth/lockdown_is_possible") {
      run.Out(lockdown.value("possible", true) ? "true\n" : "false\n");
    } else {
      run.Err("Unknown property " + what + "\n");
      return 1;
    }
    return 0;
  }
  if (command == "osksvc/auth/lockdown_enter") {
    if (!ObjectAt(host.State(), "lockdown").value("possible", true)) {
      run.Err("Lockdown mode is not possible on this host\n");
      return 1;
    }
    host.Modify([](json& s) { ObjectFor(s, "lockdown")["enabled"] = true; });
    return 0;
  }
  auto action = Actions().find(command);
  if (action == Actions().end()) {
    run.Err("Unknown command " + command + "\n");
    return 1;
  }
  host.Modify(action->second);
  return 0;
}

}  // namespace Sim::Tools
