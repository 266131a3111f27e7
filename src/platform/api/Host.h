#pragma once
/// The host as one object: its hardware, storage and system information as
/// plain records.

#include <memory>
#include <string>
#include <vector>

namespace HostMgr {

/// The system's hardware and firmware identity.
struct HardwareInfo {
  std::string vendor;
  std::string model;
  std::string serialNumber;
  std::string serviceTag;
  std::string assetTag;
  /// The BIOS vendor, version text, release numbers and date text
  /// ("Kestrel Computing", "2.14.1", 2, 14, "09/30/2025").
  std::string biosVendor;
  std::string biosVersion;
  int biosMajorRelease = 0;
  int biosMinorRelease = 0;
  std::string biosReleaseDate;
  /// Firmware versions of the baseboard management controller, the CPLD
  /// and the PLSA.
  std::string bmcVersion;
  std::string cpldVersion;
  std::string plsaVersion;
};

/// One storage adapter.
struct StorageAdapter {
  /// The adapter's name ("hyhba0").
  std::string name;
  std::string driver;
  /// The driver's version.
  std::string version;
  /// A one-line description of the device.
  std::string description;
};

/// The host's storage adapters.
struct StorageInfo {
  std::vector<StorageAdapter> adapters;
  /// The adapter named `name`, or null.
  const StorageAdapter* FindAdapter(const std::string& name) const;
};

/// The hypervisor's own identity.
struct SystemInfo {
  /// "Brimlo Tavi".
  std::string productName;
  /// "8.1.0".
  std::string version;
  /// The build number ("24519031").
  std::string build;
  /// The kernel release text.
  std::string kernelRelease;
  /// The product name, version and build as one line, "Brimlo Tavi 8.1.0
  /// build-24519031".
  std::string fullName;
  /// The host's unique id.
  std::string uuid;
};

/// The host. Every getter may throw HostMgr::Lib::HostMgrException.
class Host {
 public:
  virtual ~Host() = default;
  /// The system's hardware and firmware identity.
  virtual HardwareInfo GetHardwareInfo() const = 0;
  /// The storage adapters.
  virtual StorageInfo GetStorageInfo() const = 0;
  /// The hypervisor's identity.
  virtual SystemInfo GetSystemInfo() const = 0;
};

/// Gives access to the host.
class HostFactory {
 public:
  /// The local host. Throws HostMgr::Lib::HostMgrException when it cannot
  /// be reached.
  static std::unique_ptr<Host> GetHost();
};

}  // namespace HostMgr
