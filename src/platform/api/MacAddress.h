#pragma once
/// A six-byte hardware (MAC) address.

#include <array>
#include <cstdint>
#include <string>
#include <string_view>

namespace HostMgr::Network {

/// A MAC address as six bytes; a plain value.
class MacAddress {
 public:
  using Bytes = std::array<std::uint8_t, 6>;

  /// The all-zero address 00:00:00:00:00:00.
  MacAddress() = default;
  /// From the six address bytes.
  explicit MacAddress(const Bytes& bytes) : bytes_(bytes) {}

  /// Parses six hexadecimal pairs separated by ':' or '-' (either case).
  /// Throws HostMgr::Lib::HostMgrException when `text` is not an address.
  static MacAddress FromString(std::string_view text);
  /// Whether FromString accepts `text`.
  static bool IsValidAddress(std::string_view text);

  /// The six address bytes.
  const Bytes& GetBytes() const { return bytes_; }
  /// Lower-case hexadecimal pairs separated by colons: "00:1a:2b:3c:4d:5e".
  std::string GetStringAddress() const;
  /// True for 00:00:00:00:00:00.
  bool IsZero() const;

  /// Same six bytes.
  bool operator==(const MacAddress& other) const = default;

 private:
  Bytes bytes_{};
};

}  // namespace HostMgr::Network
