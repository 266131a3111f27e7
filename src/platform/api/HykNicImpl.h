#pragma once
/// One hypervisor-kernel NIC (such as hyk0).

#include <memory>
#include <optional>
#include <string>

#include "platform/api/ConnectionPoint.h"
#include "platform/api/IpConfig.h"
#include "platform/api/MacAddress.h"

namespace HykCtl::Network {

/// A kernel NIC as the host saw it when the object was made or last
/// refreshed. Getters answer from that snapshot; IsStale tells whether the
/// host has changed since, and Refresh takes a new snapshot. Operations
/// that change the NIC act on the host at once and refresh the object.
///
/// Every operation may throw HostMgr::Lib::HostMgrException; operations
/// on a NIC that no longer exists throw "Hykernel NIC <name> not found".
class HykNicImpl {
 public:
  /// The NIC named `name` (such as "hyk0"). Throws when there is none.
  explicit HykNicImpl(const std::string& name);
  /// Copies share the snapshot until one of them refreshes.
  ~HykNicImpl();
  HykNicImpl(const HykNicImpl&);
  HykNicImpl& operator=(const HykNicImpl&);
  HykNicImpl(HykNicImpl&&) noexcept;
  HykNicImpl& operator=(HykNicImpl&&) noexcept;

  /// True when the host changed after the snapshot was taken.
  bool IsStale() const;
  /// Takes a new snapshot.
  void Refresh();

  /// The interface name, such as "hyk0".
  std::string GetName() const;
  /// The NIC's MAC address.
  HostMgr::Network::MacAddress GetMacAddress() const;
  /// The attachment; nullopt when the NIC is attached to nothing.
  std::optional<ConnectionPoint> GetConnectionPoint() const;
  /// The NIC's state: true while it is in service (up). Used to decide
  /// whether the management network can be configured at all.
  bool IsEnabled() const;

  /// The IP configuration (copy).
  HostMgr::Network::IpConfig GetIpConfig() const;
  /// Applies `config`: IPv4 mode (none, DHCP, static with address, netmask
  /// and gateway), IPv6 switch, DHCPv6 and router-advertisement flags,
  /// the static IPv6 entries (type Ipv6Network::kTypeStatic; entries of
  /// other types are the host's own and are ignored here), the IPv6
  /// gateway and the DNS-from-DHCP flag. Switching to DHCP starts a lease
  /// attempt. Throws for an invalid static address or netmask.
  void SetIpConfig(const HostMgr::Network::IpConfig& config);

  /// True when the NIC uses DHCP and holds a bound lease.
  bool IsDhcpLeaseBound() const;
  /// Renews the DHCP lease. Throws when the NIC does not use DHCP.
  void RenewDhcpLease();

  /// Gives the NIC the MAC address of the physical NIC `pnicName`.
  void SetMacAddressFromPnic(const std::string& pnicName);
  /// Attaches the NIC to the standard-switch portgroup `portGroup`.
  void ConnectToPortGroup(const std::string& portGroup);
  /// Attaches the NIC to port `portId` of the distributed switch
  /// `dvsName`. Throws when the switch is not distributed or has no such
  /// port.
  void ConnectToDvsPort(const std::string& dvsName, const std::string& portId);

  /// Takes the NIC out of service (interface down, addresses kept).
  void Disable();
  /// Brings the NIC into service again.
  void Enable();
  /// Restarts the interface: Disable then Enable as one operation (used
  /// after a VLAN change and by "Restart Management Network"). A NIC on
  /// DHCP asks for its lease again as it comes up.
  void Restart();

 private:
  struct Snapshot;
  const Snapshot& Current() const;

  std::string name_;
  std::shared_ptr<const Snapshot> snapshot_;
};

}  // namespace HykCtl::Network
