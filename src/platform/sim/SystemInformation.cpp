#include "platform/api/SystemInformation.h"

#include <cstring>
#include <string>

#include "platform/sim/SimHost.h"

namespace {

void CopyField(char* target, std::size_t size, const nlohmann::json& object, const char* key) {
  std::string value;
  if (object.is_object() && object.contains(key) && object[key].is_string()) {
    value = object[key].get<std::string>();
  }
  std::strncpy(target, value.c_str(), size - 1);
  target[size - 1] = '\0';
}

}  // namespace

int HSI_Get(HSI_Node node, void* buffer, std::size_t size) {
  Sim::SimHost& host = Sim::SimHost::Instance();
  host.CheckFault("HSI_Get");
  const nlohmann::json& state = host.State();
  switch (node) {
    case HSI_NODE_system_version: {
      if (size < sizeof(HSI_SystemVersion)) {
        return 1;
      }
      HSI_SystemVersion record{};
      const nlohmann::json product = state.value("product", nlohmann::json::object());
      CopyField(record.productName, sizeof record.productName, product, "name");
      CopyField(record.version, sizeof record.version, product, "version");
      CopyField(record.kernelRelease, sizeof record.kernelRelease, product, "kernelRelease");
      CopyField(record.build, sizeof record.build, product, "build");
      std::memcpy(buffer, &record, sizeof record);
      return 0;
    }
    case HSI_NODE_system_bootOption: {
      auto boot = state.find("bootOption");
      if (boot == state.end() || !boot->is_number_integer() || size < 1) {
        return 1;
      }
      std::memset(buffer, 0, size);
      static_cast<unsigned char*>(buffer)[0] = static_cast<unsigned char>(boot->get<int>());
      return 0;
    }
  }
  return 1;
}
