#include "host/HykNicInfo.h"

namespace Tulk {

HykNicInfo::HykNicInfo(std::string name, std::string mac, std::string portset,
                       std::string portgroup)
    : name_(std::move(name)),
      mac_(std::move(mac)),
      portset_(std::move(portset)),
      portgroup_(std::move(portgroup)) {
}

std::string HykNicInfo::Heading() const {
  return "  {align:padding:8}Name{/align}{align:padding:19}MAC Address{/align}"
         "{align:padding:10}Portset{/align}{align:padding:20}Portgroup{/align}";
}

std::string HykNicInfo::Row() const {
  return "{align:padding:8}" + Shorten(name_, 6) + "{/align}{align:padding:19}" +
         Shorten(mac_, 17) + "{/align}{align:padding:10}" + Shorten(portset_, 8) +
         "{/align}{align:padding:20}" + Shorten(portgroup_, 18) + "{/align}";
}

std::string HykNicInfo::DetailsTitle() const {
  return "Hykernel NIC Details";
}

std::string HykNicInfo::NameLine() const {
  return "Hykernel NIC Name: " + name_;
}

std::string HykNicInfo::DetailsText() const {
  return "Name: " + name_ + "\nMAC Address: " + mac_ + "\nPortset: " + portset_ +
         "\nPortgroup: " + portgroup_;
}

}  // namespace Tulk
