#include "host/PortGroupInfo.h"

namespace Tulk {

PortGroupInfo::PortGroupInfo(std::string name, std::string virtualSwitch, std::string activeClients,
                             std::string vlanId)
    : name_(std::move(name)),
      virtualSwitch_(std::move(virtualSwitch)),
      activeClients_(std::move(activeClients)),
      vlanId_(std::move(vlanId)) {
}

std::string PortGroupInfo::Heading() const {
  return "  {align:padding:20}Portgroup Name{/align}{align:padding:16}Virtual Switch{/align}"
         "{align:padding:16}Active Clients{/align}{align:padding:7}VLAN ID{/align}";
}

std::string PortGroupInfo::Row() const {
  return "{align:padding:20}" + Shorten(name_, 18) + "{/align}{align:padding:16}" +
         Shorten(virtualSwitch_, 14) + "{/align}{align:padding:16}" + activeClients_ +
         "{/align}{align:padding:7}" + vlanId_ + "{/align}";
}

std::string PortGroupInfo::DetailsTitle() const {
  return "Portgroup Details";
}

std::string PortGroupInfo::NameLine() const {
  return "Portgroup Name: " + name_;
}

std::string PortGroupInfo::DetailsText() const {
  return "Name: " + name_ + "\nVirtual Switch: " + virtualSwitch_ +
         "\nActive Clients: " + activeClients_ + "\nVLAN ID: " + vlanId_;
}

}  // namespace Tulk
