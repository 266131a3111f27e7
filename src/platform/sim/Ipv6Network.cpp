#include "platform/api/Ipv6Network.h"

#include <charconv>

#include "platform/api/HostMgrException.h"

namespace HostMgr::Network {
namespace {

bool Split(std::string_view text, std::string_view& address, int& prefix) {
  auto slash = text.find('/');
  if (slash == std::string_view::npos) {
    return false;
  }
  address = text.substr(0, slash);
  std::string_view digits = text.substr(slash + 1);
  if (digits.empty() || digits.size() > 3 || address.find('%') != std::string_view::npos) {
    return false;
  }
  auto [end, error] = std::from_chars(digits.data(), digits.data() + digits.size(), prefix);
  return error == std::errc() && end == digits.data() + digits.size() && prefix >= 1 &&
         prefix <= 128 && Ipv6Address::IsValidAddress(address);
}

}  // namespace

Ipv6Network::Ipv6Network(Ipv6Address address, int prefixLength, int type, int scope)
    : address_(std::move(address)), prefixLength_(prefixLength), type_(type), scope_(scope) {
}

Ipv6Network Ipv6Network::FromString(std::string_view text) {
  std::string_view address;
  int prefix = 0;
  if (!Split(text, address, prefix)) {
    throw HostMgr::Lib::HostMgrException("Invalid IPv6 network: " + std::string(text));
  }
  Ipv6Address parsed(address);
  const int scope = parsed.IsLinkLocal() ? kScopeLinkLocal : kScopeGlobal;
  return Ipv6Network(parsed, prefix, kTypeStatic, scope);
}

bool Ipv6Network::IsValidAddressAndNetmask(std::string_view text) {
  std::string_view address;
  int prefix = 0;
  return Split(text, address, prefix);
}

std::string Ipv6Network::ToString() const {
  return address_.GetStringAddress() + "/" + std::to_string(prefixLength_);
}

bool Ipv6Network::operator==(const Ipv6Network& other) const {
  return address_ == other.address_ && prefixLength_ == other.prefixLength_ &&
         type_ == other.type_ && scope_ == other.scope_;
}

}  // namespace HostMgr::Network
