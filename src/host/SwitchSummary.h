#pragma once
/// A virtual switch (standard or distributed) as a plain record, and its
/// multi-line description.

#include <cstdint>
#include <string>
#include <vector>

namespace Tulk {

/// One virtual switch as the switch scan saw it.
struct SwitchSummary {
  /// The switch's name.
  std::string name;
  /// Physical NIC names used as uplinks, in the host's order.
  std::vector<std::string> uplinks;
  /// Portgroup names, in the host's order.
  std::vector<std::string> portGroups;
  std::int64_t numPorts = 0;
  std::int64_t usedPorts = 0;
  std::int64_t configuredPorts = 0;
};

/// "Number of ports: %ld\nUsed ports: %ld\nConfigured ports: %ld\nUplinks:
/// <list>\nPort groups: <list>", each list by JoinNames().
std::string FormatSwitchSummary(const SwitchSummary& summary);

/// The names joined by commas without blanks ("hynic0,hynic1"); "None" for
/// an empty list.
std::string JoinNames(const std::vector<std::string>& names);

}  // namespace Tulk
