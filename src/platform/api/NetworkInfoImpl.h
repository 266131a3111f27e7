#pragma once
/// Host-wide network information and operations of the host's network
/// stack.

#include <memory>
#include <string>
#include <vector>

#include "platform/api/HykNicImpl.h"
#include "platform/api/PortGroupImpl.h"

namespace HykCtl::Network {

/// Every operation may throw HostMgr::Lib::HostMgrException.
class NetworkInfoImpl {
 public:
  /// The portgroups of port set `portsetSelector` (as in
  /// HykernelNicInfoImpl::GetHykernelNics; 0 for all standard switches), in
  /// the host's order.
  std::vector<PortGroupImpl> GetAllPortGroups(int portsetSelector = 0) const;

  /// The names of the physical NICs ("hynic0", ...), in the host's order.
  std::vector<std::string> GetPnics() const;

  /// Re-determines which kernel NIC carries the management network (the
  /// host's designated management NIC, if it still exists). Call before
  /// GetManagementInterface.
  void UpdateManagementInterface();
  /// The management kernel NIC as last determined by
  /// UpdateManagementInterface; null when the host has none.
  std::unique_ptr<HykNicImpl> GetManagementInterface() const;

  /// Whether IPv6 is enabled in the hypervisor kernel (as booted).
  bool IsHykIpv6Enabled() const;
  /// Enables or disables IPv6 in the hypervisor kernel. Takes effect at
  /// the next boot: IsHykIpv6Enabled keeps answering the booted value
  /// until the host restarts.
  void SetHykIpv6Enabled(bool enabled);

  /// Stops the host from sending core dumps over the network.
  void DisableNetDumper();
  /// Removes the whole network configuration: every kernel NIC, portgroup
  /// and standard switch, the static routes and the user name servers.
  /// Distributed switches, physical NICs and the host name stay.
  void ClearNetworkConfig();
  /// Builds the factory network: "vSwitch0" with the first connected
  /// physical NIC as uplink, portgroup "Management Network" and kernel NIC
  /// "hyk0" on DHCP (IPv6 by router advertisement) with that NIC's MAC
  /// address, designated the management NIC.
  void AutoConfigNetwork();
};

}  // namespace HykCtl::Network
