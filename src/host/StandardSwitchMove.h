#pragma once
/// Moving the management network off a distributed switch onto a new
/// standard switch ("Restore Standard Switch"). Nothing here throws.

#include <functional>
#include <string>

namespace Tulk {

/// The first name `prefix` followed by a decimal number that is not taken,
/// trying the number `first`, then `first` + 1 and so on; `taken` tells
/// whether a name is in use.
std::string FirstFreeName(const std::string& prefix, int first,
                          const std::function<bool(const std::string&)>& taken);

/// The new standard switch's name: "vSwitch0" unless taken, else the first
/// free "vSwitch%d" from 1.
std::string FirstFreeSwitchName(const std::function<bool(const std::string&)>& taken);

/// The new portgroup's name: the first free "Management Network%d" from 1.
std::string FirstFreeManagementPortGroupName(const std::function<bool(const std::string&)>& taken);

/// Moves the management network onto a new standard switch:
/// 1. finds the management kernel NIC and the distributed switch it sits
///    on ("Could not find the management network" at error level, and
///    nothing changes, when either is missing);
/// 2. creates the first free "vSwitch%d" with the library's default number
///    of ports and adds the first free "Management Network%d" to it;
/// 3. takes every kernel NIC out of service, connects the management NIC to
///    the new portgroup, moves the distributed switch's uplinks one by one
///    in the switch's order, each added to the new switch's teaming order as
///    an active uplink ("Moving uplink %s failed: %s" and "VS: add uplink
///    to teaming policy failed: %s" at error level, the next uplink is
///    tried), and brings the management NIC into service again.
/// Any other host-control failure logs "Changing to legacy virtual switch
/// failed: %s" at error level and ends the move where it stands. Returns
/// true when the management NIC was connected to the new portgroup and is
/// in service again.
///
/// Decision of this implementation: every moved uplink is active (the
/// teaming maximum follows the number of uplinks), as they were all carrying
/// the distributed switch's traffic.
bool MoveManagementToNewStandardSwitch();

}  // namespace Tulk
