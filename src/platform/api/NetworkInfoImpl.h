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
  /// The portgroups, in the host's order: for 0 those of every standard
  /// switch, otherwise those of the standard switch at that position
  /// (counted from 1). Throws for a position beyond the last one.
  std::vector<PortGroupImpl> GetAllPortGroups(int portsetSelector = 0) const;

  /// The names of the physical NICs ("hynic0", ...), in the host's order.
  std::vector<std::string> GetPnics() const;

  /// Re-reads which kernel NIC carries the management network. Call
  /// before GetManagementInterface.
  void UpdateManagementInterface();
  /// The management kernel NIC: the host's designated management NIC, if
  /// it exists; null when the host has none.
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
  /// and virtual switch (distributed ones included: the host leaves them),
  /// the default gateways, the user name servers and search domains.
  /// Physical NICs and the host name stay.
  void ClearNetworkConfig();
  /// Builds the factory network: "vSwitch0" with the first connected
  /// physical NIC as uplink, portgroup "Management Network" and kernel NIC
  /// "hyk0" on DHCP (IPv6 by router advertisement) with that NIC's MAC
  /// address, designated the management NIC. Throws when any of the three
  /// names is taken (clear the configuration first).
  void AutoConfigNetwork();
};

}  // namespace HykCtl::Network
