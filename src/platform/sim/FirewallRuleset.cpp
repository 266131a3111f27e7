#include "platform/api/FirewallRuleset.h"

#include "platform/api/HostMgrException.h"

#pragma GCC diagnostic ignored "-Wunused-parameter"

namespace HykCtl::System {

FirewallRuleset::FirewallRuleset(std::string id) : id_(std::move(id)) {
}

bool FirewallRuleset::IsEnabled() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::System::FirewallRuleset::IsEnabled is not implemented yet");
}

bool FirewallRuleset::IsManagedWithService() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::System::FirewallRuleset::IsManagedWithService is not implemented yet");
}

void FirewallRuleset::Enable() {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::System::FirewallRuleset::Enable is not implemented yet");
}

void FirewallRuleset::Disable() {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::System::FirewallRuleset::Disable is not implemented yet");
}

}  // namespace HykCtl::System
