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
/// `ipAddressIs` being "IP address is ":
/// - on IPv4 DHCP: nothing (the restart asks for a new lease, so the
///   addresses read before it say nothing about the ones to come);
/// - otherwise "\n   " `ipAddressIs` IPv4 address "\n", then one line
///   "   " `ipAddressIs` address "\n" per IPv6 address the operator
///   configured that is not link-local (addresses the host derives itself
///   are renegotiated by the restart and are not listed). Two such lines
///   are shown, or all three when there are exactly three; when lines are
///   left out, "   ...\n" follows.
std::string RestartAddressReport(const ManagementIpState& state, std::string_view ipAddressIs);

}  // namespace Tulk
