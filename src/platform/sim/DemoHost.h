#pragma once
/// The built-in demo host: the state the simulated host starts from when
/// no state file is named (see SimHost.h), and what
/// "tulk-hosttool --demo-state" prints.

#include <nlohmann/json.hpp>

namespace Sim {

/// A realistic host: two processor packages, 64 GiB, four physical NICs
/// (two up), vSwitch0 with "Management Network" on two uplinks, vSwitch1
/// with "VM Network", hyk0 with a static IPv4 address and IPv6 addresses of
/// several types, DNS servers and search domains, one running virtual
/// machine, lockdown off and possible, keyboard "US Default", the
/// operations agent at version 3.
nlohmann::json DemoHostState();

}  // namespace Sim
