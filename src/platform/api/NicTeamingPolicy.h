#pragma once
/// The NIC teaming policy of a standard switch or portgroup.

#include <string>
#include <utility>
#include <vector>

namespace HostMgr::Network {

/// Which uplinks carry traffic, in which order: the first
/// GetMaxActiveUplinks names of the uplink order are active, the rest are
/// standby. A plain value; read it from PortsetImpl or PortGroupImpl,
/// change it, and hand it back with their SetTeamingPolicy.
class NicTeamingPolicy {
 public:
  /// No uplinks, none active.
  NicTeamingPolicy() = default;
  /// The given order and maximum.
  NicTeamingPolicy(std::vector<std::string> uplinkOrder, int maxActiveUplinks)
      : uplinkOrder_(std::move(uplinkOrder)), maxActiveUplinks_(maxActiveUplinks) {}

  /// Physical NIC names, most preferred first.
  const std::vector<std::string>& GetUplinkOrder() const { return uplinkOrder_; }
  void SetUplinkOrder(std::vector<std::string> order) { uplinkOrder_ = std::move(order); }
  /// How many uplinks of the order are active at once (0 or more).
  int GetMaxActiveUplinks() const { return maxActiveUplinks_; }
  void SetMaxActiveUplinks(int count) { maxActiveUplinks_ = count; }

  /// The first GetMaxActiveUplinks names of the order.
  std::vector<std::string> GetActiveUplinks() const;
  /// The names after the active ones.
  std::vector<std::string> GetStandbyUplinks() const;

  /// Same order and maximum.
  bool operator==(const NicTeamingPolicy& other) const = default;

 private:
  std::vector<std::string> uplinkOrder_;
  int maxActiveUplinks_ = 0;
};

}  // namespace HostMgr::Network
