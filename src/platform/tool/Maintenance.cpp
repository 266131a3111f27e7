#include "platform/tool/Maintenance.h"

#include <unistd.h>

#include <fstream>

#include "platform/sim/SimHost.h"
#include "platform/sim/SimState.h"

namespace Sim::Tools {

int Ping(ToolRun& run) {
  const std::vector<std::string>& args = run.Args();
  std::string count = "3";
  std::string interface;
  std::string address;
  for (std::size_t i = 0; i < args.size(); ++i) {
    const bool hasValue = i + 1 < args.size();
    if (args[i] == "-c" && hasValue) {
      count = args[++i];
    } else if (args[i] == "-I" && hasValue) {
      interface = args[++i];
    } else if (args[i] == "-W" && hasValue) {
      ++i;
    } else if (!args[i].empty() && args[i][0] != '-') {
      address = args[i];
    }
  }
  if (address.empty()) {
    run.Err("Usage: hykping [-c count] [-I interface] address\n");
    return 2;
  }
  const json& state = SimHost::Instance().State();
  const json& network = ObjectAt(state, "network");
  if (!interface.empty()) {
    const json* nic = FindByName(ArrayAt(network, "hykernelNics"), interface);
    if (nic == nullptr) {
      run.Err("hykping: unknown interface " + interface + "\n");
      return 2;
    }
    if (!nic->value("enabled", true)) {
      run.Err("hykping: interface " + interface + " is down\n");
      return 1;
    }
  }
  // Through an interface whose port passes no traffic (a blocked
  // distributed-switch port, or one without a working uplink) nothing
  // answers.
  const bool reachable = IsReachable(state, address) &&
                         (interface.empty() || KernelNicCarriesTraffic(state, interface));
  run.Out("PING " + address + ": 56 data bytes\n");
  if (reachable) {
    run.Out("\n--- " + address + " ping statistics ---\n" + count + " packets transmitted, " +
            count + " packets received, 0% packet loss\n");
    return 0;
  }
  run.Out("\n--- " + address + " ping statistics ---\n" + count +
          " packets transmitted, 0 packets received, 100% packet loss\n");
  return 1;
}

int Backtrace(ToolRun& run) {
  const std::vector<std::string>& args = run.Args();
  std::string process;
  std::string pattern = "core";
  std::string folder = "/var/core";
  for (std::size_t i = 0; i + 1 < args.size(); ++i) {
    if (args[i] == "-n") {
      process = args[++i];
    } else if (args[i] == "-o") {
      pattern = args[++i];
    } else if (args[i] == "-d") {
      folder = args[++i];
    }
  }
  if (process.empty()) {
    run.Err("Usage: hykbacktrace -w -n process [-o pattern] [-d folder]\n");
    return 2;
  }
  const json& service =
      ObjectAt(ObjectAt(SimHost::Instance().State(), "services"), process.c_str());
  if (!service.value("running", false)) {
    run.Err("hykbacktrace: no running process named " + process + "\n");
    return 1;
  }
  if (auto percent = pattern.find('%'); percent != std::string::npos) {
    pattern.replace(percent, 1, std::to_string(getpid()));
  }
  const std::string path = RootPath(folder) + "/" + pattern + ".core";
  std::ofstream core(path);
  core << "simulated live core of " << process << "\n";
  if (!core) {
    run.Err("hykbacktrace: cannot write " + path + "\n");
    return 1;
  }
  run.Out("Live core of " + process + " written to " + folder + "/" + pattern + ".core\n");
  return 0;
}

int FirmwareConfig(ToolRun& run) {
  if (run.Args().size() != 1 || run.Args().front() != "--reset-only") {
    run.Err("Usage: firmwareConfig.py --reset-only\n");
    return 2;
  }
  SimHost::Instance().Modify([](json& state) {
    state["advancedOptions"] = {{"/UserVars/TulkTimeOut", 600},
                                {"/UserVars/TaviShellTimeOut", 0},
                                {"/UserVars/TaviShellInteractiveTimeOut", 0}};
    ObjectFor(state, "lockdown")["enabled"] = false;
    ObjectFor(state, "system")["welcomeMessage"] = "";
    state["systemConfigResets"] = state.value("systemConfigResets", 0) + 1;
  });
  run.Out("Resetting the system configuration to its defaults\n");
  return 0;
}

int Backup(ToolRun& run) {
  if (run.Args().size() != 1) {
    run.Err("Usage: backup.sh 0|1\n");
    return 2;
  }
  SimHost::Instance().Modify([](json& state) {
    state["configBackups"] = state.value("configBackups", 0) + 1;
    state["lastConfigBackup"] = TimeStamp();
  });
  run.Out("Saving current state in /bootbank\n");
  return 0;
}

}  // namespace Sim::Tools
