#pragma once
/// One physical NIC of the host (such as hynic0).

#include <memory>
#include <string>

#include "platform/api/MacAddress.h"

namespace HykCtl::Network {

/// The PCI device behind a physical NIC; a plain value.
struct PciDevice {
  /// The PCI address, "0000:3b:00.0".
  std::string address;
  /// The device's vendor name.
  std::string vendorName;
  /// The device's model name.
  std::string deviceName;
  /// The device's one-line description (vendor and model, as the host
  /// shows it in adapter lists); may be empty.
  std::string description;
};

/// A physical NIC as the host saw it when the object was made or last
/// refreshed (see HykNicImpl for IsStale and Refresh). Every operation may
/// throw HostMgr::Lib::HostMgrException.
class PnicImpl {
 public:
  /// The physical NIC named `name`. Throws when there is none.
  explicit PnicImpl(const std::string& name);
  /// Copies share the snapshot until one of them refreshes.
  ~PnicImpl();
  PnicImpl(const PnicImpl&);
  PnicImpl& operator=(const PnicImpl&);
  PnicImpl(PnicImpl&&) noexcept;
  PnicImpl& operator=(PnicImpl&&) noexcept;

  /// True when the host changed after the snapshot was taken.
  bool IsStale() const;
  /// Takes a new snapshot.
  void Refresh();

  /// The NIC's name, such as "hynic0".
  std::string GetName() const;
  /// The PCI device.
  PciDevice GetPciDevice() const;
  /// The NIC's burnt-in MAC address.
  HostMgr::Network::MacAddress GetMacAddress() const;
  /// True when the link is up.
  bool IsLinkUp() const;
  /// Link speed in Mbit/s; 0 when the link is down.
  int GetLinkSpeed() const;
  /// The driver's name.
  std::string GetDriver() const;

 private:
  struct Snapshot;
  const Snapshot& Current() const;

  std::string name_;
  std::shared_ptr<const Snapshot> snapshot_;
};

}  // namespace HykCtl::Network
