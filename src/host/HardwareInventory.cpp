#include "host/HardwareInventory.h"

#include <syslog.h>

#include <memory>

#include "host/NetworkInventory.h"
#include "platform/api/HardwareInfoImpl.h"
#include "platform/api/Host.h"
#include "platform/api/HostMgrException.h"
#include "platform/api/MemoryInfoImpl.h"
#include "platform/api/StrPrintf.h"
#include "runtime/SystemLog.h"

namespace Tulk {
namespace {

using HostMgr::Lib::HostMgrException;

constexpr std::uint64_t kRoundingMask = 0x0FFFFFFF;
constexpr std::uint64_t kMebibyte = std::uint64_t{1024} * 1024;
constexpr char kUnitLetters[] = "MGTP";
constexpr int kLastUnit = 3;

std::string OrFiller(const std::string& text) {
  return text.empty() ? std::string(kNotAvailable) : text;
}

std::string VersionText(int id, const HostMgr::Host& host) {
  switch (id) {
    case 1: {
      HostMgr::StorageInfo storage = host.GetStorageInfo();
      const HostMgr::StorageAdapter* adapter = storage.FindAdapter("hyhba0");
      if (adapter == nullptr) {
        throw HostMgrException("Storage adapter hyhba0 not found");
      }
      return adapter->version;
    }
    case 2:
      return host.GetHardwareInfo().bmcVersion;
    case 3: {
      HostMgr::HardwareInfo hardware = host.GetHardwareInfo();
      const std::string& version =
          hardware.biosVersion.empty() ? hardware.biosVendor : hardware.biosVersion;
      return HostMgr::Misc::StrPrintf("%s (%d.%d) %s", version.c_str(), hardware.biosMajorRelease,
                                      hardware.biosMinorRelease, hardware.biosReleaseDate.c_str());
    }
    default:
      return host.GetSystemInfo().fullName;
  }
}

const char* VersionName(int id) {
  switch (id) {
    case 1:
      return "hyhba0";
    case 2:
      return "BMC";
    case 3:
      return "BIOS";
    default:
      return "system";
  }
}

std::string HardwareText(std::string (HykCtl::Hardware::HardwareInfoImpl::*getter)() const) {
  try {
    return OrFiller((HykCtl::Hardware::HardwareInfoImpl().*getter)());
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Getting hardware information failed: %s", failure.what());
    return kNotAvailable;
  }
}

}  // namespace

std::string FormatMemoryBytes(std::uint64_t bytes) {
  std::uint64_t value = (bytes + kRoundingMask) & ~kRoundingMask;
  std::uint64_t unit = kMebibyte;
  int index = 0;
  while (index < kLastUnit && unit * 1024 <= value) {
    unit *= 1024;
    ++index;
  }
  std::uint64_t whole = value / unit;
  std::uint64_t rest = value % unit;
  if (rest != 0) {
    return HostMgr::Misc::StrPrintf("%lu.%lu %cB", whole, rest * 10 / unit, kUnitLetters[index]);
  }
  return HostMgr::Misc::StrPrintf("%lu %cB", whole, kUnitLetters[index]);
}

std::string FormatMemorySize() {
  try {
    HykCtl::Hardware::MemoryInfoImpl memory;
    return FormatMemoryBytes(memory.GetTotalPages() * memory.GetPageSize());
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Getting memory size failed: %s", failure.what());
    return kNotAvailable;
  }
}

std::string GetVersionString(int id) {
  if (id < 1 || id > 4) {
    Log(LOG_ERR, "Invalid version id: %d requested", id);
    return kNotAvailable;
  }
  try {
    std::unique_ptr<HostMgr::Host> host = HostMgr::HostFactory::GetHost();
    return OrFiller(VersionText(id, *host));
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Get %s version string failed, err=%s", VersionName(id), failure.what());
    return kNotAvailable;
  }
}

std::string GetServiceTag() {
  return HardwareText(&HykCtl::Hardware::HardwareInfoImpl::GetServiceTag);
}

std::string GetAssetTag() {
  return HardwareText(&HykCtl::Hardware::HardwareInfoImpl::GetAssetTag);
}

std::string GetCpldVersion() {
  return HardwareText(&HykCtl::Hardware::HardwareInfoImpl::GetCpldVersion);
}

std::string GetPlsaVersion() {
  return HardwareText(&HykCtl::Hardware::HardwareInfoImpl::GetPlsaVersion);
}

}  // namespace Tulk
