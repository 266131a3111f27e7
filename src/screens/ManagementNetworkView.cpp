#include "screens/ManagementNetworkView.h"

#include <syslog.h>

#include "host/ManagementNetwork.h"
#include "include/Constants.h"
#include "platform/api/DnsConfigImpl.h"
#include "platform/api/HostMgrException.h"
#include "render/StringFactory.h"
#include "runtime/SystemLog.h"

namespace Tulk {

ManagementNetworkView ReadManagementNetworkView() {
  ManagementNetworkView view;
  view.hostname = "N/A";
  try {
    view.hostname = HykCtl::Network::DnsConfigImpl(kDefaultTcpipStack).GetHostname();
    std::unique_ptr<HykCtl::Network::HykNicImpl> nic = GetManagementInterface();
    if (!nic) {
      return view;
    }
    view.found = true;
    if (nic->IsStale()) {
      nic->Refresh();
    }
    const HostMgr::Network::IpConfig config = nic->GetIpConfig();
    view.dhcp = config.GetDhcp();
    view.ipv4Address = config.GetIpv4Address().GetStringAddress();
    if (config.GetIpv6Enabled()) {
      for (const HostMgr::Network::Ipv6Network& network : config.GetIpv6Networks()) {
        view.ipv6Addresses.push_back(network.ToString());
      }
    }
  } catch (const HostMgr::Lib::HostMgrException& error) {
    Log(LOG_ERR, "Getting management network settings failed: %s", error.what());
  }
  return view;
}

std::string FormatManagementNetworkView(const ManagementNetworkView& view, StringFactory& strings,
                                        int width) {
  std::string description = strings.GetString(25);
  if (!view.found) {
    return description;
  }
  auto label = [&](std::uint32_t id) { return std::string(strings.GetString(id)) + ":\n"; };
  auto value = [width](const std::string& text) {
    const bool fits = static_cast<int>(text.size()) + 2 <= width;
    return std::string(fits ? "  " : "") + "{color:white}" + text + "{/color}\n";
  };
  std::string text = label(42) + value(view.hostname) + "\n";
  text +=
      label(37) + value(view.ipv4Address == "0.0.0.0" ? strings.GetString(120) : view.ipv4Address);
  if (view.dhcp) {
    text += std::string(strings.GetString(33)) + "\n";
  }
  if (!view.ipv6Addresses.empty()) {
    text += "\n" + label(38);
    for (const std::string& address : view.ipv6Addresses) {
      text += value(address);
    }
  }
  return text + "\n" + description;
}

}  // namespace Tulk
