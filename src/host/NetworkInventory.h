#pragma once
/// Queries of the host's network inventory: kernel NICs, portgroups,
/// physical NICs and virtual switches, as plain records.
///
/// Each query makes the host-control objects it needs, copies the answers
/// into the caller's vector (appending to it) and lets the objects go. A
/// host-control failure (HostMgr::Lib::HostMgrException) ends the walk: the
/// query logs its line at error level with the exception's text and returns
/// false; rows gathered before the failure stay in the vector. Other
/// exceptions pass to the caller. No query shows anything on screen.

#include <vector>

#include "host/HykNicInfo.h"
#include "host/PnicRow.h"
#include "host/PortGroupInfo.h"
#include "host/SwitchSummary.h"

namespace Tulk {

/// The filler for every missing inventory text.
inline constexpr char kNotAvailable[] = "N/A";

/// Every kernel NIC of every port set, in the host's order: interface
/// name, MAC text, the name of the switch it is attached to ("N/A" when it
/// is attached to nothing or the name is empty) and its portgroup ("N/A"
/// unless it is attached to a standard-switch portgroup). True also for an
/// empty list. Failure: "Gathering Hykernel NIC list failed: %s".
bool GetKernelNicList(std::vector<HykNicInfo>& nics);

/// Every portgroup of the standard switches: name, switch, and the two
/// numbers of the portgroup row, its active clients and its VLAN id, in
/// decimal. Failure: "Getting physical nics failed: %s" (the wording of the
/// physical NIC query is deliberate).
bool GetPortGroupList(std::vector<PortGroupInfo>& portGroups);

/// Every physical NIC in the host's order, with the switch that uses it
/// looked up in `usage` (empty when none). The NIC is refreshed before its
/// MAC and link are read when it is marked stale. Failure: "Getting
/// physical nics failed: %s".
bool GetPhysicalNicList(std::vector<PnicRow>& pnics, const PnicUsage& usage);

/// Standard switches, then distributed switches, one summary each.
/// Failures: "Scanning virtual switches failed: %s" (standard) and
/// "Scanning dvswitches failed: %s" (distributed).
bool ScanVirtualSwitches(std::vector<SwitchSummary>& switches);

/// Standard switches only. Failure: "Gathering standard virtual switch list
/// failed: %s".
bool GetStandardSwitchList(std::vector<SwitchSummary>& switches);

/// The uplink usage map of a switch scan: each uplink's name to its
/// switch's name.
PnicUsage BuildPnicUsage(const std::vector<SwitchSummary>& switches);

}  // namespace Tulk
