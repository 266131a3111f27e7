#include "platform/api/IpAddress.h"

#include <arpa/inet.h>

#include <cstring>

#include "platform/api/HostMgrException.h"

namespace HostMgr::Network {
namespace {

bool ParseIpv4(std::string_view text, std::uint8_t* bytes) {
  // inet_pton's own rules (four decimal parts, no leading zeros) are the
  // address rules of the host; the copy keeps a NUL-terminated argument.
  if (text.empty() || text.size() > 15) {
    return false;
  }
  std::string copy(text);
  return inet_pton(AF_INET, copy.c_str(), bytes) == 1;
}

bool ParseIpv6(std::string_view text, std::uint8_t* bytes, std::string* zone) {
  std::string_view address = text;
  std::string_view zoneText;
  if (auto percent = text.find('%'); percent != std::string_view::npos) {
    address = text.substr(0, percent);
    zoneText = text.substr(percent + 1);
    if (zoneText.empty()) {
      return false;
    }
  }
  if (address.empty() || address.size() > INET6_ADDRSTRLEN) {
    return false;
  }
  std::string copy(address);
  if (inet_pton(AF_INET6, copy.c_str(), bytes) != 1) {
    return false;
  }
  if (zone != nullptr) {
    *zone = std::string(zoneText);
  }
  return true;
}

}  // namespace

std::unique_ptr<IpAddress> IpAddress::Parse(std::string_view text) {
  if (Ipv4Address::IsValidAddress(text)) {
    return std::make_unique<Ipv4Address>(text);
  }
  if (Ipv6Address::IsValidAddress(text)) {
    return std::make_unique<Ipv6Address>(text);
  }
  return nullptr;
}

std::string IpAddress::GetStringAddress() const {
  char text[INET6_ADDRSTRLEN];
  if (kind_ == kIpv4) {
    inet_ntop(AF_INET, bytes_.data(), text, sizeof text);
  } else {
    inet_ntop(AF_INET6, bytes_.data(), text, sizeof text);
  }
  return text;
}

bool IpAddress::IsZero() const {
  const std::size_t length = kind_ == kIpv4 ? 4 : 16;
  for (std::size_t i = 0; i < length; ++i) {
    if (bytes_[i] != 0) {
      return false;
    }
  }
  return true;
}

std::unique_ptr<IpAddress> IpAddress::Clone() const {
  if (kind_ == kIpv4) {
    return std::make_unique<Ipv4Address>(static_cast<const Ipv4Address&>(*this));
  }
  return std::make_unique<Ipv6Address>(static_cast<const Ipv6Address&>(*this));
}

bool IpAddress::operator==(const IpAddress& other) const {
  return kind_ == other.kind_ && bytes_ == other.bytes_ && zone_ == other.zone_;
}

Ipv4Address::Ipv4Address(std::uint32_t value) : IpAddress(kIpv4) {
  bytes_[0] = static_cast<std::uint8_t>(value >> 24);
  bytes_[1] = static_cast<std::uint8_t>(value >> 16);
  bytes_[2] = static_cast<std::uint8_t>(value >> 8);
  bytes_[3] = static_cast<std::uint8_t>(value);
}

Ipv4Address::Ipv4Address(std::string_view text) : IpAddress(kIpv4) {
  if (!ParseIpv4(text, bytes_.data())) {
    throw HostMgr::Lib::HostMgrException("Invalid IPv4 address: " + std::string(text));
  }
}

bool Ipv4Address::IsValidAddress(std::string_view text) {
  std::uint8_t bytes[4];
  return ParseIpv4(text, bytes);
}

bool Ipv4Address::IsValidNetmask() const {
  const std::uint32_t value = GetValue();
  if (value == 0) {
    return false;
  }
  const std::uint32_t inverted = ~value;
  return (inverted & (inverted + 1)) == 0;
}

std::uint32_t Ipv4Address::GetValue() const {
  return (static_cast<std::uint32_t>(bytes_[0]) << 24) |
         (static_cast<std::uint32_t>(bytes_[1]) << 16) |
         (static_cast<std::uint32_t>(bytes_[2]) << 8) | static_cast<std::uint32_t>(bytes_[3]);
}

Ipv6Address::Ipv6Address(const std::array<std::uint8_t, 16>& bytes) : IpAddress(kIpv6) {
  bytes_ = bytes;
}

Ipv6Address::Ipv6Address(std::string_view text) : IpAddress(kIpv6) {
  if (!ParseIpv6(text, bytes_.data(), &zone_)) {
    throw HostMgr::Lib::HostMgrException("Invalid IPv6 address: " + std::string(text));
  }
}

bool Ipv6Address::IsValidAddress(std::string_view text) {
  std::uint8_t bytes[16];
  return ParseIpv6(text, bytes, nullptr);
}

bool Ipv6Address::IsLinkLocal() const {
  return bytes_[0] == 0xfe && (bytes_[1] & 0xc0) == 0x80;
}

std::string Ipv6Address::GetScopedStringAddress() const {
  std::string text = GetStringAddress();
  if (!zone_.empty()) {
    text += '%';
    text += zone_;
  }
  return text;
}

}  // namespace HostMgr::Network
