#include "platform/api/SystemInfoImpl.h"

#include <algorithm>

#include "platform/sim/SimState.h"

namespace HykCtl::System {
namespace {

std::string Op(const char* method) {
  return std::string("HykCtl::System::SystemInfoImpl::") + method;
}

const Sim::json& System(const char* method) {
  return Sim::ObjectAt(Sim::Query(Op(method)), "system");
}

std::vector<std::string> Strings(const Sim::json& array) {
  std::vector<std::string> texts;
  for (const Sim::json& text : array) {
    texts.push_back(text.get<std::string>());
  }
  return texts;
}

}  // namespace

std::string SystemInfoImpl::GetKeyboardLayout() const {
  return Sim::StringAt(System("GetKeyboardLayout"), "keyboardLayout", "US Default");
}

void SystemInfoImpl::SetKeyboardLayout(const std::string& layout) {
  Sim::Change(Op("SetKeyboardLayout"), [&](Sim::json& state) {
    Sim::json& system = Sim::ObjectFor(state, "system");
    const std::vector<std::string> layouts = Strings(Sim::ArrayAt(system, "keyboardLayouts"));
    if (std::find(layouts.begin(), layouts.end(), layout) == layouts.end()) {
      Sim::Fail("Unknown keyboard layout " + layout);
    }
    system["keyboardLayout"] = layout;
  });
}

std::vector<std::string> SystemInfoImpl::GetKeyboardLayouts() const {
  return Strings(Sim::ArrayAt(System("GetKeyboardLayouts"), "keyboardLayouts"));
}

std::string SystemInfoImpl::GetWelcomeMessage() const {
  return Sim::StringAt(System("GetWelcomeMessage"), "welcomeMessage");
}

void SystemInfoImpl::SetWelcomeMessage(const std::string& message) {
  Sim::Change(Op("SetWelcomeMessage"), [&](Sim::json& state) {
    Sim::ObjectFor(state, "system")["welcomeMessage"] = message;
  });
}

void SystemInfoImpl::SetSystemAlert(const std::string& text) {
  Sim::Change(Op("SetSystemAlert"), [&](Sim::json& state) {
    Sim::ArrayFor(Sim::ObjectFor(state, "system"), "alerts").push_back(text);
  });
}

std::vector<std::string> SystemInfoImpl::GetSystemAlerts() const {
  return Strings(Sim::ArrayAt(System("GetSystemAlerts"), "alerts"));
}

std::unique_ptr<FirewallRuleset> SystemInfoImpl::GetFirewallRulesetById(
    const std::string& id) const {
  Sim::Query(Op("GetFirewallRulesetById"));
  return std::make_unique<FirewallRuleset>(id);
}

std::vector<std::string> SystemInfoImpl::GetFirewallRulesetIds() const {
  std::vector<std::string> ids;
  for (const auto& [id, ruleset] :
       Sim::ObjectAt(System("GetFirewallRulesetIds"), "firewall").items()) {
    ids.push_back(id);
  }
  return ids;
}

}  // namespace HykCtl::System
