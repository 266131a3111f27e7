#include "platform/api/ProductState.h"

#include <array>
#include <string>

#include "platform/api/HostMgrException.h"
#include "platform/sim/SimHost.h"

namespace {

enum Field { kName, kVersion, kBuild, kCompilationOption, kFieldCount };

// The texts live as long as the process, as the real library's do; each
// call refreshes its own field.
const char* ProductField(Field field, const char* key) {
  static std::array<std::string, kFieldCount> fields;
  try {
    const nlohmann::json& state = Sim::SimHost::Instance().State();
    auto product = state.find("product");
    if (product != state.end() && product->contains(key)) {
      fields[field] = (*product)[key].get<std::string>();
    } else {
      fields[field].clear();
    }
  } catch (const HostMgr::Lib::HostMgrException&) {
    // Without a readable state the identity stays as it was.
  }
  return fields[field].c_str();
}

}  // namespace

extern "C" {

const char* ProductState_GetName() {
  return ProductField(kName, "name");
}
const char* ProductState_GetVersion() {
  return ProductField(kVersion, "version");
}
const char* ProductState_GetBuildNumberString() {
  return ProductField(kBuild, "build");
}
const char* ProductState_GetCompilationOption() {
  return ProductField(kCompilationOption, "compilationOption");
}
}
