#include "platform/api/AdvancedOption.h"

#include "platform/api/HostMgrException.h"
#include "platform/sim/SimHost.h"

namespace HykCtl::Adv {

std::int64_t UserAdvancedOptionImpl::GetUserOption(const std::string& path) const {
  Sim::SimHost& host = Sim::SimHost::Instance();
  host.CheckFault("HykCtl::Adv::UserAdvancedOptionImpl::GetUserOption");
  const nlohmann::json& options = host.State().value("advancedOptions", nlohmann::json::object());
  auto option = options.find(path);
  if (option == options.end()) {
    throw HostMgr::Lib::HostMgrException("Unknown option " + path);
  }
  return option->get<std::int64_t>();
}

bool UserAdvancedOptionImpl::HasUserOption(const std::string& path) const {
  Sim::SimHost& host = Sim::SimHost::Instance();
  host.CheckFault("HykCtl::Adv::UserAdvancedOptionImpl::HasUserOption");
  const nlohmann::json& options = host.State().value("advancedOptions", nlohmann::json::object());
  return options.contains(path);
}

void UserAdvancedOptionImpl::SetUserOption(const std::string& path, std::int64_t value) {
  Sim::SimHost& host = Sim::SimHost::Instance();
  host.CheckFault("HykCtl::Adv::UserAdvancedOptionImpl::SetUserOption");
  host.State()["advancedOptions"][path] = value;
  host.Save();
}

}  // namespace HykCtl::Adv
