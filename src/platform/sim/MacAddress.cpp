#include "platform/api/MacAddress.h"

#include <cstdio>

#include "platform/api/HostMgrException.h"

namespace HostMgr::Network {
namespace {

int HexDigit(char c) {
  if (c >= '0' && c <= '9') {
    return c - '0';
  }
  if (c >= 'a' && c <= 'f') {
    return c - 'a' + 10;
  }
  if (c >= 'A' && c <= 'F') {
    return c - 'A' + 10;
  }
  return -1;
}

bool ParseMac(std::string_view text, MacAddress::Bytes& bytes) {
  if (text.size() != 17) {
    return false;
  }
  const char separator = text[2];
  if (separator != ':' && separator != '-') {
    return false;
  }
  for (std::size_t i = 0; i < 6; ++i) {
    const std::size_t at = i * 3;
    const int high = HexDigit(text[at]);
    const int low = HexDigit(text[at + 1]);
    if (high < 0 || low < 0 || (i < 5 && text[at + 2] != separator)) {
      return false;
    }
    bytes[i] = static_cast<std::uint8_t>(high * 16 + low);
  }
  return true;
}

}  // namespace

MacAddress MacAddress::FromString(std::string_view text) {
  Bytes bytes{};
  if (!ParseMac(text, bytes)) {
    throw HostMgr::Lib::HostMgrException("Invalid MAC address: " + std::string(text));
  }
  return MacAddress(bytes);
}

bool MacAddress::IsValidAddress(std::string_view text) {
  Bytes bytes{};
  return ParseMac(text, bytes);
}

std::string MacAddress::GetStringAddress() const {
  char text[18];
  std::snprintf(text, sizeof text, "%02x:%02x:%02x:%02x:%02x:%02x", bytes_[0], bytes_[1], bytes_[2],
                bytes_[3], bytes_[4], bytes_[5]);
  return text;
}

bool MacAddress::IsZero() const {
  for (std::uint8_t byte : bytes_) {
    if (byte != 0) {
      return false;
    }
  }
  return true;
}

}  // namespace HostMgr::Network
