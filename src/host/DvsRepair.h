#pragma once
/// Repairing the distributed-switch port of the management network
/// ("Restore DVS"): a new host-local port with the operator's VLAN and
/// uplinks, cloned from the management NIC's port, and the management NIC
/// moved onto it. Nothing here throws.

#include <optional>
#include <string>
#include <vector>

#include "host/HostOutcome.h"

namespace Tulk {

/// The management NIC's distributed-switch port as plain values.
struct ManagementDvsPort {
  /// The management kernel NIC ("hyk0").
  std::string nic;
  /// The distributed switch and the port the NIC sits on.
  std::string switchName;
  std::string portId;
  /// The port's VLAN (0 none) and uplinks, and whether it is blocked.
  int vlanId = 0;
  std::vector<std::string> portUplinks;
  bool blocked = false;
  /// The switch's uplinks on this host, in the switch's order.
  std::vector<std::string> switchUplinks;
  /// The switch was made by another vendor: its ports cannot be repaired
  /// from the host.
  bool thirdParty = false;
};

/// Reads the management NIC's port. Nullopt, with a line at error level,
/// when there is no management NIC ("Could not locate the management
/// interface"), when it is not on a distributed switch ("The management
/// interface is not on a distributed switch"), or when the host fails
/// ("Reading the management DVS port failed: %s").
std::optional<ManagementDvsPort> ReadManagementDvsPort();

/// The new port's settings.
struct DvsPortRepair {
  /// 0 for no VLAN, 1..4094.
  int vlanId = 0;
  /// The uplinks the port uses (a subset of the switch's, in its order).
  std::vector<std::string> uplinks;
  /// Give the new port the default blocked setting, unblocked, instead of
  /// the old port's.
  bool unblock = false;
};

/// Adds a host-local port to the management NIC's distributed switch,
/// cloned from the NIC's port with `repair`'s settings, and connects the
/// NIC to it. Logs "Restoring DVS %s: new host local port %s for %s (VLAN
/// %d, uplinks %s)" at informational level once the port exists, and
/// "Restoring DVS failed: %s" at error level on a failure.
HostOutcome RepairManagementDvsPort(const DvsPortRepair& repair);

}  // namespace Tulk
