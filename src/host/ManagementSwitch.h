#pragma once
/// The standard switch behind the management network: its name, the VLAN
/// id of the management portgroup, its uplinks and its NIC teaming policy.
///
/// Each operation is given the management kernel NIC by interface name
/// ("hyk0"), makes the host-control objects it needs and lets them go. Each
/// returns true on success; a failure is logged at error level and gives
/// false. None of them throws.
///
/// Every operation first finds the switch (GetMgmtSwitchName()) and checks
/// that it is a standard switch; any other kind is refused with "Unsupported
/// vSwitch type" and false.
///
/// Failure lines:
/// - GetMgmtSwitchName: "Getting switch name failed: %s"; a NIC attached to
///   nothing or to an unknown kind of point: "Unsupported connectee type";
///   to an opaque network: "Opaque network connectee type not supported";
/// - GetMgmtVlanId: "Getting VlanID failed: %s";
/// - SetMgmtVlanId: "Setting VlanID failed: %s";
/// - GetMaxActiveUplinks: "Getting max number of active uplinks failed: %s";
/// - GetMgmtUplinks: "Getting uplinks failed: %s";
/// - AddMgmtUplink: "Adding uplink %s failed: %s", and for the teaming step
///   "VS: add uplink to teaming policy failed: %s";
/// - RemoveMgmtUplink: "Removing uplink %s failed: %s", and for the teaming
///   step "VS: remove uplink from teaming policy failed: %s";
/// - SetMgmtUplinkOrder: "Setting uplink order failed: %s".
///
/// Decisions of this implementation:
/// - The teaming policy is the switch's own (PortsetImpl): the management
///   portgroup inherits it, and the maximum number of active uplinks read
///   for the window is that policy's.
/// - An adapter that is an uplink of another switch (the operator agreed to
///   take it off its current connection in the adapter list) is moved from
///   that switch to the management switch in one step
///   (PortsetImpl::MoveUplink, which also takes it out of the other
///   switch's uplink order); a standard switch it leaves has its maximum
///   number of active uplinks lowered as for a removal (a failure there is
///   logged with the removal's teaming line and the addition goes on).
/// - Removing lowers the maximum by one, but never below one while uplinks
///   remain and never above the uplinks that remain: taking away a standby
///   adapter must not leave the switch without an active one.
/// - SetMgmtUplinkOrder puts the uplinks in the operator's order (the first
///   selected adapter is the primary one), keeping the maximum.

#include <cstdint>
#include <string>
#include <vector>

namespace Tulk {

/// The name of the switch behind the NIC's connection point (a standard
/// switch's portgroup or a distributed switch's port). A NIC attached to
/// an opaque network or to nothing is refused.
bool GetMgmtSwitchName(const std::string& nic, std::string& name);

/// The VLAN id of the management portgroup (0: none).
bool GetMgmtVlanId(const std::string& nic, std::uint16_t& vlanId);

/// Sets the VLAN id of the management portgroup.
bool SetMgmtVlanId(const std::string& nic, std::uint16_t vlanId);

/// The teaming policy's maximum number of active uplinks.
bool GetMaxActiveUplinks(const std::string& nic, int& count);

/// The switch's uplinks, in the switch's order.
bool GetMgmtUplinks(const std::string& nic, std::vector<std::string>& uplinks);

/// Adds physical NIC `pnic` as an uplink (moving it off another switch when
/// it is an uplink there), then appends it to the teaming policy's uplink
/// order and raises the maximum number of active uplinks by one.
bool AddMgmtUplink(const std::string& nic, const std::string& pnic);

/// Removes uplink `pnic`: it leaves the switch and the uplink order, and
/// the maximum number of active uplinks drops by one (see above).
bool RemoveMgmtUplink(const std::string& nic, const std::string& pnic);

/// Reorders the teaming policy's uplinks: the names of `order` that are
/// uplinks come first, in that order, the other uplinks after them.
bool SetMgmtUplinkOrder(const std::string& nic, const std::vector<std::string>& order);

}  // namespace Tulk
