#pragma once
/// Constants of the host's port sets (virtual switches).

namespace HostMgr::Network {

/// Port-set constants of the host-control library.
struct Portset {
  /// The number of ports a new standard switch gets when the caller has
  /// no reason to choose (VirtualSwitchInfoImpl::AddVirtualSwitch).
  static constexpr int DEF_NUM_PORTS = 128;
};

}  // namespace HostMgr::Network
