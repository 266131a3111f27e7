#pragma once
/// The host's list of hypervisor-kernel NICs.

#include <string>
#include <vector>

#include "platform/api/HykNicImpl.h"

namespace HykCtl::Network {

/// Lists, creates and removes kernel NICs. Every operation may throw
/// HostMgr::Lib::HostMgrException.
class HykernelNicInfoImpl {
 public:
  /// Port-set selector for "the NICs of every port set".
  static constexpr int kAllPortsets = 0;

  /// The kernel NICs, in the host's order: for 0 every one (attached to
  /// any switch, to an opaque network, or to nothing); otherwise those on
  /// the port set at that position, counted from 1 over the standard
  /// switches and then the distributed ones. Throws for a position beyond
  /// the last switch.
  std::vector<HykNicImpl> GetHykernelNics(int portsetSelector = kAllPortsets) const;

  /// Creates a kernel NIC on the standard-switch portgroup `portGroup`,
  /// with IPv4 on DHCP and a new MAC address; returns its name (the first
  /// free "hyk<N>").
  std::string AddHykernelNic(const std::string& portGroup);
  /// Removes the kernel NIC `name`. The management NIC cannot be removed.
  void RemoveHykernelNic(const std::string& name);
};

}  // namespace HykCtl::Network
