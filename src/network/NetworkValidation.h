#pragma once
/// The checks the management network's dialogs run on what the operator
/// typed, as pure functions of the texts.

#include <array>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace Tulk {

/// The inputs of the static IPv4 form, in the order they are checked.
enum class Ipv4Field { kAddress, kNetmask, kGateway };

/// The first invalid input of a static IPv4 configuration, checked in the
/// order address (a dotted quad), subnet mask (a dotted quad that is a
/// contiguous netmask), gateway (a dotted quad; empty is invalid);
/// nullopt when all three are valid.
std::optional<Ipv4Field> FirstInvalidIpv4(std::string_view address, std::string_view netmask,
                                          std::string_view gateway);

/// What is wrong with an input of the static IPv6 form.
struct Ipv6Problem {
  enum class Kind {
    /// Not "address/prefix" ("Invalid IP address").
    kInvalidAddress,
    /// A link-local address, fe80::/10 ("Invalid scope").
    kLinkLocal,
    /// The gateway is not an IPv6 address ("Invalid gateway address").
    kInvalidGateway,
  };
  /// 0 to 2 for the address inputs, 3 for the gateway.
  std::size_t field;
  Kind kind;
};

/// The number of static IPv6 address inputs.
inline constexpr std::size_t kStaticIpv6Inputs = 3;

/// The first problem of the static IPv6 form: the non-empty address inputs
/// from the first down (valid "address/prefix" first, then not
/// link-local), then the gateway when it is not empty. nullopt when all is
/// valid.
std::optional<Ipv6Problem> FirstInvalidIpv6(
    const std::array<std::string, kStaticIpv6Inputs>& addresses, std::string_view gateway);

/// Empty, or an IPv4 or IPv6 address.
bool IsDnsServerText(std::string_view text);

/// A valid server text in the host's own form (the compressed lower-case
/// form of IPv6 addresses); empty stays empty.
std::string CanonicalServerText(std::string_view text);

/// The label of the second name server in the description: "IPv6 DNS
/// Server" when the primary is an IPv4 address and the second an IPv6 one,
/// else "Alternate DNS Server" (catalogue ids).
std::uint32_t SecondServerLabel(std::string_view primary, std::string_view second);

/// The label of the second name server's input while the operator types
/// `typed`: "Alternate DNS Server" below three characters; from three on
/// the description's rule, with a text holding ":" taken for an IPv6
/// address in the making.
std::uint32_t SecondServerInputLabel(std::string_view primary, std::string_view typed);

}  // namespace Tulk
