#pragma once
/// An IPv6 address of an interface with its prefix length, origin and
/// scope.

#include <string>
#include <string_view>

#include "platform/api/IpAddress.h"

namespace HostMgr::Network {

/// One IPv6 address configured on a kernel NIC; a plain value.
class Ipv6Network {
 public:
  /// Address types (GetAddressType): where the address came from.
  /// Configured by the operator (the type static entries are written with).
  static constexpr int kTypeStatic = 0;
  /// The interface's own link-local address, derived from its MAC.
  static constexpr int kTypeLinkLayer = 1;
  /// Stateless autoconfiguration from router advertisements.
  static constexpr int kTypeAutoconf = 7;
  /// Leased from a DHCPv6 server.
  static constexpr int kTypeDhcp = 9;

  /// Scopes (GetScope).
  static constexpr int kScopeUnknown = 0;
  static constexpr int kScopeLinkLocal = 1;
  static constexpr int kScopeSiteLocal = 2;
  static constexpr int kScopeGlobal = 3;

  /// ::/64, static, global.
  Ipv6Network() = default;
  /// The given address, prefix length, type and scope.
  Ipv6Network(Ipv6Address address, int prefixLength, int type = kTypeStatic,
              int scope = kScopeGlobal);

  /// Parses "address/prefix" (prefix 1..128, no zone). Type static, scope
  /// link-local for fe80::/10 addresses and global otherwise. Throws
  /// HostMgr::Lib::HostMgrException when IsValidAddressAndNetmask is false.
  static Ipv6Network FromString(std::string_view text);
  /// "address/prefix" with a valid IPv6 address (no zone) and a decimal
  /// prefix length from 1 to 128.
  static bool IsValidAddressAndNetmask(std::string_view text);

  /// Accessors of the four parts.
  const Ipv6Address& GetAddress() const { return address_; }
  void SetAddress(const Ipv6Address& address) { address_ = address; }
  int GetPrefixLength() const { return prefixLength_; }
  void SetPrefixLength(int length) { prefixLength_ = length; }
  int GetAddressType() const { return type_; }
  void SetAddressType(int type) { type_ = type; }
  int GetScope() const { return scope_; }
  void SetScope(int scope) { scope_ = scope; }

  /// The address text alone (as Ipv6Address::GetStringAddress).
  std::string GetStringAddress() const { return address_.GetStringAddress(); }
  /// "address/prefix".
  std::string ToString() const;

  /// All four parts equal.
  bool operator==(const Ipv6Network& other) const;

 private:
  Ipv6Address address_;
  int prefixLength_ = 64;
  int type_ = kTypeStatic;
  int scope_ = kScopeGlobal;
};

}  // namespace HostMgr::Network
