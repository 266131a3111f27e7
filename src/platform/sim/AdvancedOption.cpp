#include "platform/api/AdvancedOption.h"

#include "platform/sim/SimState.h"

namespace HykCtl::Adv {
namespace {

std::string Op(const char* method) {
  return std::string("HykCtl::Adv::UserAdvancedOptionImpl::") + method;
}

}  // namespace

std::int64_t UserAdvancedOptionImpl::GetUserOption(const std::string& path) const {
  const Sim::json& options = Sim::ObjectAt(Sim::Query(Op("GetUserOption")), "advancedOptions");
  auto option = options.find(path);
  if (option == options.end()) {
    Sim::Fail("Unknown option " + path);
  }
  return option->get<std::int64_t>();
}

bool UserAdvancedOptionImpl::HasUserOption(const std::string& path) const {
  return Sim::ObjectAt(Sim::Query(Op("HasUserOption")), "advancedOptions").contains(path);
}

void UserAdvancedOptionImpl::SetUserOption(const std::string& path, std::int64_t value) {
  Sim::Change(Op("SetUserOption"), [&](Sim::json& state) {
    if (path.empty()) {
      Sim::Fail("An option needs a path");
    }
    Sim::ObjectFor(state, "advancedOptions")[path] = value;
  });
}

}  // namespace HykCtl::Adv
