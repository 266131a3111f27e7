#include "platform/tool/Power.h"

#include "platform/sim/SimHost.h"
#include "platform/sim/SimState.h"

namespace Sim::Tools {

int PowerOff(ToolRun& run) {
  SimHost::Instance().Modify([](json& state) { state["power"] = "off"; });
  run.Out("The system is going down for power off NOW!\n");
  return 0;
}

int Reboot(ToolRun& run) {
  bool forced = false;
  for (const std::string& arg : run.Args()) {
    if (arg == "-f" || arg == "--force") {
      forced = true;
    } else {
      run.Err("reboot: unknown option " + arg + "\n");
      return 1;
    }
  }
  SimHost::Instance().Modify([&](json& state) {
    state["power"] = "rebooting";
    state["powerForced"] = forced;
    json& network = ObjectFor(state, "network");
    if (network.contains("ipv6EnabledNextBoot")) {
      network["ipv6Enabled"] = network["ipv6EnabledNextBoot"];
      network.erase("ipv6EnabledNextBoot");
    }
  });
  run.Out("The system is going down for reboot NOW!\n");
  return 0;
}

int PowerOffVms(ToolRun& run) {
  bool terminate = false;
  for (const std::string& arg : run.Args()) {
    if (arg == "--terminate") {
      terminate = true;
    } else {
      run.Err("powerOffVms: unknown option " + arg + "\n");
      return 1;
    }
  }
  int count = 0;
  SimHost::Instance().Modify([&](json& state) {
    for (json& vm : ArrayFor(state, "vms")) {
      if (StringAt(vm, "state") == "running") {
        vm["state"] = "poweredOff";
        vm["lastPowerOff"] = terminate ? "terminate" : "shutdown";
        ++count;
      }
    }
  });
  run.Out("Powered off " + std::to_string(count) + " virtual machine(s)\n");
  return 0;
}

}  // namespace Sim::Tools
