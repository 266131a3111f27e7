#pragma once
/// The host's hardware identity: vendor, product, tags and firmware
/// versions.

#include <string>

namespace HykCtl::Hardware {

/// Every getter may throw HostMgr::Lib::HostMgrException. Texts are as the
/// firmware reports them (they may carry stray blanks); an absent value is
/// the empty text.
class HardwareInfoImpl {
 public:
  /// The system vendor ("Kestrel Computing").
  std::string GetVendorName() const;
  /// The system product name ("KX2200 Rack Server").
  std::string GetProductName() const;
  /// The system serial number.
  std::string GetSerialNumber() const;
  /// The vendor's service tag.
  std::string GetServiceTag() const;
  /// The owner's asset tag.
  std::string GetAssetTag() const;
  /// The BIOS version text.
  std::string GetBiosVersion() const;
  /// The baseboard management controller's firmware version.
  std::string GetBmcVersion() const;
  /// The CPLD firmware version.
  std::string GetCpldVersion() const;
  /// The PLSA firmware version.
  std::string GetPlsaVersion() const;
};

}  // namespace HykCtl::Hardware
