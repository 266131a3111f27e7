#pragma once
/// The IP configuration of a kernel NIC: IPv4 mode and addresses, IPv6
/// switches, networks and gateway, and whether DNS comes from DHCP.

#include <vector>

#include "platform/api/IpAddress.h"
#include "platform/api/Ipv6Network.h"

namespace HostMgr::Network {

/// A plain value: reading it from a NIC (HykNicImpl::GetIpConfig) copies
/// the NIC's settings, changing it changes nothing until it is handed back
/// (HykNicImpl::SetIpConfig).
///
/// IPv4 is in exactly one of three modes: none (switched off), DHCP, or
/// static. SetDhcp(true) and SetIpv4UseNone(true) each clear the other;
/// static is neither. The static address, netmask and gateway are kept
/// whatever the mode, so a switch back to static finds them again. For a
/// NIC on DHCP, GetIpv4Address/Netmask/Gateway report the leased values
/// (0.0.0.0 without a lease).
class IpConfig {
 public:
  // IPv4.
  /// IPv4 is switched off on the NIC.
  bool GetIpv4UseNone() const { return ipv4None_; }
  /// Switches IPv4 off (true, clearing DHCP) or back on (false).
  void SetIpv4UseNone(bool none);
  /// The IPv4 configuration comes from DHCP.
  bool GetDhcp() const { return dhcp_; }
  /// Switches DHCP on (clearing "none") or off.
  void SetDhcp(bool dhcp);
  /// Neither none nor DHCP.
  bool IsIpv4Static() const { return !ipv4None_ && !dhcp_; }
  /// The IPv4 address, netmask and gateway (0.0.0.0 when none). The
  /// setters change the static values.
  const Ipv4Address& GetIpv4Address() const { return ipv4Address_; }
  void SetIpv4Address(const Ipv4Address& address) { ipv4Address_ = address; }
  const Ipv4Address& GetIpv4Netmask() const { return ipv4Netmask_; }
  void SetIpv4Netmask(const Ipv4Address& netmask) { ipv4Netmask_ = netmask; }
  const Ipv4Address& GetIpv4Gateway() const { return ipv4Gateway_; }
  void SetIpv4Gateway(const Ipv4Address& gateway) { ipv4Gateway_ = gateway; }

  // IPv6.
  /// IPv6 is switched on for this NIC.
  bool GetIpv6Enabled() const { return ipv6Enabled_; }
  void SetIpv6Enabled(bool enabled) { ipv6Enabled_ = enabled; }
  /// Addresses are leased from a DHCPv6 server.
  bool GetDhcpv6() const { return dhcpv6_; }
  void SetDhcpv6(bool dhcpv6) { dhcpv6_ = dhcpv6; }
  /// Addresses are configured from router advertisements.
  bool GetRouterAdvertisement() const { return routerAdvertisement_; }
  void SetRouterAdvertisement(bool enabled) { routerAdvertisement_ = enabled; }
  /// Every IPv6 address of the NIC, in the host's order: static ones and
  /// the ones the host derived or leased (see Ipv6Network's types).
  const std::vector<Ipv6Network>& GetIpv6Networks() const { return ipv6Networks_; }
  /// Appends `network` unless an equal address is already present.
  void AddIpv6Network(const Ipv6Network& network);
  /// Removes the entry with the same address; false when there was none.
  bool RemoveIpv6Network(const Ipv6Address& address);
  /// Removes every entry of type Ipv6Network::kTypeStatic.
  void ClearStaticIpv6Networks();
  /// The NIC's IPv6 gateway; :: when none. May carry a zone.
  const Ipv6Address& GetIpv6Gateway() const { return ipv6Gateway_; }
  void SetIpv6Gateway(const Ipv6Address& gateway) { ipv6Gateway_ = gateway; }

  // DNS.
  /// Name servers and host name are taken from DHCP (only effective while
  /// IPv4 DHCP or DHCPv6 is in use).
  bool GetDnsFromDhcp() const { return dnsFromDhcp_; }
  void SetDnsFromDhcp(bool fromDhcp) { dnsFromDhcp_ = fromDhcp; }

  /// Every field equal (the console's "changed" test).
  bool operator==(const IpConfig& other) const = default;

 private:
  bool ipv4None_ = false;
  bool dhcp_ = false;
  Ipv4Address ipv4Address_;
  Ipv4Address ipv4Netmask_;
  Ipv4Address ipv4Gateway_;
  bool ipv6Enabled_ = false;
  bool dhcpv6_ = false;
  bool routerAdvertisement_ = false;
  std::vector<Ipv6Network> ipv6Networks_;
  Ipv6Address ipv6Gateway_;
  bool dnsFromDhcp_ = false;
};

}  // namespace HostMgr::Network
