#pragma once
/// The right half of the management network window: one description per
/// entry, built from the pending settings (markup, labels from the
/// catalogue `strings`).
///
/// - Adapters: in white one line per adapter, "name (hardware label)"
///   (the MAC address when the NIC has no label; "No adapter" for none),
///   an empty line, the description in light grey.
/// - VLAN: "{color:white}%s\n\n{/color}{color:light-grey}%s{/color}" with
///   the id, or "Not set" for 0.
/// - IPv4: "{color:white}%s\n\n%s: %s\n%s: %s\n%s: %s\n\n{/color}
///   {color:light-grey}%s{/color}" (one text) with the mode, then address,
///   subnet mask and default gateway ("Not set" for 0.0.0.0).
/// - IPv6: see DescribeIpv6().
/// - DNS: "{color:white}%s\n\n%s:\n%s\n%s:\n%s\n\n%s\n%s\n\n{/color}
///   {color:light-grey}%s{/color}" (one text), see DescribeDns().
/// - Suffixes: "{color:white}%s\n\n{/color}{color:light-grey}%s{/color}"
///   with the names joined with ", ", or "Not set".
///
/// Mode words: "Automatic" (DHCP), "None" (IPv4 off), "Manual" (static).

#include <cstdint>
#include <string>
#include <vector>

#include "host/ManagementSettings.h"
#include "host/PnicRow.h"

namespace Tulk {

class StringFactory;

/// The most IPv6 addresses the description lists; a longer list shows
/// these, then "...".
inline constexpr std::size_t kShownIpv6Addresses = 4;

std::string DescribeAdapters(const std::vector<std::string>& adapters,
                             const std::vector<PnicRow>& pnics, StringFactory& strings);
std::string DescribeVlan(std::uint16_t vlanId, StringFactory& strings);
std::string DescribeIpv4(const HostMgr::Network::IpConfig& ip, StringFactory& strings);

/// White "IPv6 is enabled." or "IPv6 is disabled." (the pending flag),
/// an empty line, then:
/// - IPv6 to be off: in light grey, that a restart is needed to enable or
///   disable IPv6;
/// - IPv6 just switched on (`enabledOnEntry` false): in light grey, that
///   IPv6 comes with the next reboot;
/// - otherwise, in white, the mode ("Automatic (Router advertised)",
///   "Automatic (DHCP)" for DHCPv6, "Manual" for static), an empty line,
///   "IPv6 Addresses:" with one "address/prefix" per line in the host's
///   order (at most kShownIpv6Addresses, then "..."; "Not set" for none),
///   an empty line, "Default Gateway:" and the gateway (with its zone) or
///   "Not set", an empty line, and the description in light grey.
std::string DescribeIpv6(bool enabled, bool enabledOnEntry, const HostMgr::Network::IpConfig& ip,
                         StringFactory& strings);

/// Mode ("Automatic" when DNS comes from DHCP, else "Manual"), "Primary DNS
/// Server" and the second server's label (SecondServerLabel()) with their
/// addresses or "Not set", "Hostname" and the host name.
std::string DescribeDns(const ManagementSettings& settings, StringFactory& strings);
std::string DescribeSuffixes(const std::string& suffixes, StringFactory& strings);

}  // namespace Tulk
