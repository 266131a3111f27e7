#pragma once
/// Name resolution as the host's own programs see it.

#include <string>
#include <vector>

namespace HykCtl::Network {

/// Looks host names up the way the host's C library does for its own
/// programs: the hosts file first, then the name servers of the
/// "defaultTcpipStack" with its search domains.
///
/// On a host this is getaddrinfo(3) with no hints. The simulated host never
/// asks the machine it runs on: it answers from the root's "/etc/hosts" and
/// the state's DNS records (docs/simulated-host.md), so a test of the
/// simulated host's network cannot reach the real resolver or network.
class NameResolver {
 public:
  /// Resolves `name`. Returns 0 when it resolved (getaddrinfo's success),
  /// otherwise the getaddrinfo error code: EAI_NONAME when no source knows
  /// the name, EAI_AGAIN when no name server could be reached. The
  /// addresses found, in the order the sources gave them, are stored in
  /// `addresses` when it is given. May throw HostMgr::Lib::HostMgrException.
  static int Resolve(const std::string& name, std::vector<std::string>* addresses = nullptr);
};

}  // namespace HykCtl::Network
