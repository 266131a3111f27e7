#include "host/ManagementSettings.h"

#include <syslog.h>

#include <memory>
#include <optional>

#include "host/ManagementNetwork.h"
#include "host/ManagementSwitch.h"
#include "include/Constants.h"
#include "platform/api/DnsConfigImpl.h"
#include "platform/api/HostMgrException.h"
#include "platform/api/NetworkInfoImpl.h"
#include "platform/api/RoutingInfoImpl.h"
#include "runtime/SystemLog.h"

namespace Tulk {
namespace {

using HostMgr::Lib::HostMgrException;

bool ReadNic(ManagementSettings& settings, HykCtl::Network::HykNicImpl& nic) {
  try {
    if (nic.IsStale()) {
      nic.Refresh();
    }
    settings.nic = nic.GetName();
    settings.ip = nic.GetIpConfig();
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Getting ip configuration failed: %s", failure.what());
    return false;
  }
  try {
    std::optional<HykCtl::Network::ConnectionPoint> point = nic.GetConnectionPoint();
    settings.distributedSwitch =
        point && point->GetType() == HykCtl::Network::ConnectionPoint::kDvsPort;
    return true;
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Could not determine if a DVS was in use: %s", failure.what());
    return false;
  }
}

bool ReadSwitch(ManagementSettings& settings) {
  return GetMgmtSwitchName(settings.nic, settings.switchName) &&
         GetMgmtUplinks(settings.nic, settings.adapters) &&
         GetMaxActiveUplinks(settings.nic, settings.maxActiveUplinks) &&
         GetMgmtVlanId(settings.nic, settings.vlanId);
}

bool ReadDns(ManagementSettings& settings) {
  try {
    HykCtl::Network::DnsConfigImpl dns(kDefaultTcpipStack);
    dns.Refresh();
    settings.hostname = dns.GetHostname();
    const std::vector<HostMgr::Network::IpAddress> servers = dns.GetNameServers();
    settings.primaryDns = servers.size() > 0 ? servers[0].GetStringAddress() : "";
    settings.alternateDns = servers.size() > 1 ? servers[1].GetStringAddress() : "";
    settings.suffixes.clear();
    for (const std::string& domain : dns.GetSearchDomains()) {
      settings.suffixes += (settings.suffixes.empty() ? "" : ", ") + domain;
    }
    return true;
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Getting DNS configuration failed: %s", failure.what());
    return false;
  }
}

bool ReadGateways(ManagementSettings& settings) {
  try {
    HykCtl::Network::RoutingInfoImpl routing(kDefaultTcpipStack);
    const HostMgr::Network::Ipv4Address ipv4 = routing.GetIpv4DefaultGateway();
    const HostMgr::Network::Ipv6Address ipv6 = routing.GetIpv6DefaultGateway();
    if (!ipv4.IsZero()) {
      settings.ip.SetIpv4Gateway(ipv4);
    }
    if (!ipv6.IsZero()) {
      settings.ip.SetIpv6Gateway(ipv6);
    }
    return true;
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Getting default gateways failed: %s", failure.what());
    return false;
  }
}

}  // namespace

SettingsRead ReadManagementSettings(ManagementSettings& settings) {
  try {
    settings.ipv6Enabled = HykCtl::Network::NetworkInfoImpl().IsHykIpv6Enabled();
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Getting IPv6 state failed: %s", failure.what());
    return SettingsRead::kFailed;
  }
  std::unique_ptr<HykCtl::Network::HykNicImpl> nic = GetManagementInterface();
  if (!nic) {
    return SettingsRead::kNoInterface;
  }
  if (!ReadNic(settings, *nic)) {
    return SettingsRead::kFailed;
  }
  if (!settings.distributedSwitch && !ReadSwitch(settings)) {
    return SettingsRead::kFailed;
  }
  if (!ReadDns(settings) || !ReadGateways(settings)) {
    return SettingsRead::kFailed;
  }
  return SettingsRead::kRead;
}

}  // namespace Tulk
