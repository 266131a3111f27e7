#pragma once
/// The DNS configuration of a TCP/IP stack: host name, domain, name
/// servers and search domains.

#include <string>
#include <vector>

#include "platform/api/IpAddress.h"

namespace HykCtl::Network {

/// Reads and changes the DNS settings of one TCP/IP stack. Getters read
/// the host at each call; every change is applied at once (SaveConfig only
/// confirms it). Every operation may throw HostMgr::Lib::HostMgrException;
/// all of them throw "Unknown TCP/IP stack <name>" for a stack the host
/// does not have (the host has "defaultTcpipStack").
class DnsConfigImpl {
 public:
  /// The DNS settings of the TCP/IP stack `stack`.
  explicit DnsConfigImpl(std::string stack = "defaultTcpipStack");

  /// Re-reads the configuration from the host.
  void Refresh();

  /// The host name without domain ("tavi-01").
  std::string GetHostname() const;
  /// The domain name ("lab.example.net"); may be empty.
  std::string GetDomain() const;
  /// Sets the bare host name; the domain stays. Throws for a name that is
  /// not a valid DNS label (letters, digits and hyphens, 1..63 characters,
  /// not starting or ending with a hyphen).
  void SetHostname(const std::string& name);
  /// Sets host name and domain from "host.domain" (split at the first
  /// dot). Throws when any label is invalid.
  void SetFqdn(const std::string& fqdn);

  /// The name servers in use, in order: the user-configured ones, or the
  /// DHCP-supplied ones when DNS comes from DHCP.
  std::vector<HostMgr::Network::IpAddress> GetNameServers() const;
  /// The user-configured name servers, in order.
  std::vector<HostMgr::Network::IpAddress> GetUserNameServers() const;
  /// Removes every user-configured name server.
  void RemoveAllUserNameServers();
  /// Appends a user-configured name server; throws for the zero address
  /// or one already present.
  void AddUserNameServer(const HostMgr::Network::IpAddress& server);

  /// The search domains, in order.
  std::vector<std::string> GetSearchDomains() const;
  /// The search domains joined by single blanks.
  std::string GetSearchDomainsString() const;
  /// Replaces the search domains by the names of `domains` (separated by
  /// blanks or commas; an empty text empties the list).
  void SetSearchDomainsString(const std::string& domains);
  /// Appends one search domain unless it is already present.
  void AddUserSearchDomain(const std::string& domain);

  /// Makes the configuration persistent.
  void SaveConfig();

  /// The stack's name.
  const std::string& GetStack() const { return stack_; }

 private:
  std::string stack_;
};

}  // namespace HykCtl::Network
