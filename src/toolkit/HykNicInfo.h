#pragma once
/// A hypervisor-kernel NIC as a list entry: name, MAC address, portset
/// (the switch it is connected to) and portgroup.

#include <string>

#include "toolkit/InfoType.h"

namespace Tulk {

class HykNicInfo : public InfoType {
 public:
  HykNicInfo(std::string name, std::string mac, std::string portset, std::string portgroup);

  const std::string& Name() const { return name_; }
  const std::string& Mac() const { return mac_; }
  const std::string& Portset() const { return portset_; }
  const std::string& Portgroup() const { return portgroup_; }

  std::string Heading() const override;
  std::string Row() const override;
  std::string DetailsTitle() const override;
  std::string NameLine() const override;
  std::string DetailsText() const override;

 private:
  std::string name_;
  std::string mac_;
  std::string portset_;
  std::string portgroup_;
};

}  // namespace Tulk
