#pragma once
/// What the System Customization menu shows of the management network
/// beside "Configure Management Network": a plain record read from the
/// host in one go.

#include <string>
#include <vector>

namespace Tulk {

class StringFactory;

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

/// The description pane text of "Configure Management Network" for the
/// view (GeneralWindow.h describes the arrangement), with the labels from
/// `strings` ("Hostname" 42, "IPv4 Address" 37, "Not set" 120, the DHCP
/// line 33, "IPv6 Addresses" 38) and ending with description 25. Values
/// are indented by two blanks when that still fits in `width` columns (a
/// long IPv6 address on a narrow screen starts at the left edge instead of
/// wrapping away from its indent).
std::string FormatManagementNetworkView(const ManagementNetworkView& view, StringFactory& strings,
                                        int width);

}  // namespace Tulk
