#pragma once
/// The management network's settings as one plain record, and the read of
/// them that "Configure Management Network" starts with.

#include <cstdint>
#include <string>
#include <vector>

#include "platform/api/IpConfig.h"

namespace Tulk {

/// Everything the management network window shows and changes. The window
/// keeps two: the settings read on entry and the pending ones its dialogs
/// edit.
struct ManagementSettings {
  /// The management kernel NIC's interface name ("hyk0").
  std::string nic;
  /// IPv6 in the hypervisor kernel (a change takes effect at the next boot).
  bool ipv6Enabled = false;
  /// The NIC's IP configuration: IPv4 mode, address, netmask and default
  /// gateway; the IPv6 switches, addresses and default gateway; whether DNS
  /// comes from DHCP (the DNS dialog's "automatic").
  HostMgr::Network::IpConfig ip;
  /// The NIC is attached to a distributed switch: adapters and VLAN are
  /// neither read nor written.
  bool distributedSwitch = false;
  /// The standard switch holding the management portgroup.
  std::string switchName;
  /// The switch's uplinks in order; the first is the primary adapter.
  std::vector<std::string> adapters;
  /// The teaming policy's maximum number of active uplinks.
  int maxActiveUplinks = 0;
  /// The management portgroup's VLAN id; 0 means no VLAN.
  std::uint16_t vlanId = 0;
  /// The host name (a name with a dot is written as a qualified name).
  std::string hostname;
  /// The primary and the second name server as address text; empty for
  /// none.
  std::string primaryDns;
  std::string alternateDns;
  /// The search suffixes: read as the host's list joined with ", ", then as
  /// the operator typed them (blanks or commas between names).
  std::string suffixes;
};

/// How the read ended.
enum class SettingsRead {
  /// Every value was read.
  kRead,
  /// The host has no management kernel NIC; only the IPv6 flag was read.
  kNoInterface,
  /// A read failed (logged); the record is incomplete.
  kFailed,
};

/// Reads the settings in this order: the kernel's IPv6 flag; the management
/// NIC; its IP configuration (refreshed first when stale); unless it sits
/// on a distributed switch, the switch's name, uplinks, maximum number of
/// active uplinks and VLAN id (host/ManagementSwitch.h); the host name and
/// name servers of "defaultTcpipStack" (after a refresh); the IPv4 and
/// IPv6 default gateways; the search suffixes.
///
/// The default gateways are the kernel's (RoutingInfoImpl); when the kernel
/// has none, the NIC's own stays in `ip`. The name servers are those in
/// use (the DHCP ones while DNS comes from DHCP); a third one and beyond
/// are not shown and not kept.
///
/// Failure lines, at error level: "Getting IPv6 state failed: %s", "Getting
/// ip configuration failed: %s", "Could not determine if a DVS was in use:
/// %s", those of the switch operations, "Getting DNS configuration failed:
/// %s", "Getting default gateways failed: %s". Nothing throws.
SettingsRead ReadManagementSettings(ManagementSettings& settings);

}  // namespace Tulk
