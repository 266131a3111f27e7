#include "platform/api/IpConfig.h"

#include <algorithm>

namespace HostMgr::Network {

void IpConfig::SetIpv4UseNone(bool none) {
  ipv4None_ = none;
  if (none) {
    dhcp_ = false;
  }
}

void IpConfig::SetDhcp(bool dhcp) {
  dhcp_ = dhcp;
  if (dhcp) {
    ipv4None_ = false;
  }
}

void IpConfig::AddIpv6Network(const Ipv6Network& network) {
  for (const Ipv6Network& present : ipv6Networks_) {
    if (present.GetAddress() == network.GetAddress()) {
      return;
    }
  }
  ipv6Networks_.push_back(network);
}

bool IpConfig::RemoveIpv6Network(const Ipv6Address& address) {
  auto found = std::find_if(ipv6Networks_.begin(), ipv6Networks_.end(),
                            [&](const Ipv6Network& n) { return n.GetAddress() == address; });
  if (found == ipv6Networks_.end()) {
    return false;
  }
  ipv6Networks_.erase(found);
  return true;
}

void IpConfig::ClearStaticIpv6Networks() {
  std::erase_if(ipv6Networks_, [](const Ipv6Network& n) {
    return n.GetAddressType() == Ipv6Network::kTypeStatic;
  });
}

}  // namespace HostMgr::Network
