#pragma once
/// One ruleset of the host's firewall.

#include <string>

namespace HykCtl::System {

/// A firewall ruleset by id ("sshServer"). Getters read the host at each
/// call. Every operation may throw HostMgr::Lib::HostMgrException.
class FirewallRuleset {
 public:
  /// The ruleset `id`; throws "Firewall ruleset <id> not found" when the
  /// host has none of that id.
  explicit FirewallRuleset(std::string id);

  /// The ruleset's id.
  const std::string& GetId() const { return id_; }
  /// True while the ruleset lets its traffic through.
  bool IsEnabled() const;
  /// The gate property: true when the ruleset is opened and closed
  /// together with its service, so that whoever starts or stops the
  /// service by hand is to switch the ruleset to match. False for a
  /// ruleset the administrator pinned open or closed.
  bool IsManagedWithService() const;
  /// Lets the ruleset's traffic through.
  void Enable();
  /// Blocks the ruleset's traffic.
  void Disable();

 private:
  std::string id_;
};

}  // namespace HykCtl::System
