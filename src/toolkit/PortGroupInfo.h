#pragma once
/// A portgroup as a list entry: name, virtual switch, active clients and
/// VLAN id, all as text.

#include <string>

#include "toolkit/InfoType.h"

namespace Tulk {

class PortGroupInfo : public InfoType {
 public:
  PortGroupInfo(std::string name, std::string virtualSwitch, std::string activeClients,
                std::string vlanId);

  const std::string& Name() const { return name_; }
  const std::string& VirtualSwitch() const { return virtualSwitch_; }
  const std::string& ActiveClients() const { return activeClients_; }
  const std::string& VlanId() const { return vlanId_; }

  std::string Heading() const override;
  std::string Row() const override;
  std::string DetailsTitle() const override;
  std::string NameLine() const override;
  std::string DetailsText() const override;

 private:
  std::string name_;
  std::string virtualSwitch_;
  std::string activeClients_;
  std::string vlanId_;
};

}  // namespace Tulk
