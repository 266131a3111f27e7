#pragma once
/// Creating standard switches and portgroups and moving a kernel NIC to a
/// portgroup, for the network restore options. Each change logs what it
/// does and returns a HostOutcome; nothing here throws.

#include <string>
#include <vector>

#include "host/HostOutcome.h"
#include "host/PnicRow.h"

namespace Tulk {

/// Whether a virtual switch (standard or distributed) named `name` exists.
/// A host-control failure counts as "exists", so that a name is never
/// offered as free when the host could not be asked.
bool VirtualSwitchNameTaken(const std::string& name);

/// Whether a portgroup named `name` exists (same failure rule).
bool PortGroupNameTaken(const std::string& name);

/// The management kernel NIC's name; empty when the host has none.
std::string ReadManagementInterfaceName();

/// The physical NICs no switch uses as an uplink, in the host's order.
/// Failures are logged by the inventory queries; what was read is kept.
std::vector<PnicRow> ReadFreePhysicalNics();

/// Creates the standard switch `name` with the library's default number of
/// ports and, when `uplink` is not empty, that uplink as its one active
/// uplink. Logs "Creating standard virtual switch %s" (with " with uplink
/// %s" when there is one) at informational level. A failure logs "Creating
/// standard virtual switch %s failed: %s" at error level; a switch made
/// before the uplink failed is removed again, so a failure leaves nothing
/// behind.
HostOutcome CreateStandardSwitch(const std::string& name, const std::string& uplink);

/// Adds portgroup `name` with VLAN `vlanId` (0 none, 1..4094, 4095 every
/// VLAN) to the standard switch `switchName`. Logs "Creating portgroup %s
/// on %s with VLAN %d" at informational level; a failure logs "Creating
/// portgroup %s failed: %s" at error level.
HostOutcome CreatePortGroup(const std::string& name, const std::string& switchName, int vlanId);

/// Connects the kernel NIC `nic` to the standard-switch portgroup
/// `portGroup`. Logs "Migrating %s to portgroup %s" at informational
/// level; a failure logs "Migrating %s to portgroup %s failed: %s" at
/// error level.
HostOutcome MigrateKernelNic(const std::string& nic, const std::string& portGroup);

}  // namespace Tulk
