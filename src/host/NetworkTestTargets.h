#pragma once
/// What "Test Management Network" checks by default, and how a ping target
/// typed by the operator is read. Nothing here throws.

#include <optional>
#include <string>
#include <vector>

namespace Tulk {

/// How many addresses the test pings at most.
inline constexpr std::size_t kPingTargetCount = 3;

/// The addresses the host knows, as the defaults are chosen from them.
struct KnownTestAddresses {
  /// The IPv4 default gateway (empty or "0.0.0.0" for none).
  std::string ipv4Gateway;
  /// The name servers in use, in their configured order, with their family.
  struct NameServer {
    std::string address;
    bool ipv6 = false;
  };
  std::vector<NameServer> nameServers;
  /// IPv6 is enabled in the hypervisor kernel.
  bool ipv6Enabled = false;
  /// The IPv6 default gateway without zone (empty or "::" for none).
  std::string ipv6Gateway;
};

/// The default ping targets, at most kPingTargetCount.
///
/// Decisions of this implementation (the order when more than three are
/// known): the IPv4 default gateway, the IPv4 name servers in their
/// configured order, then, only when IPv6 is enabled in the kernel, the
/// IPv6 default gateway and the IPv6 name servers. Each family's gateway
/// comes before its name servers (the first hop before what lies beyond
/// it), and IPv4 before IPv6 (the management address the host is known by).
/// Empty and all-zero addresses and repeats are passed over; the first
/// three that remain are taken.
std::vector<std::string> OrderPingTargets(const KnownTestAddresses& known);

/// The name the test resolves: `hostName` "." `domain`, or the bare host
/// name when the domain is empty.
std::string TestHostName(const std::string& hostName, const std::string& domain);

/// The test's defaults as the host gives them now.
struct NetworkTestDefaults {
  /// The addresses to pre-fill (OrderPingTargets()).
  std::vector<std::string> pingTargets;
  /// The name to pre-fill (TestHostName()).
  std::string hostName;
  /// The management NIC's name; empty when the host has none.
  std::string interfaceName;
};

/// Reads the gateways ("defaultTcpipStack"), the name servers, the kernel's
/// IPv6 switch, the host name and domain and the management NIC. A
/// host-control failure logs "Reading the network test defaults failed:
/// %s" at error level; what was read before it is kept.
NetworkTestDefaults ReadNetworkTestDefaults();

/// An address typed as a ping target.
struct PingTarget {
  /// The text as typed (with its zone, when it has one).
  std::string address;
  /// An IPv6 address in fe80::/10.
  bool linkLocal = false;
  /// The text carries a "%zone" suffix.
  bool zoned = false;
};

/// Reads `text` as an IPv4 or IPv6 address (an IPv6 one may carry a
/// "%zone"); nullopt when it is neither.
std::optional<PingTarget> ParsePingTarget(const std::string& text);

}  // namespace Tulk
