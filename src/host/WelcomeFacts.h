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
  /// Installed memory in bytes (total pages x page size); 0 when unknown.
  std::uint64_t memoryBytes = 0;
};

/// Reads the facts from the host. Nothing throws: the welcome screen shows
/// what can be read. Each query that fails with the host-control exception
/// logs one line at error level and leaves its filler:
///
/// | Query | Line | Filler |
/// |---|---|---|
/// | management NIC (host layer) | "Getting management interface failed: %s" | no NIC: not DHCP,
/// IPv4 on, 0.0.0.0, no IPv6 | | its IP configuration | "Getting management IP configuration
/// failed: %s" | as without a NIC | | the kernel's IPv6 state | "Getting IPv6 state failed: %s" |
/// off | | host name (host layer) | "Getting host name failed: %s" | empty (no name line) | |
/// physical NICs | "Getting physical nics failed: %s" | present | | boot option | "Getting boot
/// option failed: %s" | not audit mode | | vendor | "Getting vendor name failed: %s" | empty | |
/// product | "Getting product name failed: %s" | "N/A" | | processor packages | "Getting processor
/// packages failed: %s" | 0 | | processor model | "Getting processor model failed: %s" | "N/A" | |
/// memory pages, page size | "Getting memory size failed: %s" | 0 (shown as "N/A") |
///
/// Decisions of this implementation: a failing NIC list counts as NICs
/// present, so that the screen neither claims that the host has no adapter
/// nor raises that alert on the host when it only could not ask; a boot
/// option that cannot be read (a non-zero status or the exception) is not
/// audit mode.
WelcomeFacts ReadWelcomeFacts();

}  // namespace Tulk
