#pragma once
/// A portgroup as a list entry: name, virtual switch, active clients and
/// VLAN id, all as text.

#include <string>

#include "host/InfoType.h"

namespace Tulk {

class PortGroupInfo : public InfoType {
 public:
  /// An entry from the portgroup's values as the host reports them.
  PortGroupInfo(std::string name, std::string virtualSwitch, std::string activeClients,
                std::string vlanId);

  /// The values as given.
  const std::string& Name() const { return name_; }
  const std::string& VirtualSwitch() const { return virtualSwitch_; }
  const std::string& ActiveClients() const { return activeClients_; }
  const std::string& VlanId() const { return vlanId_; }

  /// "Portgroup Name", "Virtual Switch", "Active Clients", "VLAN ID" in
  /// fields of 20, 16, 16 and 7 columns after two blanks.
  std::string Heading() const override;
  /// The four values in the heading's fields, the name shortened beyond
  /// 18 bytes and the switch beyond 14; clients and VLAN as they are.
  std::string Row() const override;
  /// "Portgroup Details".
  std::string DetailsTitle() const override;
  /// "Portgroup Name: " and the name.
  std::string NameLine() const override;
  /// One line per value: "Name: ", "Virtual Switch: ",
  /// "Active Clients: ", "VLAN ID: ".
  std::string DetailsText() const override;

 private:
  std::string name_;
  std::string virtualSwitch_;
  std::string activeClients_;
  std::string vlanId_;
};

}  // namespace Tulk
