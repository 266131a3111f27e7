#include "host/HostValueProviders.h"

#include <cstring>
#include <string>

#include "host/HardwareInventory.h"
#include "host/ManagementNetwork.h"
#include "host/NetworkInventory.h"
#include "platform/api/HostMgrException.h"
#include "platform/api/StrPrintf.h"
#include "platform/api/SystemInformation.h"
#include "render/HostValues.h"

namespace Tulk {
namespace {

bool ReadSystemVersion(HSI_SystemVersion& record) {
  try {
    return HSI_Get(HSI_NODE_system_version, &record, sizeof record) == 0;
  } catch (const HostMgr::Lib::HostMgrException&) {
    return false;
  }
}

// The record's text fields are NUL-terminated, but a field filled to the
// brim must not run into the next one.
template <std::size_t N>
std::string Field(const char (&field)[N]) {
  return std::string(field, strnlen(field, N));
}

std::string SystemVersionField(std::string (*pick)(const HSI_SystemVersion&)) {
  HSI_SystemVersion record{};
  if (!ReadSystemVersion(record)) {
    return kNotAvailable;
  }
  std::string value = pick(record);
  return value.empty() ? std::string(kNotAvailable) : value;
}

}  // namespace

bool BuildVersionLine(std::string& line) {
  HSI_SystemVersion record{};
  if (!ReadSystemVersion(record)) {
    return false;
  }
  line = HostMgr::Misc::StrPrintf("%s %s (HyKernel %s Build %s)", Field(record.productName).c_str(),
                                  Field(record.version).c_str(),
                                  Field(record.kernelRelease).c_str(), Field(record.build).c_str());
  return true;
}

void RegisterHostValueProviders() {
  RegisterValueProvider("ip", GetManagementIpv4Address);
  RegisterValueProvider("hostname", GetHostFqdn);
  RegisterValueProvider("tavproduct", [] {
    return SystemVersionField([](const HSI_SystemVersion& r) { return Field(r.productName); });
  });
  RegisterValueProvider("tavversion", [] {
    return SystemVersionField([](const HSI_SystemVersion& r) { return Field(r.version); });
  });
  RegisterValueProvider("memory", [] { return FormatMemorySize(); });
  RegisterValueProvider("servicetag", GetServiceTag);
  RegisterValueProvider("assettag", GetAssetTag);
  RegisterValueProvider("BIOSversion", [] { return GetVersionString(3); });
  RegisterValueProvider("BMCversion", [] { return GetVersionString(2); });
  RegisterValueProvider("CPLDversion", GetCpldVersion);
  RegisterValueProvider("PLSAversion", GetPlsaVersion);
  SetVersionLineSource(BuildVersionLine);
}

}  // namespace Tulk
