#pragma once
/// One port of a distributed switch.

#include <string>
#include <utility>
#include <vector>

namespace HostMgr::Network {

/// The properties of a distributed-switch port that the host can set on a
/// port of its own (a host-local port): its VLAN, the uplinks its traffic
/// uses and whether it is blocked. A plain value; read it with
/// PortsetImpl::GetDvsPort and hand it to PortsetImpl::AddHostLocalPort.
struct DvsPort {
  /// The port's id on its switch ("12"); assigned by the host for a new
  /// port.
  std::string id;
  /// 0 for no VLAN, 1..4094 one VLAN.
  int vlanId = 0;
  /// The switch's uplinks the port uses, most preferred first.
  std::vector<std::string> uplinks;
  /// A blocked port passes no traffic.
  bool blocked = false;
  /// The port was made by the host itself rather than by the switch's
  /// manager.
  bool hostLocal = false;
};

}  // namespace HostMgr::Network
