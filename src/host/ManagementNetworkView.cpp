#include "host/ManagementNetworkView.h"

#include <syslog.h>

#include "host/ManagementNetwork.h"
#include "platform/api/HostMgrException.h"
#include "runtime/SystemLog.h"

namespace Tulk {

ManagementNetworkView ReadManagementNetworkView() {
  ManagementNetworkView view;
  view.hostname = GetHostName();
  std::unique_ptr<HykCtl::Network::HykNicImpl> nic = GetManagementInterface();
  if (!nic) {
    return view;
  }
  view.found = true;
  try {
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

}  // namespace Tulk
