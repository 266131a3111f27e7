#pragma once
/// The host's list of virtual switches.

#include <string>
#include <vector>

#include "platform/api/PortsetImpl.h"

namespace HykCtl::Network {

/// Lists and creates virtual switches. Every operation may throw
/// HostMgr::Lib::HostMgrException.
class VirtualSwitchInfoImpl {
 public:
  /// The standard switches, in the host's order.
  std::vector<PortsetImpl> GetVirtualSwitches() const;
  /// The distributed switches, in the host's order.
  std::vector<PortsetImpl> GetDVSwitches() const;

  /// Creates the standard switch `name` with `numPorts` ports (1..4096),
  /// no uplinks and an empty teaming policy. Throws when a switch of that
  /// name exists.
  void AddVirtualSwitch(const std::string& name, int numPorts);
  /// Removes the standard switch `name`; throws while it has portgroups.
  void RemoveVirtualSwitch(const std::string& name);
};

}  // namespace HykCtl::Network
