#include "network/NetworkChanges.h"

#include <utility>
#include <vector>

#include "network/SearchSuffixes.h"

namespace Tulk {
namespace {

using HostMgr::Network::IpConfig;
using HostMgr::Network::Ipv6Network;

int Ipv4Mode(const IpConfig& ip) {
  return ip.GetDhcp() ? 1 : ip.GetIpv4UseNone() ? 2 : 0;
}

bool Ipv4Differs(const IpConfig& a, const IpConfig& b) {
  if (Ipv4Mode(a) != Ipv4Mode(b)) {
    return true;
  }
  return b.IsIpv4Static() &&
         (a.GetIpv4Address() != b.GetIpv4Address() || a.GetIpv4Netmask() != b.GetIpv4Netmask() ||
          a.GetIpv4Gateway() != b.GetIpv4Gateway());
}

std::vector<std::pair<std::string, int>> StaticNetworks(const IpConfig& ip) {
  std::vector<std::pair<std::string, int>> networks;
  for (const Ipv6Network& network : ip.GetIpv6Networks()) {
    if (network.GetAddressType() == Ipv6Network::kTypeStatic) {
      networks.emplace_back(network.GetStringAddress(), network.GetPrefixLength());
    }
  }
  return networks;
}

bool Ipv6Differs(const IpConfig& a, const IpConfig& b) {
  return a.GetDhcpv6() != b.GetDhcpv6() ||
         a.GetRouterAdvertisement() != b.GetRouterAdvertisement() ||
         StaticNetworks(a) != StaticNetworks(b) || !(a.GetIpv6Gateway() == b.GetIpv6Gateway());
}

bool DnsDiffers(const ManagementSettings& a, const ManagementSettings& b) {
  if (a.ip.GetDnsFromDhcp() != b.ip.GetDnsFromDhcp()) {
    return true;
  }
  return !b.ip.GetDnsFromDhcp() && (a.primaryDns != b.primaryDns ||
                                    a.alternateDns != b.alternateDns || a.hostname != b.hostname);
}

}  // namespace

bool SettingsDiffer(const ManagementSettings& entry, const ManagementSettings& pending) {
  if (!pending.distributedSwitch &&
      (entry.adapters != pending.adapters || entry.vlanId != pending.vlanId)) {
    return true;
  }
  return Ipv4Differs(entry.ip, pending.ip) ||
         (pending.ipv6Enabled && Ipv6Differs(entry.ip, pending.ip)) || DnsDiffers(entry, pending) ||
         SplitSuffixes(entry.suffixes) != SplitSuffixes(pending.suffixes);
}

bool DnsFromDhcpAllowed(const IpConfig& ip, bool ipv6Enabled) {
  return ip.GetDhcp() || (ipv6Enabled && ip.GetDhcpv6());
}

}  // namespace Tulk
