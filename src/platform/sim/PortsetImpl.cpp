#include "platform/api/PortsetImpl.h"

#include <algorithm>
#include <cstdlib>

#include "platform/sim/SimState.h"

namespace HykCtl::Network {
namespace {

std::string Op(const char* method) {
  return std::string("HykCtl::Network::PortsetImpl::") + method;
}

bool IsStandard(const Sim::json& vswitch) {
  return Sim::StringAt(vswitch, "type", "standard") == "standard";
}

Sim::json& RequireStandard(Sim::json& state, const std::string& name) {
  Sim::json& vswitch = Sim::RequireSwitch(state, name);
  if (!IsStandard(vswitch)) {
    Sim::Fail("Operation not supported on distributed switch " + name);
  }
  return vswitch;
}

void EraseName(Sim::json& array, const std::string& name) {
  for (auto it = array.begin(); it != array.end(); ++it) {
    if (it->is_string() && it->get<std::string>() == name) {
      array.erase(it);
      return;
    }
  }
}

const Sim::json& RequireDistributed(const Sim::json& state, const std::string& name) {
  const Sim::json& vswitch = Sim::RequireSwitch(state, name);
  if (IsStandard(vswitch)) {
    Sim::Fail("Not a distributed switch " + name);
  }
  return vswitch;
}

const Sim::json& RequirePort(const Sim::json& vswitch, const std::string& id) {
  const Sim::json* port = Sim::FindDvsPort(vswitch, id);
  if (port == nullptr) {
    Sim::Fail("Port " + id + " not found on " + Sim::StringAt(vswitch, "name"));
  }
  return *port;
}

// The next port id: one above the highest numeric id in use.
std::string NextPortId(const Sim::json& vswitch) {
  long highest = 0;
  for (const Sim::json& port : Sim::ArrayAt(vswitch, "ports")) {
    const std::string id = Sim::StringAt(port, "id");
    char* end = nullptr;
    const long value = std::strtol(id.c_str(), &end, 10);
    if (!id.empty() && end != nullptr && *end == '\0' && value > highest) {
      highest = value;
    }
  }
  return std::to_string(highest + 1);
}

std::vector<std::string> Strings(const Sim::json& array) {
  std::vector<std::string> names;
  for (const Sim::json& name : array) {
    names.push_back(name.get<std::string>());
  }
  return names;
}

}  // namespace

PortsetImpl::PortsetImpl(const std::string& name) : name_(name) {
  Sim::RequireSwitch(Sim::Query(Op("PortsetImpl")), name_);
}

bool PortsetImpl::IsValidVirtualSwitch(const std::string& name) {
  const Sim::json& state = Sim::Query(Op("IsValidVirtualSwitch"));
  return Sim::FindByName(Sim::ArrayAt(Sim::ObjectAt(state, "network"), "switches"), name) !=
         nullptr;
}

int PortsetImpl::GetType() const {
  const Sim::json& vswitch = Sim::RequireSwitch(Sim::Query(Op("GetType")), name_);
  return IsStandard(vswitch) ? kStandard : kDistributed;
}

std::vector<std::string> PortsetImpl::GetUplinks() const {
  return Strings(Sim::ArrayAt(Sim::RequireSwitch(Sim::Query(Op("GetUplinks")), name_), "uplinks"));
}

std::vector<std::string> PortsetImpl::GetPortGroups() const {
  const Sim::json& state = Sim::Query(Op("GetPortGroups"));
  const Sim::json& vswitch = Sim::RequireSwitch(state, name_);
  if (!IsStandard(vswitch)) {
    return Strings(Sim::ArrayAt(vswitch, "portGroups"));
  }
  std::vector<std::string> names;
  for (const Sim::json& group : Sim::ArrayAt(Sim::ObjectAt(state, "network"), "portGroups")) {
    if (Sim::StringAt(group, "switch") == name_) {
      names.push_back(Sim::StringAt(group, "name"));
    }
  }
  return names;
}

std::int64_t PortsetImpl::GetNumPorts() const {
  return Sim::RequireSwitch(Sim::Query(Op("GetNumPorts")), name_).value("numPorts", 0);
}

std::int64_t PortsetImpl::GetUsedPorts() const {
  // Uplinks, kernel NICs and virtual machine ports each take one port.
  const Sim::json& state = Sim::Query(Op("GetUsedPorts"));
  const Sim::json& network = Sim::ObjectAt(state, "network");
  const Sim::json& vswitch = Sim::RequireSwitch(state, name_);
  std::int64_t used = static_cast<std::int64_t>(Sim::ArrayAt(vswitch, "uplinks").size());
  for (const Sim::json& nic : Sim::ArrayAt(network, "hykernelNics")) {
    if (Sim::StringAt(Sim::ObjectAt(nic, "connection"), "switch") == name_) {
      ++used;
    }
  }
  for (const Sim::json& group : Sim::ArrayAt(network, "portGroups")) {
    if (Sim::StringAt(group, "switch") == name_) {
      used += group.value("vmClients", 0);
    }
  }
  return used;
}

std::int64_t PortsetImpl::GetConfiguredPorts() const {
  const Sim::json& vswitch = Sim::RequireSwitch(Sim::Query(Op("GetConfiguredPorts")), name_);
  return vswitch.value("configuredPorts", vswitch.value("numPorts", 0));
}

void PortsetImpl::AddUplink(const std::string& pnic) {
  Sim::Change(Op("AddUplink"), [&](Sim::json& state) {
    Sim::RequirePnic(state, pnic);
    const std::string user = Sim::SwitchOfUplink(state, pnic);
    if (!user.empty()) {
      Sim::Fail("Physical NIC " + pnic + " is already an uplink of " + user);
    }
    Sim::ArrayFor(RequireStandard(state, name_), "uplinks").push_back(pnic);
  });
}

void PortsetImpl::RemoveUplink(const std::string& pnic) {
  Sim::Change(Op("RemoveUplink"), [&](Sim::json& state) {
    Sim::json& vswitch = RequireStandard(state, name_);
    if (Sim::SwitchOfUplink(state, pnic) != name_) {
      Sim::Fail("Physical NIC " + pnic + " is not an uplink of " + name_);
    }
    EraseName(vswitch["uplinks"], pnic);
    EraseName(Sim::ArrayFor(Sim::ObjectFor(vswitch, "teaming"), "uplinkOrder"), pnic);
  });
}

void PortsetImpl::MoveUplink(const std::string& pnic, const std::string& targetSwitch) {
  Sim::Change(Op("MoveUplink"), [&](Sim::json& state) {
    Sim::RequirePnic(state, pnic);
    if (Sim::SwitchOfUplink(state, pnic) != name_) {
      Sim::Fail("Physical NIC " + pnic + " is not an uplink of " + name_);
    }
    Sim::json& target = RequireStandard(state, targetSwitch);
    Sim::json& source = Sim::RequireSwitch(state, name_);
    EraseName(source["uplinks"], pnic);
    if (source.contains("teaming")) {
      EraseName(Sim::ArrayFor(source["teaming"], "uplinkOrder"), pnic);
    }
    Sim::ArrayFor(target, "uplinks").push_back(pnic);
  });
}

HostMgr::Network::NicTeamingPolicy PortsetImpl::GetTeamingPolicy() const {
  const Sim::json& vswitch = Sim::RequireSwitch(Sim::Query(Op("GetTeamingPolicy")), name_);
  const Sim::json& teaming = Sim::ObjectAt(vswitch, "teaming");
  return HostMgr::Network::NicTeamingPolicy(Strings(Sim::ArrayAt(teaming, "uplinkOrder")),
                                            teaming.value("maxActive", 0));
}

void PortsetImpl::SetTeamingPolicy(const HostMgr::Network::NicTeamingPolicy& policy) {
  Sim::Change(Op("SetTeamingPolicy"), [&](Sim::json& state) {
    Sim::json& vswitch = RequireStandard(state, name_);
    const std::vector<std::string> uplinks = Strings(Sim::ArrayAt(vswitch, "uplinks"));
    for (const std::string& name : policy.GetUplinkOrder()) {
      if (std::find(uplinks.begin(), uplinks.end(), name) == uplinks.end()) {
        Sim::Fail("Physical NIC " + name + " is not an uplink of " + name_);
      }
    }
    if (policy.GetMaxActiveUplinks() < 0) {
      Sim::Fail("Invalid number of active uplinks " + std::to_string(policy.GetMaxActiveUplinks()));
    }
    vswitch["teaming"] = {{"uplinkOrder", policy.GetUplinkOrder()},
                          {"maxActive", policy.GetMaxActiveUplinks()}};
  });
}

void PortsetImpl::AddPortGroup(const std::string& name, int vlanId) {
  Sim::Change(Op("AddPortGroup"), [&](Sim::json& state) {
    RequireStandard(state, name_);
    if (name.empty()) {
      Sim::Fail("A portgroup needs a name");
    }
    if (vlanId < 0 || vlanId > 4095) {
      Sim::Fail("Invalid VLAN id " + std::to_string(vlanId));
    }
    Sim::json& groups = Sim::ArrayFor(Sim::ObjectFor(state, "network"), "portGroups");
    if (Sim::FindByName(groups, name) != nullptr) {
      Sim::Fail("Portgroup " + name + " already exists");
    }
    groups.push_back({{"name", name}, {"switch", name_}, {"vlanId", vlanId}});
  });
}

void PortsetImpl::RemovePortGroup(const std::string& name) {
  Sim::Change(Op("RemovePortGroup"), [&](Sim::json& state) {
    RequireStandard(state, name_);
    if (Sim::StringAt(Sim::RequirePortGroup(state, name), "switch") != name_) {
      Sim::Fail("Portgroup " + name + " is not on " + name_);
    }
    Sim::json& network = state["network"];
    for (const Sim::json& nic : Sim::ArrayAt(network, "hykernelNics")) {
      if (Sim::StringAt(Sim::ObjectAt(nic, "connection"), "portGroup") == name) {
        Sim::Fail("Portgroup " + name + " is in use by " + Sim::StringAt(nic, "name"));
      }
    }
    Sim::json& groups = network["portGroups"];
    for (auto it = groups.begin(); it != groups.end(); ++it) {
      if (Sim::StringAt(*it, "name") == name) {
        groups.erase(it);
        break;
      }
    }
  });
}

}  // namespace HykCtl::Network

namespace HykCtl::Network {

bool PortsetImpl::IsThirdParty() const {
  return RequireDistributed(Sim::Query(Op("IsThirdParty")), name_).value("thirdParty", false);
}

HostMgr::Network::DvsPort PortsetImpl::GetDvsPort(const std::string& portId) const {
  const Sim::json& port =
      RequirePort(RequireDistributed(Sim::Query(Op("GetDvsPort")), name_), portId);
  HostMgr::Network::DvsPort result;
  result.id = portId;
  result.vlanId = port.value("vlanId", 0);
  result.uplinks = Strings(Sim::ArrayAt(port, "uplinks"));
  result.blocked = port.value("blocked", false);
  result.hostLocal = port.value("hostLocal", false);
  return result;
}

std::string PortsetImpl::AddHostLocalPort(const std::string& clonePortId,
                                          const HostMgr::Network::DvsPort& settings) {
  std::string id;
  Sim::Change(Op("AddHostLocalPort"), [&](Sim::json& state) {
    const Sim::json& vswitch = RequireDistributed(state, name_);
    if (vswitch.value("thirdParty", false)) {
      Sim::Fail("Operation not supported on third-party distributed switch " + name_);
    }
    if (settings.vlanId < 0 || settings.vlanId > 4094) {
      Sim::Fail("Invalid VLAN id " + std::to_string(settings.vlanId));
    }
    const std::vector<std::string> uplinks = Strings(Sim::ArrayAt(vswitch, "uplinks"));
    for (const std::string& uplink : settings.uplinks) {
      if (std::find(uplinks.begin(), uplinks.end(), uplink) == uplinks.end()) {
        Sim::Fail("Physical NIC " + uplink + " is not an uplink of " + name_);
      }
    }
    Sim::json port = RequirePort(vswitch, clonePortId);
    id = NextPortId(vswitch);
    port["id"] = id;
    port["vlanId"] = settings.vlanId;
    port["uplinks"] = settings.uplinks;
    port["blocked"] = settings.blocked;
    port["hostLocal"] = true;
    Sim::ArrayFor(Sim::RequireSwitch(state, name_), "ports").push_back(std::move(port));
  });
  return id;
}

}  // namespace HykCtl::Network
