#pragma once
/// The pieces of the network test's report and commands, as plain text.

#include <string>
#include <string_view>

#include "host/NetworkTestTargets.h"

namespace Tulk {

/// The zone a ping target gets: "%" and `interfaceName` for an IPv6
/// link-local address typed without a zone, when the interface is known;
/// empty otherwise (a zone the operator typed is kept as the only one).
std::string ZoneSuffix(const PingTarget& target, const std::string& interfaceName);

/// The ping command: "/bin/hykping -c 3 -I <interface> <address>", without
/// "-I <interface>" when `interfaceName` is empty.
std::string PingCommand(const std::string& interfaceName, const std::string& address);

/// "%s #%d (%s%s)." with `pinging` ("Pinging address"), `number` (the
/// input's own number, 1 to 3), the address and its zone suffix.
std::string PingingLine(std::string_view pinging, int number, const std::string& address,
                        const std::string& zone);

/// A check's verdict, right-aligned and ending the line:
/// "{align:right}" `verdict` "{/align}\n".
std::string VerdictLine(std::string_view verdict);

}  // namespace Tulk
