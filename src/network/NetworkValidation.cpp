#include "network/NetworkValidation.h"

#include "platform/api/IpAddress.h"
#include "platform/api/Ipv6Network.h"
#include "render/TextId.h"

namespace Tulk {
namespace {

using HostMgr::Network::Ipv4Address;
using HostMgr::Network::Ipv6Address;

bool IsIpv4(std::string_view text) {
  return Ipv4Address::IsValidAddress(text);
}

bool IsIpv6(std::string_view text) {
  return Ipv6Address::IsValidAddress(text);
}

}  // namespace

std::optional<Ipv4Field> FirstInvalidIpv4(std::string_view address, std::string_view netmask,
                                          std::string_view gateway) {
  if (!IsIpv4(address)) {
    return Ipv4Field::kAddress;
  }
  if (!IsIpv4(netmask) || !Ipv4Address(netmask).IsValidNetmask()) {
    return Ipv4Field::kNetmask;
  }
  if (!IsIpv4(gateway)) {
    return Ipv4Field::kGateway;
  }
  return std::nullopt;
}

std::optional<Ipv6Problem> FirstInvalidIpv6(
    const std::array<std::string, kStaticIpv6Inputs>& addresses, std::string_view gateway) {
  for (std::size_t i = 0; i < addresses.size(); ++i) {
    const std::string& text = addresses[i];
    if (text.empty()) {
      continue;
    }
    if (!HostMgr::Network::Ipv6Network::IsValidAddressAndNetmask(text)) {
      return Ipv6Problem{i, Ipv6Problem::Kind::kInvalidAddress};
    }
    if (HostMgr::Network::Ipv6Network::FromString(text).GetAddress().IsLinkLocal()) {
      return Ipv6Problem{i, Ipv6Problem::Kind::kLinkLocal};
    }
  }
  if (!gateway.empty() && !IsIpv6(gateway)) {
    return Ipv6Problem{kStaticIpv6Inputs, Ipv6Problem::Kind::kInvalidGateway};
  }
  return std::nullopt;
}

bool IsDnsServerText(std::string_view text) {
  return text.empty() || IsIpv4(text) || IsIpv6(text);
}

std::string CanonicalServerText(std::string_view text) {
  if (IsIpv6(text)) {
    return Ipv6Address(text).GetScopedStringAddress();
  }
  if (IsIpv4(text)) {
    return Ipv4Address(text).GetStringAddress();
  }
  return std::string(text);
}

std::uint32_t SecondServerLabel(std::string_view primary, std::string_view second) {
  return IsIpv4(primary) && IsIpv6(second) ? TextId::kIpv6DnsLabel : TextId::kAlternateDnsLabel;
}

std::uint32_t SecondServerInputLabel(std::string_view primary, std::string_view typed) {
  if (typed.size() < 3) {
    return TextId::kAlternateDnsLabel;
  }
  return IsIpv4(primary) && typed.find(':') != std::string_view::npos ? TextId::kIpv6DnsLabel
                                                                      : TextId::kAlternateDnsLabel;
}

}  // namespace Tulk
