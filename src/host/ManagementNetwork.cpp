#include "host/ManagementNetwork.h"

#include <syslog.h>

#include "host/NetworkInventory.h"
#include "include/Constants.h"
#include "platform/api/DnsConfigImpl.h"
#include "platform/api/HostMgrException.h"
#include "platform/api/NetworkInfoImpl.h"
#include "runtime/SystemLog.h"

namespace Tulk {

using HostMgr::Lib::HostMgrException;

std::unique_ptr<HykCtl::Network::HykNicImpl> GetManagementInterface() {
  try {
    HykCtl::Network::NetworkInfoImpl info;
    info.UpdateManagementInterface();
    return info.GetManagementInterface();
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Getting management interface failed: %s", failure.what());
    return nullptr;
  }
}

std::string GetManagementIpv4Address() {
  std::string address = "0.0.0.0";
  std::unique_ptr<HykCtl::Network::HykNicImpl> nic = GetManagementInterface();
  if (!nic) {
    return address;
  }
  try {
    if (nic->IsStale()) {
      nic->Refresh();
    }
    address = nic->GetIpConfig().GetIpv4Address().GetStringAddress();
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Getting management IPv4 address failed: %s", failure.what());
  }
  return address;
}

bool IsManagementInterfaceUp() {
  std::unique_ptr<HykCtl::Network::HykNicImpl> nic = GetManagementInterface();
  if (!nic) {
    return false;
  }
  try {
    return nic->IsEnabled();
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Getting management interface state failed: %s", failure.what());
    return false;
  }
}

std::string GetHostName() {
  try {
    return HykCtl::Network::DnsConfigImpl(kDefaultTcpipStack).GetHostname();
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Getting host name failed: %s", failure.what());
    return kNotAvailable;
  }
}

std::string GetHostFqdn() {
  try {
    HykCtl::Network::DnsConfigImpl dns(kDefaultTcpipStack);
    return dns.GetHostname() + "." + dns.GetDomain();
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Getting host name failed: %s", failure.what());
    return kNotAvailable;
  }
}

bool IsManagementOnDistributedSwitch() {
  std::unique_ptr<HykCtl::Network::HykNicImpl> nic = GetManagementInterface();
  if (!nic) {
    Log(LOG_ERR, "Could not locate the management interface");
    return false;
  }
  try {
    std::optional<HykCtl::Network::ConnectionPoint> point = nic->GetConnectionPoint();
    return point && point->GetType() == HykCtl::Network::ConnectionPoint::kDvsPort;
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Could not determine if a DVS was in use: %s", failure.what());
    return false;
  }
}

}  // namespace Tulk
