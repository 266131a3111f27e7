#include "platform/api/PortGroupImpl.h"

#include <algorithm>

#include "platform/sim/SimState.h"

namespace HykCtl::Network {
namespace {

std::string Op(const char* method) {
  return std::string("HykCtl::Network::PortGroupImpl::") + method;
}

HostMgr::Network::NicTeamingPolicy PolicyOf(const Sim::json& teaming) {
  std::vector<std::string> order;
  for (const Sim::json& name : Sim::ArrayAt(teaming, "uplinkOrder")) {
    order.push_back(name.get<std::string>());
  }
  return HostMgr::Network::NicTeamingPolicy(std::move(order), teaming.value("maxActive", 0));
}

}  // namespace

PortGroupImpl::PortGroupImpl(const std::string& name) : name_(name) {
  Sim::RequirePortGroup(Sim::Query(Op("PortGroupImpl")), name_);
}

bool PortGroupImpl::IsValidPortGroup(const std::string& name) {
  const Sim::json& state = Sim::Query(Op("IsValidPortGroup"));
  return Sim::FindByName(Sim::ArrayAt(Sim::ObjectAt(state, "network"), "portGroups"), name) !=
         nullptr;
}

std::string PortGroupImpl::GetVirtualSwitchName() const {
  return Sim::StringAt(Sim::RequirePortGroup(Sim::Query(Op("GetVirtualSwitchName")), name_),
                       "switch");
}

int PortGroupImpl::GetActiveClients() const {
  const Sim::json& state = Sim::Query(Op("GetActiveClients"));
  int clients = Sim::RequirePortGroup(state, name_).value("vmClients", 0);
  for (const Sim::json& nic : Sim::ArrayAt(Sim::ObjectAt(state, "network"), "hykernelNics")) {
    const Sim::json& connection = Sim::ObjectAt(nic, "connection");
    if (Sim::StringAt(connection, "type") == "portgroup" &&
        Sim::StringAt(connection, "portGroup") == name_) {
      ++clients;
    }
  }
  return clients;
}

int PortGroupImpl::GetVlanId() const {
  return Sim::RequirePortGroup(Sim::Query(Op("GetVlanId")), name_).value("vlanId", 0);
}

void PortGroupImpl::SetVlanId(int vlanId) {
  Sim::Change(Op("SetVlanId"), [&](Sim::json& state) {
    Sim::json& group = Sim::RequirePortGroup(state, name_);
    if (vlanId < 0 || vlanId > 4095) {
      Sim::Fail("Invalid VLAN id " + std::to_string(vlanId));
    }
    group["vlanId"] = vlanId;
  });
}

HostMgr::Network::NicTeamingPolicy PortGroupImpl::GetTeamingPolicy() const {
  const Sim::json& state = Sim::Query(Op("GetTeamingPolicy"));
  const Sim::json& group = Sim::RequirePortGroup(state, name_);
  if (group.contains("teaming")) {
    return PolicyOf(group["teaming"]);
  }
  const Sim::json* vswitch = Sim::FindByName(
      Sim::ArrayAt(Sim::ObjectAt(state, "network"), "switches"), Sim::StringAt(group, "switch"));
  return vswitch != nullptr ? PolicyOf(Sim::ObjectAt(*vswitch, "teaming"))
                            : HostMgr::Network::NicTeamingPolicy();
}

void PortGroupImpl::SetTeamingPolicy(const HostMgr::Network::NicTeamingPolicy& policy) {
  Sim::Change(Op("SetTeamingPolicy"), [&](Sim::json& state) {
    Sim::json& group = Sim::RequirePortGroup(state, name_);
    const std::string switchName = Sim::StringAt(group, "switch");
    std::vector<std::string> uplinks;
    for (const Sim::json& uplink : Sim::ArrayAt(Sim::RequireSwitch(state, switchName), "uplinks")) {
      uplinks.push_back(uplink.get<std::string>());
    }
    for (const std::string& name : policy.GetUplinkOrder()) {
      if (std::find(uplinks.begin(), uplinks.end(), name) == uplinks.end()) {
        Sim::Fail("Physical NIC " + name + " is not an uplink of " + switchName);
      }
    }
    if (policy.GetMaxActiveUplinks() < 0) {
      Sim::Fail("Invalid number of active uplinks " + std::to_string(policy.GetMaxActiveUplinks()));
    }
    Sim::RequirePortGroup(state, name_)["teaming"] = {{"uplinkOrder", policy.GetUplinkOrder()},
                                                      {"maxActive", policy.GetMaxActiveUplinks()}};
  });
}

}  // namespace HykCtl::Network
