#pragma once
/// The default gateways of a TCP/IP stack.

#include <string>

#include "platform/api/IpAddress.h"

namespace HykCtl::Network {

/// Reads and sets the default routes of one TCP/IP stack. Every operation
/// may throw HostMgr::Lib::HostMgrException ("Unknown TCP/IP stack <name>"
/// for a stack the host does not have).
class RoutingInfoImpl {
 public:
  /// The routes of the TCP/IP stack `stack`.
  explicit RoutingInfoImpl(std::string stack = "defaultTcpipStack");

  /// The IPv4 default gateway; 0.0.0.0 when none.
  HostMgr::Network::Ipv4Address GetIpv4DefaultGateway() const;
  /// Sets the IPv4 default gateway; 0.0.0.0 removes it.
  void SetIpv4DefaultGateway(const HostMgr::Network::Ipv4Address& gateway);
  /// The IPv6 default gateway (a link-local one carries its interface as
  /// zone); :: when none.
  HostMgr::Network::Ipv6Address GetIpv6DefaultGateway() const;
  /// Sets the IPv6 default gateway; :: removes it.
  void SetIpv6DefaultGateway(const HostMgr::Network::Ipv6Address& gateway);

 private:
  std::string stack_;
};

}  // namespace HykCtl::Network
