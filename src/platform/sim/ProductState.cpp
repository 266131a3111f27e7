#include "platform/api/ProductState.h"

#include <string>

#include "platform/sim/SimHost.h"

namespace {

// The texts live as long as the process, as the real library's do.
const char* ProductField(const char* key, const char* fallback) {
  static std::string fields[4];
  static const char* const kKeys[4] = {"name", "version", "build", "compilationOption"};
  for (int i = 0; i < 4; ++i) {
    if (std::string(kKeys[i]) == key) {
      const nlohmann::json& state = Sim::SimHost::Instance().State();
      auto product = state.find("product");
      if (product != state.end() && product->contains(key) && (*product)[key].is_string()) {
        fields[i] = (*product)[key].get<std::string>();
      } else {
        fields[i] = fallback;
      }
      return fields[i].c_str();
    }
  }
  return fallback;
}

}  // namespace

extern "C" {

const char* ProductState_GetName() {
  return ProductField("name", "");
}
const char* ProductState_GetVersion() {
  return ProductField("version", "");
}
const char* ProductState_GetBuildNumberString() {
  return ProductField("build", "");
}
const char* ProductState_GetCompilationOption() {
  return ProductField("compilationOption", "");
}
}
