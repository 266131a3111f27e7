#include "platform/api/HardwareInfoImpl.h"

#include "platform/sim/SimState.h"

namespace HykCtl::Hardware {
namespace {

std::string Field(const char* method, const char* section, const char* key) {
  const Sim::json& state = Sim::Query(std::string("HykCtl::Hardware::HardwareInfoImpl::") + method);
  const Sim::json& hardware = Sim::ObjectAt(state, "hardware");
  return Sim::StringAt(section != nullptr ? Sim::ObjectAt(hardware, section) : hardware, key);
}

}  // namespace

std::string HardwareInfoImpl::GetVendorName() const {
  return Field("GetVendorName", nullptr, "vendor");
}
std::string HardwareInfoImpl::GetProductName() const {
  return Field("GetProductName", nullptr, "product");
}
std::string HardwareInfoImpl::GetSerialNumber() const {
  return Field("GetSerialNumber", nullptr, "serialNumber");
}
std::string HardwareInfoImpl::GetServiceTag() const {
  return Field("GetServiceTag", nullptr, "serviceTag");
}
std::string HardwareInfoImpl::GetAssetTag() const {
  return Field("GetAssetTag", nullptr, "assetTag");
}
std::string HardwareInfoImpl::GetBiosVersion() const {
  return Field("GetBiosVersion", "bios", "version");
}
std::string HardwareInfoImpl::GetBmcVersion() const {
  return Field("GetBmcVersion", "firmware", "bmc");
}
std::string HardwareInfoImpl::GetCpldVersion() const {
  return Field("GetCpldVersion", "firmware", "cpld");
}
std::string HardwareInfoImpl::GetPlsaVersion() const {
  return Field("GetPlsaVersion", "firmware", "plsa");
}

}  // namespace HykCtl::Hardware
