#include "platform/api/SystemInformation.h"

#include <cstring>
#include <string>

#include "platform/sim/SimState.h"

namespace {

void CopyField(char* target, std::size_t size, const Sim::json& object, const char* key) {
  const std::string value = Sim::StringAt(object, key);
  std::strncpy(target, value.c_str(), size - 1);
  target[size - 1] = '\0';
}

}  // namespace

int HSI_Get(HSI_Node node, void* buffer, std::size_t size) {
  const Sim::json& state = Sim::Query("HSI_Get");
  switch (node) {
    case HSI_NODE_system_version: {
      if (buffer == nullptr || size < sizeof(HSI_SystemVersion)) {
        return 1;
      }
      HSI_SystemVersion record{};
      const Sim::json& product = Sim::ObjectAt(state, "product");
      CopyField(record.productName, sizeof record.productName, product, "name");
      CopyField(record.version, sizeof record.version, product, "version");
      CopyField(record.kernelRelease, sizeof record.kernelRelease, product, "kernelRelease");
      CopyField(record.build, sizeof record.build, product, "build");
      std::memcpy(buffer, &record, sizeof record);
      return 0;
    }
    case HSI_NODE_system_bootOption: {
      const Sim::json& system = Sim::ObjectAt(state, "system");
      auto boot = system.find("bootOption");
      if (boot == system.end() || buffer == nullptr || size < 1) {
        return 1;
      }
      std::memset(buffer, 0, size);
      static_cast<unsigned char*>(buffer)[0] = static_cast<unsigned char>(boot->get<int>());
      return 0;
    }
  }
  return 1;
}
