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

/// The demo host after its management network was moved onto a distributed
/// switch, "DSwitch-Lab" (uplinks hynic0, hynic1 and hynic3), and then
/// misconfigured: hyk0 sits on port 12, whose only uplink, hynic3, has no
/// link, so the management network passes no traffic until it is repaired
/// ("Restore DVS") or moved to a standard switch ("Restore Standard
/// Switch"). vSwitch0 and "Management Network" are gone; vSwitch1 with "VM
/// Network" stays.
nlohmann::json DistributedSwitchDemoHostState();

}  // namespace Sim
