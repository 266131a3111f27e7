#include "host/NetworkTestTargets.h"

#include <syslog.h>

#include <algorithm>

#include "host/ManagementNetwork.h"
#include "include/Constants.h"
#include "platform/api/DnsConfigImpl.h"
#include "platform/api/HostMgrException.h"
#include "platform/api/IpAddress.h"
#include "platform/api/NetworkInfoImpl.h"
#include "platform/api/RoutingInfoImpl.h"
#include "runtime/SystemLog.h"

namespace Tulk {
namespace {

using HostMgr::Network::IpAddress;

bool IsUsable(const std::string& address) {
  if (address.empty()) {
    return false;
  }
  std::unique_ptr<IpAddress> parsed = IpAddress::Parse(address);
  return parsed != nullptr && !parsed->IsZero();
}

}  // namespace

std::vector<std::string> OrderPingTargets(const KnownTestAddresses& known) {
  std::vector<std::string> candidates = {known.ipv4Gateway};
  for (const KnownTestAddresses::NameServer& server : known.nameServers) {
    if (!server.ipv6) {
      candidates.push_back(server.address);
    }
  }
  if (known.ipv6Enabled) {
    candidates.push_back(known.ipv6Gateway);
    for (const KnownTestAddresses::NameServer& server : known.nameServers) {
      if (server.ipv6) {
        candidates.push_back(server.address);
      }
    }
  }
  std::vector<std::string> targets;
  for (const std::string& candidate : candidates) {
    if (targets.size() == kPingTargetCount) {
      break;
    }
    if (IsUsable(candidate) &&
        std::find(targets.begin(), targets.end(), candidate) == targets.end()) {
      targets.push_back(candidate);
    }
  }
  return targets;
}

std::string TestHostName(const std::string& hostName, const std::string& domain) {
  return domain.empty() ? hostName : hostName + "." + domain;
}

NetworkTestDefaults ReadNetworkTestDefaults() {
  NetworkTestDefaults defaults;
  KnownTestAddresses known;
  try {
    if (std::unique_ptr<HykCtl::Network::HykNicImpl> nic = GetManagementInterface()) {
      defaults.interfaceName = nic->GetName();
    }
    HykCtl::Network::RoutingInfoImpl routing(kDefaultTcpipStack);
    known.ipv4Gateway = routing.GetIpv4DefaultGateway().GetStringAddress();
    HykCtl::Network::DnsConfigImpl dns(kDefaultTcpipStack);
    for (const IpAddress& server : dns.GetNameServers()) {
      known.nameServers.push_back({server.GetStringAddress(), server.IsIpv6()});
    }
    known.ipv6Enabled = HykCtl::Network::NetworkInfoImpl().IsHykIpv6Enabled();
    if (known.ipv6Enabled) {
      known.ipv6Gateway = routing.GetIpv6DefaultGateway().GetStringAddress();
    }
    defaults.hostName = TestHostName(dns.GetHostname(), dns.GetDomain());
  } catch (const HostMgr::Lib::HostMgrException& failure) {
    Log(LOG_ERR, "Reading the network test defaults failed: %s", failure.what());
  }
  defaults.pingTargets = OrderPingTargets(known);
  return defaults;
}

std::optional<PingTarget> ParsePingTarget(const std::string& text) {
  std::unique_ptr<IpAddress> parsed = IpAddress::Parse(text);
  if (parsed == nullptr) {
    return std::nullopt;
  }
  PingTarget target;
  target.address = text;
  target.zoned = text.find('%') != std::string::npos;
  if (parsed->IsIpv6()) {
    target.linkLocal = static_cast<const HostMgr::Network::Ipv6Address&>(*parsed).IsLinkLocal();
  }
  return target;
}

}  // namespace Tulk
