#pragma once
/// What the System Customization menu shows of the management network
/// beside "Configure Management Network": a plain record read from the
/// host in one go.

#include <string>
#include <vector>

namespace Tulk {

struct ManagementNetworkView {
  /// A management kernel NIC exists.
  bool found = false;
  /// The host name (without domain) of "defaultTcpipStack"; "N/A" when it
  /// cannot be read.
  std::string hostname;
  /// The management IPv4 address in dotted form, "0.0.0.0" when none.
  std::string ipv4Address = "0.0.0.0";
  /// The IPv4 configuration comes from DHCP.
  bool dhcp = false;
  /// The management NIC's IPv6 addresses as "address/prefix", in the
  /// host's order (empty when IPv6 is off on the NIC).
  std::vector<std::string> ipv6Addresses;
};

/// Reads the management network. A host-control failure is logged at
/// error level as "Getting management network settings failed: %s" and
/// leaves the fields read so far.
ManagementNetworkView ReadManagementNetworkView();

}  // namespace Tulk
