#include "platform/api/SystemInfoImpl.h"

#include "platform/api/HostMgrException.h"

#pragma GCC diagnostic ignored "-Wunused-parameter"

namespace HykCtl::System {

std::string SystemInfoImpl::GetKeyboardLayout() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::System::SystemInfoImpl::GetKeyboardLayout is not implemented yet");
}

void SystemInfoImpl::SetKeyboardLayout(const std::string& layout) {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::System::SystemInfoImpl::SetKeyboardLayout is not implemented yet");
}

std::vector<std::string> SystemInfoImpl::GetKeyboardLayouts() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::System::SystemInfoImpl::GetKeyboardLayouts is not implemented yet");
}

std::string SystemInfoImpl::GetWelcomeMessage() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::System::SystemInfoImpl::GetWelcomeMessage is not implemented yet");
}

void SystemInfoImpl::SetWelcomeMessage(const std::string& message) {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::System::SystemInfoImpl::SetWelcomeMessage is not implemented yet");
}

void SystemInfoImpl::SetSystemAlert(const std::string& text) {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::System::SystemInfoImpl::SetSystemAlert is not implemented yet");
}

std::vector<std::string> SystemInfoImpl::GetSystemAlerts() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::System::SystemInfoImpl::GetSystemAlerts is not implemented yet");
}

std::unique_ptr<FirewallRuleset> SystemInfoImpl::GetFirewallRulesetById(
    const std::string& id) const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::System::SystemInfoImpl::GetFirewallRulesetById is not implemented yet");
}

std::vector<std::string> SystemInfoImpl::GetFirewallRulesetIds() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::System::SystemInfoImpl::GetFirewallRulesetIds is not implemented yet");
}

}  // namespace HykCtl::System
