#include "platform/api/NameResolver.h"

#include <netdb.h>

#include <chrono>
#include <fstream>
#include <sstream>
#include <thread>

#include "platform/api/DnsConfigImpl.h"
#include "platform/sim/SimHost.h"
#include "platform/sim/SimState.h"

// The simulated host's resolver: the root's hosts file, then the state's
// DNS records ("network.dnsRecords") when a name server in use can be
// reached through the management NIC. Nothing here asks the machine the
// simulation runs on.

namespace HykCtl::Network {
namespace {

std::string Canonical(std::string name) {
  for (char& c : name) {
    if (c >= 'A' && c <= 'Z') {
      c = static_cast<char>(c - 'A' + 'a');
    }
  }
  if (!name.empty() && name.back() == '.') {
    name.pop_back();
  }
  return name;
}

// The addresses the root's hosts file gives `name` (exact names only, as
// the C library's "files" source matches them).
std::vector<std::string> FromHostsFile(const std::string& name) {
  std::vector<std::string> found;
  std::ifstream in(Sim::RootPath("/etc/hosts"));
  for (std::string line; std::getline(in, line);) {
    std::istringstream words(line.substr(0, line.find('#')));
    std::string address;
    if (!(words >> address)) {
      continue;
    }
    for (std::string alias; words >> alias;) {
      if (Canonical(alias) == name) {
        found.push_back(address);
        break;
      }
    }
  }
  return found;
}

std::vector<std::string> FromRecords(const Sim::json& network, const std::string& name) {
  std::vector<std::string> found;
  for (const auto& [key, addresses] : Sim::ObjectAt(network, "dnsRecords").items()) {
    if (Canonical(key) == name && addresses.is_array()) {
      for (const Sim::json& address : addresses) {
        found.push_back(address.get<std::string>());
      }
    }
  }
  return found;
}

}  // namespace

int NameResolver::Resolve(const std::string& name, std::vector<std::string>* addresses) {
  const int delayMs = Sim::ObjectAt(Sim::Query("HykCtl::Network::NameResolver::Resolve"), "network")
                          .value("resolverDelayMs", 0);
  if (delayMs > 0) {
    std::this_thread::sleep_for(std::chrono::milliseconds(delayMs));
  }
  const std::string wanted = Canonical(name);
  if (wanted.empty()) {
    return EAI_NONAME;
  }
  std::vector<std::string> found = FromHostsFile(wanted);
  if (found.empty()) {
    DnsConfigImpl dns;
    const std::vector<HostMgr::Network::IpAddress> servers = dns.GetNameServers();
    std::vector<std::string> candidates;
    if (wanted.find('.') == std::string::npos) {
      for (const std::string& domain : dns.GetSearchDomains()) {
        candidates.push_back(wanted + "." + Canonical(domain));
      }
    }
    candidates.push_back(wanted);

    const Sim::json& state = Sim::SimHost::Instance().State();
    const Sim::json& network = Sim::ObjectAt(state, "network");
    bool serverReachable = false;
    if (Sim::KernelNicCarriesTraffic(state, Sim::StringAt(network, "managementInterface"))) {
      for (const HostMgr::Network::IpAddress& server : servers) {
        serverReachable = serverReachable || Sim::IsReachable(state, server.GetStringAddress());
      }
    }
    if (!serverReachable) {
      return EAI_AGAIN;
    }
    for (const std::string& candidate : candidates) {
      found = FromRecords(network, candidate);
      if (!found.empty()) {
        break;
      }
    }
  }
  if (found.empty()) {
    return EAI_NONAME;
  }
  if (addresses != nullptr) {
    *addresses = std::move(found);
  }
  return 0;
}

}  // namespace HykCtl::Network
