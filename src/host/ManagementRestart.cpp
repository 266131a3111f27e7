#include "host/ManagementRestart.h"

#include <syslog.h>

#include "host/ManagementNetwork.h"
#include "platform/api/HostMgrException.h"
#include "platform/api/HykNicImpl.h"
#include "runtime/SystemLog.h"

namespace Tulk {

using HostMgr::Lib::HostMgrException;
using HostMgr::Network::Ipv6Network;

std::optional<ManagementIpState> ReadManagementIpState() {
  std::unique_ptr<HykCtl::Network::HykNicImpl> nic = GetManagementInterface();
  if (!nic) {
    Log(LOG_ERR, "Could not locate the management interface");
    return std::nullopt;
  }
  try {
    if (nic->IsStale()) {
      nic->Refresh();
    }
    const HostMgr::Network::IpConfig config = nic->GetIpConfig();
    ManagementIpState state;
    state.interfaceName = nic->GetName();
    state.dhcp = config.GetDhcp();
    state.ipv4Address = config.GetIpv4Address().GetStringAddress();
    for (const Ipv6Network& network : config.GetIpv6Networks()) {
      state.ipv6.push_back({network.GetStringAddress(),
                            network.GetAddressType() == Ipv6Network::kTypeStatic,
                            network.GetScope() == Ipv6Network::kScopeLinkLocal});
    }
    return state;
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Reading the management IP configuration failed: %s", failure.what());
    return std::nullopt;
  }
}

bool RestartManagementInterface(const std::string& interfaceName) {
  try {
    HykCtl::Network::HykNicImpl(interfaceName).Restart();
    return true;
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Restarting %s failed: %s", interfaceName.c_str(), failure.what());
    return false;
  }
}

}  // namespace Tulk
