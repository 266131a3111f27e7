#pragma once
/// What counts as a change of the management network's settings.

#include "host/ManagementSettings.h"

namespace Tulk {

/// Whether the pending settings differ in effect from those read on entry,
/// the kernel's IPv6 flag aside (the window asks about that one on its
/// own). Only what the apply would write counts:
/// - adapters (in order) and VLAN id, unless on a distributed switch;
/// - the IPv4 mode, and for a static mode address, netmask and gateway (a
///   DHCP or switched-off IPv4 keeps its old static values unused);
/// - while IPv6 is to be on: the DHCPv6 and router-advertisement flags,
///   the static addresses (address and prefix) and the IPv6 gateway;
/// - whether DNS comes from DHCP, and when it does not: both name servers
///   and the host name;
/// - the search suffixes as names (separators do not count).
/// So a dialog confirmed without an edit, or an edit undone by hand, is no
/// change.
bool SettingsDiffer(const ManagementSettings& entry, const ManagementSettings& pending);

/// Whether DNS may come from DHCP with this IP configuration: only when it
/// is itself automatic, by IPv4 DHCP or (with IPv6 on) DHCPv6.
bool DnsFromDhcpAllowed(const HostMgr::Network::IpConfig& ip, bool ipv6Enabled);

}  // namespace Tulk
