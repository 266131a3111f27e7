#include "platform/api/NetworkInfoImpl.h"

#include <cstdio>

#include "platform/api/MacAddress.h"
#include "platform/api/Portset.h"
#include "platform/sim/SimState.h"

namespace HykCtl::Network {
namespace {

std::string Op(const char* method) {
  return std::string("HykCtl::Network::NetworkInfoImpl::") + method;
}

// The link-local address a NIC derives from its MAC (modified EUI-64).
std::string LinkLocalFromMac(const std::string& macText) {
  const auto mac = HostMgr::Network::MacAddress::FromString(macText).GetBytes();
  char text[64];
  std::snprintf(text, sizeof text, "fe80::%x:%x:%x:%x", ((mac[0] ^ 0x02) << 8) | mac[1],
                (mac[2] << 8) | 0xff, 0xfe00 | mac[3], (mac[4] << 8) | mac[5]);
  return text;
}

}  // namespace

std::vector<PortGroupImpl> NetworkInfoImpl::GetAllPortGroups(int portsetSelector) const {
  const Sim::json& state = Sim::Query(Op("GetAllPortGroups"));
  const Sim::json& network = Sim::ObjectAt(state, "network");
  std::string only;
  if (portsetSelector > 0) {
    int position = 0;
    for (const Sim::json& vswitch : Sim::ArrayAt(network, "switches")) {
      if (Sim::StringAt(vswitch, "type", "standard") == "standard" &&
          ++position == portsetSelector) {
        only = Sim::StringAt(vswitch, "name");
      }
    }
    if (only.empty()) {
      Sim::Fail("No port set " + std::to_string(portsetSelector));
    }
  }
  std::vector<std::string> names;
  for (const Sim::json& group : Sim::ArrayAt(network, "portGroups")) {
    if (only.empty() || Sim::StringAt(group, "switch") == only) {
      names.push_back(Sim::StringAt(group, "name"));
    }
  }
  std::vector<PortGroupImpl> groups;
  groups.reserve(names.size());
  for (const std::string& name : names) {
    groups.emplace_back(name);
  }
  return groups;
}

std::vector<std::string> NetworkInfoImpl::GetPnics() const {
  const Sim::json& state = Sim::Query(Op("GetPnics"));
  std::vector<std::string> names;
  for (const Sim::json& pnic : Sim::ArrayAt(Sim::ObjectAt(state, "network"), "pnics")) {
    names.push_back(Sim::StringAt(pnic, "name"));
  }
  return names;
}

void NetworkInfoImpl::UpdateManagementInterface() {
  Sim::Query(Op("UpdateManagementInterface"));
}

std::unique_ptr<HykNicImpl> NetworkInfoImpl::GetManagementInterface() const {
  const Sim::json& state = Sim::Query(Op("GetManagementInterface"));
  const Sim::json& network = Sim::ObjectAt(state, "network");
  const std::string name = Sim::StringAt(network, "managementInterface");
  if (name.empty() || Sim::FindByName(Sim::ArrayAt(network, "hykernelNics"), name) == nullptr) {
    return nullptr;
  }
  return std::make_unique<HykNicImpl>(name);
}

bool NetworkInfoImpl::IsHykIpv6Enabled() const {
  const Sim::json& state = Sim::Query(Op("IsHykIpv6Enabled"));
  return Sim::ObjectAt(state, "network").value("ipv6Enabled", true);
}

void NetworkInfoImpl::SetHykIpv6Enabled(bool enabled) {
  Sim::Change(Op("SetHykIpv6Enabled"), [&](Sim::json& state) {
    Sim::ObjectFor(state, "network")["ipv6EnabledNextBoot"] = enabled;
  });
}

void NetworkInfoImpl::DisableNetDumper() {
  Sim::Change(Op("DisableNetDumper"), [](Sim::json& state) {
    Sim::ObjectFor(Sim::ObjectFor(state, "network"), "netDumper")["enabled"] = false;
  });
}

void NetworkInfoImpl::ClearNetworkConfig() {
  Sim::Change(Op("ClearNetworkConfig"), [](Sim::json& state) {
    Sim::json& network = Sim::ObjectFor(state, "network");
    network["hykernelNics"] = Sim::json::array();
    network["portGroups"] = Sim::json::array();
    network["switches"] = Sim::json::array();
    network["managementInterface"] = "";
    network["routing"] = Sim::json::object();
    Sim::json& dns = Sim::ObjectFor(network, "dns");
    dns["nameServers"] = Sim::json::array();
    dns["searchDomains"] = Sim::json::array();
  });
}

void NetworkInfoImpl::AutoConfigNetwork() {
  Sim::Change(Op("AutoConfigNetwork"), [](Sim::json& state) {
    Sim::json& network = Sim::ObjectFor(state, "network");
    const Sim::json& pnics = Sim::ArrayAt(network, "pnics");
    if (pnics.empty()) {
      Sim::Fail("No physical NIC available for the management network");
    }
    const Sim::json* uplink = &pnics.front();
    for (const Sim::json& pnic : pnics) {
      if (pnic.value("linkUp", false)) {
        uplink = &pnic;
        break;
      }
    }
    if (Sim::FindByName(Sim::ArrayAt(network, "switches"), "vSwitch0") != nullptr ||
        Sim::FindByName(Sim::ArrayAt(network, "portGroups"), "Management Network") != nullptr ||
        Sim::FindByName(Sim::ArrayAt(network, "hykernelNics"), "hyk0") != nullptr) {
      Sim::Fail("The network is already configured; clear it first");
    }
    const std::string pnicName = Sim::StringAt(*uplink, "name");
    const std::string mac = Sim::StringAt(*uplink, "mac", "00:50:5a:00:00:01");
    Sim::json& switches = Sim::ArrayFor(network, "switches");
    for (Sim::json& vswitch : switches) {
      Sim::json& uplinks = Sim::ArrayFor(vswitch, "uplinks");
      for (auto it = uplinks.begin(); it != uplinks.end(); ++it) {
        if (it->get<std::string>() == pnicName) {
          uplinks.erase(it);
          break;
        }
      }
    }
    const int ports = HostMgr::Network::Portset::DEF_NUM_PORTS;
    switches.push_back({{"name", "vSwitch0"},
                        {"type", "standard"},
                        {"numPorts", ports},
                        {"configuredPorts", ports},
                        {"mtu", 1500},
                        {"uplinks", {pnicName}},
                        {"teaming", {{"uplinkOrder", {pnicName}}, {"maxActive", 1}}}});
    Sim::ArrayFor(network, "portGroups")
        .push_back({{"name", "Management Network"}, {"switch", "vSwitch0"}, {"vlanId", 0}});
    Sim::json nic = {
        {"name", "hyk0"},
        {"mac", mac},
        {"enabled", true},
        {"connection",
         {{"type", "portgroup"}, {"switch", "vSwitch0"}, {"portGroup", "Management Network"}}},
        {"ipv4", {{"mode", "dhcp"}}},
        {"dnsFromDhcp", true},
        {"ipv6",
         {{"enabled", true},
          {"dhcpv6", false},
          {"routerAdvertisement", true},
          {"networks",
           {{{"address", LinkLocalFromMac(mac)}, {"prefix", 64}, {"type", 1}, {"scope", 1}}}}}}};
    const Sim::json& offer = Sim::ObjectAt(network, "dhcpOffer");
    if (offer.empty()) {
      nic["dhcpLease"] = nullptr;
    } else {
      nic["dhcpLease"] = offer;
      nic["dhcpLease"]["bound"] = true;
    }
    Sim::ArrayFor(network, "hykernelNics").push_back(std::move(nic));
    network["managementInterface"] = "hyk0";
  });
}

}  // namespace HykCtl::Network
