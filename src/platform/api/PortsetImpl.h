#pragma once
/// One virtual switch (port set), standard or distributed.

#include <cstdint>
#include <string>
#include <vector>

#include "platform/api/DvsPort.h"
#include "platform/api/NicTeamingPolicy.h"

namespace HykCtl::Network {

/// A virtual switch by name. Getters read the host at each call. Every
/// operation may throw HostMgr::Lib::HostMgrException; the changing ones
/// throw "Operation not supported on distributed switch <name>" for a
/// distributed switch unless stated otherwise.
class PortsetImpl {
 public:
  /// GetType of a standard switch.
  static constexpr int kStandard = 0;
  /// GetType of a distributed switch.
  static constexpr int kDistributed = 1;

  /// The switch named `name` (standard or distributed). Throws "Virtual
  /// switch <name> not found" when there is none.
  explicit PortsetImpl(const std::string& name);

  /// Whether a virtual switch (of either kind) named `name` exists.
  static bool IsValidVirtualSwitch(const std::string& name);

  /// The switch's name.
  const std::string& GetName() const { return name_; }
  /// kStandard or kDistributed.
  int GetType() const;
  /// GetType() is kDistributed.
  bool IsDistributed() const { return GetType() == kDistributed; }

  /// Physical NIC names used as uplinks, in the host's order.
  std::vector<std::string> GetUplinks() const;
  /// Portgroup names (standard switch) or port names in use (distributed).
  std::vector<std::string> GetPortGroups() const;
  /// The switch's port counts: its size, the ports in use (uplinks,
  /// kernel NICs, virtual machine ports) and the configured size.
  std::int64_t GetNumPorts() const;
  std::int64_t GetUsedPorts() const;
  std::int64_t GetConfiguredPorts() const;

  /// Adds `pnic` as an uplink. The teaming policy is not changed: callers
  /// add the NIC to the policy themselves. Throws when the NIC does not
  /// exist or is an uplink of any switch.
  void AddUplink(const std::string& pnic);
  /// Removes uplink `pnic`; it also leaves the switch's teaming order.
  void RemoveUplink(const std::string& pnic);
  /// Moves uplink `pnic` of this switch (standard or distributed) to the
  /// standard switch `targetSwitch`, appending it to the target's uplinks
  /// (not to its teaming policy).
  void MoveUplink(const std::string& pnic, const std::string& targetSwitch);

  /// The switch's teaming policy.
  HostMgr::Network::NicTeamingPolicy GetTeamingPolicy() const;
  /// Replaces the teaming policy. Throws when the order names a NIC that
  /// is not an uplink of this switch or the maximum is negative.
  void SetTeamingPolicy(const HostMgr::Network::NicTeamingPolicy& policy);

  /// Adds portgroup `name` (VLAN `vlanId`, 0 for none). Throws when a
  /// portgroup of that name exists anywhere on the host.
  void AddPortGroup(const std::string& name, int vlanId = 0);
  /// Removes portgroup `name`; throws while a kernel NIC uses it.
  void RemovePortGroup(const std::string& name);

  // Distributed switches only; each throws "Not a distributed switch
  // <name>" for a standard switch.
  /// True for a distributed switch made by another vendor than the host's:
  /// the host can read its ports but not add any.
  bool IsThirdParty() const;
  /// The port `portId`. Throws "Port <id> not found on <name>" when there
  /// is none.
  HostMgr::Network::DvsPort GetDvsPort(const std::string& portId) const;
  /// Adds a host-local port: a copy of port `clonePortId` (every property
  /// the host keeps for it) with the VLAN, uplinks and blocked state of
  /// `settings` (its id and hostLocal are ignored). Returns the new port's
  /// id. Throws for a third-party switch ("Operation not supported on
  /// third-party distributed switch <name>"), an unknown port, an uplink
  /// that is not one of the switch's, or a VLAN outside 0..4094.
  std::string AddHostLocalPort(const std::string& clonePortId,
                               const HostMgr::Network::DvsPort& settings);

 private:
  std::string name_;
};

}  // namespace HykCtl::Network
