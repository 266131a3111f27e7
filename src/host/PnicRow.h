#pragma once
/// A physical NIC as a plain record for the adapter lists.

#include <map>
#include <string>

namespace Tulk {

/// One physical NIC; every field is display text.
struct PnicRow {
  /// The NIC's name, such as "hynic0".
  std::string name;
  /// The description of its PCI device; "N/A" when the device gives none.
  std::string hardwareLabel;
  /// The MAC address text, such as "02:00:00:01:02:03".
  std::string mac;
  /// "Connected" when the link is up, "Disconnected" otherwise.
  std::string linkState;
  /// The virtual switch using the NIC as an uplink; empty when none does.
  std::string switchName;
};

/// Physical NIC name to the name of the virtual switch that uses it as an
/// uplink (BuildPnicUsage()); a NIC in no switch has no entry.
using PnicUsage = std::map<std::string, std::string>;

}  // namespace Tulk
