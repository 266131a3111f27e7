#pragma once
/// The address part of the "Restart Management Network" report.

#include <string>
#include <string_view>

#include "host/ManagementRestart.h"

namespace Tulk {

/// How many IPv6 lines the report shows before it cuts the list with
/// "   ...".
inline constexpr std::size_t kRestartReportIpv6Lines = 2;

/// The text that follows "Starting management network. " in the report,
/// `ipAddressIs` being "IP address is ": unless IPv4 uses DHCP, "\n   "
/// `ipAddressIs` IPv4 address "\n", then one line "   " `ipAddressIs`
/// address "\n" per IPv6 address of address type 0 that is not
/// link-local; two such lines, or all three when there are exactly three,
/// and "   ...\n" when lines are left out.
///
/// Decisions of this implementation:
/// - Under IPv4 DHCP the report lists no address at all, IPv6 included: the
///   restart asks for a new lease, so the addresses read before it say
///   nothing about the ones to come.
/// - Address type 0 is the host's operator-configured (static) kind;
///   addresses the host derives itself (link-layer, autoconfiguration,
///   DHCPv6) are renegotiated by the restart and are not listed.
/// - "Exactly three" counts the addresses that would be printed, not the
///   whole IPv6 list: three printable addresses are shown whole even when
///   the list also holds a link-local one, and four printable ones give
///   two lines and "   ...".
std::string RestartAddressReport(const ManagementIpState& state, std::string_view ipAddressIs);

}  // namespace Tulk
