#pragma once
/// The management interface as "Restart Management Network" sees it: its
/// addresses before the restart, and the restart itself. Nothing here
/// throws.

#include <optional>
#include <string>
#include <vector>

namespace Tulk {

/// One IPv6 address of the management NIC.
struct ManagementIpv6Address {
  /// The address text without prefix length.
  std::string address;
  /// Configured by the operator (a static address), rather than derived by
  /// the host (link-layer, autoconfiguration, DHCPv6).
  bool operatorConfigured = false;
  /// Of link-local scope.
  bool linkLocal = false;
};

/// The management NIC's IP configuration as plain values.
struct ManagementIpState {
  /// The interface name, such as "hyk0".
  std::string interfaceName;
  /// IPv4 comes from DHCP.
  bool dhcp = false;
  /// The IPv4 address ("0.0.0.0" when none).
  std::string ipv4Address;
  /// Every IPv6 address of the NIC, in the host's order.
  std::vector<ManagementIpv6Address> ipv6;
};

/// Reads the management NIC's IP configuration (the NIC is refreshed first
/// when it is marked stale). Without a management NIC it logs "Could not
/// locate the management interface" at error level; a host-control failure
/// logs "Reading the management IP configuration failed: %s" at error
/// level. Both give nullopt.
std::optional<ManagementIpState> ReadManagementIpState();

/// Stops and starts the kernel NIC `interfaceName` as one host operation
/// (HykNicImpl::Restart: interface down, then up; a NIC on DHCP asks for
/// its lease again). A failure logs "Restarting %s failed: %s" at error
/// level and gives false.
bool RestartManagementInterface(const std::string& interfaceName);

}  // namespace Tulk
