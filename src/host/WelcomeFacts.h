#pragma once
/// What the welcome screen shows about the host, as plain values, and the
/// query that reads them.

#include <cstdint>
#include <string>
#include <vector>

namespace Tulk {

/// One IPv6 address of the management NIC.
struct Ipv6Entry {
  /// The address text without prefix or zone ("2001:db8::41").
  std::string address;
  /// Where it came from: 0 static, 1 link layer, 7 autoconfiguration, 9
  /// DHCPv6 (HostMgr::Network::Ipv6Network's types).
  int type = 0;
};

/// The host as the welcome summary shows it.
struct WelcomeFacts {
  /// The management NIC's IPv4 configuration comes from DHCP.
  bool dhcp = false;
  /// IPv4 is switched off on the management NIC.
  bool ipv4None = false;
  /// The management NIC's IPv4 address; "0.0.0.0" for none.
  std::string ipv4Address = "0.0.0.0";
  /// The management NIC's IPv6 addresses, in the host's order.
  std::vector<Ipv6Entry> ipv6;
  /// The hypervisor kernel has IPv6 enabled.
  bool kernelIpv6Enabled = false;
  /// The host name without domain.
  std::string hostname;
  /// The host has at least one physical NIC.
  bool hasPhysicalNics = false;
  /// The host runs in audit mode (boot option node, first byte 1).
  bool auditMode = false;
  /// System vendor and product name as the firmware reports them.
  std::string vendor;
  std::string product;
  /// Processor packages and the model name as the CPU reports it.
  int cpuPackages = 0;
  std::string cpuModel;
  /// Installed memory in bytes (total pages x page size).
  std::uint64_t memoryBytes = 0;
};

/// Reads the facts from the host. The management NIC comes from the host
/// layer's query (a host without one, or a failing lookup, leaves the
/// address fields at their defaults: not DHCP, IPv4 on, 0.0.0.0, no IPv6
/// addresses). Every other host-control failure passes to the caller as
/// HostMgr::Lib::HostMgrException: the welcome screen has no sensible
/// state without the host, and the exception ends the console's run.
WelcomeFacts ReadWelcomeFacts();

}  // namespace Tulk
