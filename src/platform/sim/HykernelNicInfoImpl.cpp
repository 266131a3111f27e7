#include "platform/api/HykernelNicInfoImpl.h"

#include <cstdio>

#include "platform/sim/SimState.h"

namespace HykCtl::Network {
namespace {

const char kClass[] = "HykCtl::Network::HykernelNicInfoImpl::";

// The names of the standard or distributed switch at `selector` (1-based
// over all switches, standard ones first); empty for 0.
std::string SwitchAt(const Sim::json& state, int selector) {
  if (selector <= 0) {
    return "";
  }
  const Sim::json& switches = Sim::ArrayAt(Sim::ObjectAt(state, "network"), "switches");
  int position = 0;
  for (const char* type : {"standard", "distributed"}) {
    for (const Sim::json& vswitch : switches) {
      if (Sim::StringAt(vswitch, "type", "standard") == type && ++position == selector) {
        return Sim::StringAt(vswitch, "name");
      }
    }
  }
  Sim::Fail("No port set " + std::to_string(selector));
}

}  // namespace

std::vector<HykNicImpl> HykernelNicInfoImpl::GetHykernelNics(int portsetSelector) const {
  const Sim::json& state = Sim::Query(std::string(kClass) + "GetHykernelNics");
  const std::string only = SwitchAt(state, portsetSelector);
  std::vector<std::string> names;
  for (const Sim::json& nic : Sim::ArrayAt(Sim::ObjectAt(state, "network"), "hykernelNics")) {
    const Sim::json& connection = Sim::ObjectAt(nic, "connection");
    if (only.empty() || Sim::StringAt(connection, "switch") == only) {
      names.push_back(Sim::StringAt(nic, "name"));
    }
  }
  std::vector<HykNicImpl> nics;
  nics.reserve(names.size());
  for (const std::string& name : names) {
    nics.emplace_back(name);
  }
  return nics;
}

std::string HykernelNicInfoImpl::AddHykernelNic(const std::string& portGroup) {
  std::string created;
  Sim::Change(std::string(kClass) + "AddHykernelNic", [&](Sim::json& state) {
    const Sim::json& group = Sim::RequirePortGroup(state, portGroup);
    Sim::json& nics = Sim::ArrayFor(Sim::ObjectFor(state, "network"), "hykernelNics");
    int number = 0;
    while (Sim::FindByName(nics, "hyk" + std::to_string(number)) != nullptr) {
      ++number;
    }
    created = "hyk" + std::to_string(number);
    char mac[18];
    std::snprintf(mac, sizeof mac, "00:50:5a:%02x:%02x:%02x", 0x60 + (number & 0x0f),
                  (number * 37) & 0xff, (number * 101 + 7) & 0xff);
    nics.push_back(
        {{"name", created},
         {"mac", mac},
         {"enabled", true},
         {"connection",
          {{"type", "portgroup"}, {"switch", group["switch"]}, {"portGroup", portGroup}}},
         {"ipv4", {{"mode", "dhcp"}}},
         {"dhcpLease", nullptr},
         {"ipv6", {{"enabled", false}, {"networks", Sim::json::array()}}}});
  });
  return created;
}

void HykernelNicInfoImpl::RemoveHykernelNic(const std::string& name) {
  Sim::Change(std::string(kClass) + "RemoveHykernelNic", [&](Sim::json& state) {
    Sim::RequireKernelNic(state, name);
    Sim::json& network = state["network"];
    if (Sim::StringAt(network, "managementInterface") == name) {
      Sim::Fail("Cannot remove the management interface " + name);
    }
    Sim::json& nics = network["hykernelNics"];
    for (auto it = nics.begin(); it != nics.end(); ++it) {
      if (Sim::StringAt(*it, "name") == name) {
        nics.erase(it);
        break;
      }
    }
  });
}

}  // namespace HykCtl::Network
