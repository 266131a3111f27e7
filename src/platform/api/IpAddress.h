#pragma once
/// IP addresses of both families: the common base IpAddress and the two
/// concrete kinds Ipv4Address and Ipv6Address.

#include <array>
#include <cstdint>
#include <memory>
#include <string>
#include <string_view>
#include <utility>

namespace HostMgr::Network {

/// An IPv4 or IPv6 address. Callers that hold "an address of either
/// family" own one through std::unique_ptr<IpAddress> (see Parse, Clone);
/// GetKind tells the family. All data lives in this base, so copies of
/// the derived kinds are plain values.
class IpAddress {
 public:
  /// GetKind of an IPv4 address.
  static constexpr int kIpv4 = 0;
  /// GetKind of an IPv6 address.
  static constexpr int kIpv6 = 1;

  virtual ~IpAddress() = default;
  IpAddress(const IpAddress&) = default;
  IpAddress& operator=(const IpAddress&) = default;

  /// Parses an address of either family (an IPv6 text may carry a
  /// "%zone" suffix); null when `text` is neither.
  static std::unique_ptr<IpAddress> Parse(std::string_view text);

  /// 0 for IPv4, 1 for IPv6.
  int GetKind() const { return kind_; }
  /// GetKind() is kIpv4 or kIpv6.
  bool IsIpv4() const { return kind_ == kIpv4; }
  bool IsIpv6() const { return kind_ == kIpv6; }
  /// Dotted quad for IPv4 ("0.0.0.0" for the empty address); the
  /// compressed lower-case form for IPv6 ("::" when empty), without zone.
  std::string GetStringAddress() const;
  /// True for 0.0.0.0 and ::, the "no address" values.
  bool IsZero() const;
  /// An owned copy of the same kind.
  std::unique_ptr<IpAddress> Clone() const;

  /// Same family, same bytes and (IPv6) same zone.
  bool operator==(const IpAddress& other) const;

 protected:
  explicit IpAddress(int kind) : kind_(kind) {}

  int kind_;
  /// IPv4 uses the first four bytes, in network order.
  std::array<std::uint8_t, 16> bytes_{};
  /// IPv6 zone (interface name) of a scoped address; empty otherwise.
  std::string zone_;
};

/// An IPv4 address; the default value 0.0.0.0 stands for "no address".
class Ipv4Address : public IpAddress {
 public:
  /// 0.0.0.0.
  Ipv4Address() : IpAddress(kIpv4) {}
  /// From the address as a number in host byte order (10.0.0.1 is
  /// 0x0A000001).
  explicit Ipv4Address(std::uint32_t value);
  /// Parses a dotted quad. Throws HostMgr::Lib::HostMgrException when
  /// IsValidAddress(text) is false.
  explicit Ipv4Address(std::string_view text);

  /// Exactly four decimal numbers 0..255 separated by dots, no blanks, no
  /// leading zeros ("10.0.0.1"; not "10.0.1", "10.0.0.01", "256.0.0.1").
  static bool IsValidAddress(std::string_view text);

  /// True when the address is a contiguous run of one bits followed by
  /// zero bits, at least one bit set: 255.255.255.0 and 255.255.255.255
  /// are netmasks, 0.0.0.0 and 255.0.255.0 are not.
  bool IsValidNetmask() const;
  /// The address in host byte order.
  std::uint32_t GetValue() const;
};

/// An IPv6 address, optionally scoped to an interface ("fe80::1%hyk0").
/// The default value :: stands for "no address".
class Ipv6Address : public IpAddress {
 public:
  /// ::, without zone.
  Ipv6Address() : IpAddress(kIpv6) {}
  /// From the sixteen address bytes, without zone.
  explicit Ipv6Address(const std::array<std::uint8_t, 16>& bytes);
  /// Parses any textual IPv6 form, with an optional "%zone" suffix.
  /// Throws HostMgr::Lib::HostMgrException when IsValidAddress(text) is
  /// false.
  explicit Ipv6Address(std::string_view text);

  /// Any textual IPv6 form (including an embedded IPv4 tail), optionally
  /// followed by "%" and a non-empty zone name. No prefix length.
  static bool IsValidAddress(std::string_view text);

  /// The sixteen address bytes.
  const std::array<std::uint8_t, 16>& GetBytes() const { return bytes_; }
  /// The first ten bits are those of fe80::/10.
  bool IsLinkLocal() const;
  /// The zone (interface name), empty when none; SetZone replaces it.
  const std::string& GetZone() const { return zone_; }
  void SetZone(std::string zone) { zone_ = std::move(zone); }
  /// GetStringAddress with "%zone" appended when a zone is set.
  std::string GetScopedStringAddress() const;
};

}  // namespace HostMgr::Network
