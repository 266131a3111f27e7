#include "host/SystemSettings.h"

#include <syslog.h>

#include "host/NetworkInventory.h"
#include "include/Constants.h"
#include "platform/api/AdvancedOption.h"
#include "platform/api/Authentication.h"
#include "platform/api/HostMgrException.h"
#include "platform/api/SystemInfoImpl.h"
#include "runtime/SystemLog.h"

namespace Tulk {

using HostMgr::Lib::HostMgrException;

std::string ReadKeyboardLayout() {
  try {
    return HykCtl::System::SystemInfoImpl().GetKeyboardLayout();
  } catch (const HostMgrException& error) {
    Log(LOG_ERR, "Getting keyboard layout failed: %s", error.what());
    return kNotAvailable;
  }
}

KeyboardLayouts ReadKeyboardLayouts() {
  KeyboardLayouts result;
  try {
    HykCtl::System::SystemInfoImpl system;
    result.layouts = system.GetKeyboardLayouts();
    result.configured = system.GetKeyboardLayout();
  } catch (const HostMgrException& error) {
    result.layouts.clear();
    result.error = error.what();
  }
  return result;
}

bool WriteKeyboardLayout(const std::string& layout, std::string& error) {
  try {
    HykCtl::System::SystemInfoImpl().SetKeyboardLayout(layout);
    return true;
  } catch (const HostMgrException& failure) {
    error = failure.what();
    return false;
  }
}

std::string ReadWelcomeMessage() {
  try {
    return HykCtl::System::SystemInfoImpl().GetWelcomeMessage();
  } catch (const HostMgrException& error) {
    Log(LOG_ERR, "Getting welcome message failed: %s", error.what());
    return {};
  }
}

bool RaiseSystemAlert(const std::string& text) {
  try {
    HykCtl::System::SystemInfoImpl().SetSystemAlert(text);
    return true;
  } catch (const HostMgrException& error) {
    Log(LOG_ERR, "Setting system alert failed: %s", error.what());
    return false;
  }
}

bool HasNetworkBootOption() {
  try {
    return HykCtl::Adv::UserAdvancedOptionImpl().HasUserOption(kPxeBootOption);
  } catch (const HostMgrException&) {
    return false;
  }
}

bool StoreUserAccounts(std::string& error) {
  try {
    HostMgr::Authentication::StoreUserAccountsToCs();
    return true;
  } catch (const HostMgrException& failure) {
    error = failure.what();
    return false;
  }
}

std::optional<std::string> FindSmartCardUser() {
  try {
    for (const auto& token : HostMgr::Authentication::LookupSmartCardTokens()) {
      if (token.valid && !token.userId.empty()) {
        return token.userId;
      }
    }
    return std::string();
  } catch (const HostMgrException&) {
    return std::nullopt;
  }
}

std::optional<bool> SmartCardPresentFor(const std::string& user) {
  try {
    for (const auto& token : HostMgr::Authentication::LookupSmartCardTokens()) {
      if (token.valid && token.userId == user) {
        return true;
      }
    }
    return false;
  } catch (const HostMgrException&) {
    return std::nullopt;
  }
}

}  // namespace Tulk
