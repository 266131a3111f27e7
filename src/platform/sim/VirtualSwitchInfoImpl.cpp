#include "platform/api/VirtualSwitchInfoImpl.h"

#include "platform/sim/SimState.h"

namespace HykCtl::Network {
namespace {

std::string Op(const char* method) {
  return std::string("HykCtl::Network::VirtualSwitchInfoImpl::") + method;
}

std::vector<PortsetImpl> SwitchesOfType(const Sim::json& state, const char* type) {
  std::vector<std::string> names;
  for (const Sim::json& vswitch : Sim::ArrayAt(Sim::ObjectAt(state, "network"), "switches")) {
    if (Sim::StringAt(vswitch, "type", "standard") == type) {
      names.push_back(Sim::StringAt(vswitch, "name"));
    }
  }
  std::vector<PortsetImpl> switches;
  switches.reserve(names.size());
  for (const std::string& name : names) {
    switches.emplace_back(name);
  }
  return switches;
}

}  // namespace

std::vector<PortsetImpl> VirtualSwitchInfoImpl::GetVirtualSwitches() const {
  return SwitchesOfType(Sim::Query(Op("GetVirtualSwitches")), "standard");
}

std::vector<PortsetImpl> VirtualSwitchInfoImpl::GetDVSwitches() const {
  return SwitchesOfType(Sim::Query(Op("GetDVSwitches")), "distributed");
}

void VirtualSwitchInfoImpl::AddVirtualSwitch(const std::string& name, int numPorts) {
  Sim::Change(Op("AddVirtualSwitch"), [&](Sim::json& state) {
    if (name.empty()) {
      Sim::Fail("A virtual switch needs a name");
    }
    if (numPorts < 1 || numPorts > 4096) {
      Sim::Fail("Invalid number of ports " + std::to_string(numPorts));
    }
    Sim::json& switches = Sim::ArrayFor(Sim::ObjectFor(state, "network"), "switches");
    if (Sim::FindByName(switches, name) != nullptr) {
      Sim::Fail("Virtual switch " + name + " already exists");
    }
    switches.push_back({{"name", name},
                        {"type", "standard"},
                        {"numPorts", numPorts},
                        {"configuredPorts", numPorts},
                        {"mtu", 1500},
                        {"uplinks", Sim::json::array()},
                        {"teaming", {{"uplinkOrder", Sim::json::array()}, {"maxActive", 0}}}});
  });
}

void VirtualSwitchInfoImpl::RemoveVirtualSwitch(const std::string& name) {
  Sim::Change(Op("RemoveVirtualSwitch"), [&](Sim::json& state) {
    const Sim::json& vswitch = Sim::RequireSwitch(state, name);
    if (Sim::StringAt(vswitch, "type", "standard") != "standard") {
      Sim::Fail("Operation not supported on distributed switch " + name);
    }
    Sim::json& network = state["network"];
    for (const Sim::json& group : Sim::ArrayAt(network, "portGroups")) {
      if (Sim::StringAt(group, "switch") == name) {
        Sim::Fail("Virtual switch " + name + " still has portgroup " +
                  Sim::StringAt(group, "name"));
      }
    }
    Sim::json& switches = network["switches"];
    for (auto it = switches.begin(); it != switches.end(); ++it) {
      if (Sim::StringAt(*it, "name") == name) {
        switches.erase(it);
        break;
      }
    }
  });
}

}  // namespace HykCtl::Network
