#include "platform/api/FirewallRuleset.h"

#include "platform/sim/SimState.h"

namespace HykCtl::System {
namespace {

std::string Op(const char* method) {
  return std::string("HykCtl::System::FirewallRuleset::") + method;
}

const Sim::json& Ruleset(const Sim::json& state, const std::string& id) {
  const Sim::json& rulesets = Sim::ObjectAt(Sim::ObjectAt(state, "system"), "firewall");
  auto found = rulesets.find(id);
  if (found == rulesets.end()) {
    Sim::Fail("Firewall ruleset " + id + " not found");
  }
  return *found;
}

void SetEnabled(const char* method, const std::string& id, bool enabled) {
  Sim::Change(Op(method), [&](Sim::json& state) {
    Ruleset(state, id);
    state["system"]["firewall"][id]["enabled"] = enabled;
  });
}

}  // namespace

FirewallRuleset::FirewallRuleset(std::string id) : id_(std::move(id)) {
  Ruleset(Sim::Query(Op("FirewallRuleset")), id_);
}

bool FirewallRuleset::IsEnabled() const {
  return Ruleset(Sim::Query(Op("IsEnabled")), id_).value("enabled", false);
}

bool FirewallRuleset::IsManagedWithService() const {
  return Ruleset(Sim::Query(Op("IsManagedWithService")), id_).value("managedWithService", true);
}

void FirewallRuleset::Enable() {
  SetEnabled("Enable", id_, true);
}

void FirewallRuleset::Disable() {
  SetEnabled("Disable", id_, false);
}

}  // namespace HykCtl::System
