#pragma once
/// A hypervisor-kernel NIC as a list entry: name, MAC address, portset
/// (the switch it is connected to) and portgroup.

#include <string>

#include "host/InfoType.h"

namespace Tulk {

class HykNicInfo : public InfoType {
 public:
  /// An entry from the NIC's values as the host reports them.
  HykNicInfo(std::string name, std::string mac, std::string portset, std::string portgroup);

  /// The values as given.
  const std::string& Name() const { return name_; }
  const std::string& Mac() const { return mac_; }
  const std::string& Portset() const { return portset_; }
  const std::string& Portgroup() const { return portgroup_; }

  /// "Name", "MAC Address", "Portset", "Portgroup" in fields of 8, 19,
  /// 10 and 20 columns after two blanks.
  std::string Heading() const override;
  /// The four values in the heading's fields, the name shortened beyond
  /// 6 bytes, the MAC address beyond 17, the portset beyond 8 and the
  /// portgroup beyond 18.
  std::string Row() const override;
  /// "Hykernel NIC Details".
  std::string DetailsTitle() const override;
  /// "Hykernel NIC Name: " and the name.
  std::string NameLine() const override;
  /// One line per value: "Name: ", "MAC Address: ", "Portset: ",
  /// "Portgroup: ".
  std::string DetailsText() const override;

 private:
  std::string name_;
  std::string mac_;
  std::string portset_;
  std::string portgroup_;
};

}  // namespace Tulk
