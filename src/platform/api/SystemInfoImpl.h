#pragma once
/// System settings of the host: keyboard layout, welcome message, system
/// alerts and firewall rulesets.

#include <memory>
#include <string>
#include <vector>

#include "platform/api/FirewallRuleset.h"

namespace HykCtl::System {

/// Every operation may throw HostMgr::Lib::HostMgrException.
class SystemInfoImpl {
 public:
  /// The configured keyboard layout ("US Default").
  std::string GetKeyboardLayout() const;
  /// Sets the keyboard layout; throws "Unknown keyboard layout <name>"
  /// for a name not in GetKeyboardLayouts.
  void SetKeyboardLayout(const std::string& layout);
  /// The layouts the host offers, in display order.
  std::vector<std::string> GetKeyboardLayouts() const;

  /// The administrator's welcome message for the console; empty when none
  /// is configured (the console then shows its standard summary).
  std::string GetWelcomeMessage() const;
  /// Sets the welcome message; the empty text removes it.
  void SetWelcomeMessage(const std::string& message);

  /// Raises a system alert with a short text (appended to the host's
  /// alerts).
  void SetSystemAlert(const std::string& text);
  /// The alerts raised so far, oldest first.
  std::vector<std::string> GetSystemAlerts() const;

  /// The firewall ruleset `id`; throws when there is none.
  std::unique_ptr<FirewallRuleset> GetFirewallRulesetById(const std::string& id) const;
  /// The ids of all firewall rulesets, in the host's order.
  std::vector<std::string> GetFirewallRulesetIds() const;
};

}  // namespace HykCtl::System
