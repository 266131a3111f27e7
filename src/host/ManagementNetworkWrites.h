#pragma once
/// The writes that apply the management network's settings to the host,
/// one function per kind of change, and the reads they compare with.
///
/// Each makes the host-control objects it needs (the NIC by interface
/// name, a fresh snapshot each time) and lets them go. None of them logs or
/// throws: the result carries the host-control library's message, and the
/// caller logs it in the words of its own step.

#include <string>
#include <vector>

#include "platform/api/IpAddress.h"
#include "platform/api/IpConfig.h"

namespace Tulk {

/// The outcome of one host operation: ok, or the library's message.
struct NetworkWrite {
  bool ok = true;
  std::string error;

  explicit operator bool() const { return ok; }
  /// A failure with `message`.
  static NetworkWrite Failed(std::string message) { return {false, std::move(message)}; }
};

/// The NIC's IP configuration as it is now.
NetworkWrite ReadNicIpConfig(const std::string& nic, HostMgr::Network::IpConfig& config);

/// Hands `config` to the NIC (HykNicImpl::SetIpConfig).
NetworkWrite WriteNicIpConfig(const std::string& nic, const HostMgr::Network::IpConfig& config);

/// Writes the kernel's IPv6 flag; it takes effect at the next boot.
NetworkWrite WriteKernelIpv6Enabled(bool enabled);

/// Whether the NIC uses DHCP and holds a bound lease.
NetworkWrite IsNicLeaseBound(const std::string& nic, bool& bound);

/// Renews the NIC's DHCP lease.
NetworkWrite RenewNicLease(const std::string& nic);

/// Gives the NIC the MAC address of physical NIC `pnic`.
NetworkWrite TakeMacFromPnic(const std::string& nic, const std::string& pnic);

/// Restarts the NIC's interface (down and up again; after a VLAN change).
NetworkWrite RestartNicInterface(const std::string& nic);

/// The kernel's IPv4 default gateway (0.0.0.0 when none).
NetworkWrite ReadIpv4DefaultGateway(HostMgr::Network::Ipv4Address& gateway);

/// Sets the kernel's IPv4 default gateway; 0.0.0.0 removes it.
NetworkWrite WriteIpv4DefaultGateway(const HostMgr::Network::Ipv4Address& gateway);

/// Sets the kernel's IPv6 default gateway; :: removes it.
NetworkWrite WriteIpv6DefaultGateway(const HostMgr::Network::Ipv6Address& gateway);

/// Sets the host name: a name holding "." as a fully qualified name
/// (SetFqdn: host name and domain), any other as the bare host name
/// (SetHostname, the domain stays).
NetworkWrite WriteHostName(const std::string& name);

/// Removes every user-configured name server, then adds those of `servers`
/// in order, skipping empty texts and the all-zero addresses.
NetworkWrite ReplaceNameServers(const std::vector<std::string>& servers);

/// Sets the search list to the host's domain alone, adds each of
/// `suffixes` in order (a name already listed is not added twice) and
/// saves the DNS configuration.
NetworkWrite ResetSearchDomains(const std::vector<std::string>& suffixes);

}  // namespace Tulk
