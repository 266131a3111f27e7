#pragma once
/// One portgroup of a standard switch.

#include <string>

#include "platform/api/NicTeamingPolicy.h"

namespace HykCtl::Network {

/// A portgroup by name. Getters read the host at each call. Every
/// operation may throw HostMgr::Lib::HostMgrException.
class PortGroupImpl {
 public:
  /// The portgroup named `name`. Throws "Portgroup <name> not found" when
  /// there is none.
  explicit PortGroupImpl(const std::string& name);

  /// Whether a portgroup named `name` exists.
  static bool IsValidPortGroup(const std::string& name);

  /// The portgroup's name.
  const std::string& GetName() const { return name_; }
  /// The standard switch holding the portgroup.
  std::string GetVirtualSwitchName() const;
  /// The number of clients (kernel NICs and VM ports) connected to it.
  int GetActiveClients() const;
  /// The VLAN id: 0 none, 1..4094 one VLAN, 4095 all VLANs.
  int GetVlanId() const;
  /// Sets the VLAN id; throws outside 0..4095.
  void SetVlanId(int vlanId);

  /// The portgroup's teaming policy: its own when it overrides the
  /// switch's, else the switch's.
  HostMgr::Network::NicTeamingPolicy GetTeamingPolicy() const;
  /// Gives the portgroup its own teaming policy.
  void SetTeamingPolicy(const HostMgr::Network::NicTeamingPolicy& policy);

 private:
  std::string name_;
};

}  // namespace HykCtl::Network
