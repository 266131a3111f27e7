#include "platform/api/DnsConfigImpl.h"

#include <algorithm>
#include <cctype>

#include "platform/sim/SimState.h"

namespace HykCtl::Network {
namespace {

std::string Op(const char* method) {
  return std::string("HykCtl::Network::DnsConfigImpl::") + method;
}

bool IsLabel(const std::string& label) {
  if (label.empty() || label.size() > 63 || label.front() == '-' || label.back() == '-') {
    return false;
  }
  return std::all_of(label.begin(), label.end(), [](char c) {
    return std::isalnum(static_cast<unsigned char>(c)) != 0 || c == '-';
  });
}

std::vector<std::string> SplitNames(const std::string& text) {
  std::vector<std::string> names;
  std::string current;
  for (char c : text) {
    if (c == ' ' || c == ',' || c == '\t' || c == '\n') {
      if (!current.empty()) {
        names.push_back(current);
      }
      current.clear();
    } else {
      current += c;
    }
  }
  if (!current.empty()) {
    names.push_back(current);
  }
  return names;
}

std::vector<HostMgr::Network::IpAddress> Addresses(const Sim::json& array) {
  std::vector<HostMgr::Network::IpAddress> servers;
  for (const Sim::json& text : array) {
    servers.push_back(*HostMgr::Network::IpAddress::Parse(text.get<std::string>()));
  }
  return servers;
}

// Name servers come from DHCP when the management NIC asks for it and
// actually uses DHCP or DHCPv6.
bool DnsFromDhcp(const Sim::json& network) {
  const Sim::json* nic = Sim::FindByName(Sim::ArrayAt(network, "hykernelNics"),
                                         Sim::StringAt(network, "managementInterface"));
  if (nic == nullptr || !nic->value("dnsFromDhcp", false)) {
    return false;
  }
  const Sim::json& ipv6 = Sim::ObjectAt(*nic, "ipv6");
  return Sim::StringAt(Sim::ObjectAt(*nic, "ipv4"), "mode") == "dhcp" ||
         (ipv6.value("enabled", false) && ipv6.value("dhcpv6", false));
}

}  // namespace

DnsConfigImpl::DnsConfigImpl(std::string stack) : stack_(std::move(stack)) {
}

void DnsConfigImpl::Refresh() {
  Sim::Query(Op("Refresh"));
  Sim::RequireStack(stack_);
}

std::string DnsConfigImpl::GetHostname() const {
  const Sim::json& state = Sim::Query(Op("GetHostname"));
  Sim::RequireStack(stack_);
  return Sim::StringAt(Sim::ObjectAt(Sim::ObjectAt(state, "network"), "dns"), "hostname");
}

std::string DnsConfigImpl::GetDomain() const {
  const Sim::json& state = Sim::Query(Op("GetDomain"));
  Sim::RequireStack(stack_);
  return Sim::StringAt(Sim::ObjectAt(Sim::ObjectAt(state, "network"), "dns"), "domain");
}

void DnsConfigImpl::SetHostname(const std::string& name) {
  Sim::RequireStack(stack_);
  Sim::Change(Op("SetHostname"), [&](Sim::json& state) {
    if (!IsLabel(name)) {
      Sim::Fail("Invalid host name '" + name + "'");
    }
    Sim::ObjectFor(Sim::ObjectFor(state, "network"), "dns")["hostname"] = name;
  });
}

void DnsConfigImpl::SetFqdn(const std::string& fqdn) {
  Sim::RequireStack(stack_);
  Sim::Change(Op("SetFqdn"), [&](Sim::json& state) {
    const auto dot = fqdn.find('.');
    const std::string host = fqdn.substr(0, dot);
    const std::string domain = dot == std::string::npos ? "" : fqdn.substr(dot + 1);
    bool valid = IsLabel(host);
    std::string rest = domain;
    while (valid && !rest.empty()) {
      const auto next = rest.find('.');
      valid = IsLabel(rest.substr(0, next));
      rest = next == std::string::npos ? "" : rest.substr(next + 1);
    }
    if (!valid || (dot != std::string::npos && domain.empty())) {
      Sim::Fail("Invalid fully qualified name '" + fqdn + "'");
    }
    Sim::json& dns = Sim::ObjectFor(Sim::ObjectFor(state, "network"), "dns");
    dns["hostname"] = host;
    dns["domain"] = domain;
  });
}

std::vector<HostMgr::Network::IpAddress> DnsConfigImpl::GetNameServers() const {
  const Sim::json& state = Sim::Query(Op("GetNameServers"));
  Sim::RequireStack(stack_);
  const Sim::json& network = Sim::ObjectAt(state, "network");
  const Sim::json& dns = Sim::ObjectAt(network, "dns");
  return Addresses(Sim::ArrayAt(dns, DnsFromDhcp(network) ? "dhcpNameServers" : "nameServers"));
}

std::vector<HostMgr::Network::IpAddress> DnsConfigImpl::GetUserNameServers() const {
  const Sim::json& state = Sim::Query(Op("GetUserNameServers"));
  Sim::RequireStack(stack_);
  return Addresses(
      Sim::ArrayAt(Sim::ObjectAt(Sim::ObjectAt(state, "network"), "dns"), "nameServers"));
}

void DnsConfigImpl::RemoveAllUserNameServers() {
  Sim::RequireStack(stack_);
  Sim::Change(Op("RemoveAllUserNameServers"), [](Sim::json& state) {
    Sim::ObjectFor(Sim::ObjectFor(state, "network"), "dns")["nameServers"] = Sim::json::array();
  });
}

void DnsConfigImpl::AddUserNameServer(const HostMgr::Network::IpAddress& server) {
  Sim::RequireStack(stack_);
  Sim::Change(Op("AddUserNameServer"), [&](Sim::json& state) {
    if (server.IsZero()) {
      Sim::Fail("Invalid name server " + server.GetStringAddress());
    }
    Sim::json& servers =
        Sim::ArrayFor(Sim::ObjectFor(Sim::ObjectFor(state, "network"), "dns"), "nameServers");
    const std::string text = server.GetStringAddress();
    for (const Sim::json& present : servers) {
      if (present.get<std::string>() == text) {
        Sim::Fail("Name server " + text + " is already configured");
      }
    }
    servers.push_back(text);
  });
}

std::vector<std::string> DnsConfigImpl::GetSearchDomains() const {
  const Sim::json& state = Sim::Query(Op("GetSearchDomains"));
  Sim::RequireStack(stack_);
  std::vector<std::string> domains;
  for (const Sim::json& domain :
       Sim::ArrayAt(Sim::ObjectAt(Sim::ObjectAt(state, "network"), "dns"), "searchDomains")) {
    domains.push_back(domain.get<std::string>());
  }
  return domains;
}

std::string DnsConfigImpl::GetSearchDomainsString() const {
  std::string joined;
  for (const std::string& domain : GetSearchDomains()) {
    if (!joined.empty()) {
      joined += ' ';
    }
    joined += domain;
  }
  return joined;
}

void DnsConfigImpl::SetSearchDomainsString(const std::string& domains) {
  Sim::RequireStack(stack_);
  Sim::Change(Op("SetSearchDomainsString"), [&](Sim::json& state) {
    Sim::json list = Sim::json::array();
    for (const std::string& name : SplitNames(domains)) {
      if (std::find(list.begin(), list.end(), name) == list.end()) {
        list.push_back(name);
      }
    }
    Sim::ObjectFor(Sim::ObjectFor(state, "network"), "dns")["searchDomains"] = std::move(list);
  });
}

void DnsConfigImpl::AddUserSearchDomain(const std::string& domain) {
  Sim::RequireStack(stack_);
  Sim::Change(Op("AddUserSearchDomain"), [&](Sim::json& state) {
    if (domain.empty() || domain.find_first_of(" ,\t") != std::string::npos) {
      Sim::Fail("Invalid search domain '" + domain + "'");
    }
    Sim::json& list =
        Sim::ArrayFor(Sim::ObjectFor(Sim::ObjectFor(state, "network"), "dns"), "searchDomains");
    if (std::find(list.begin(), list.end(), domain) == list.end()) {
      list.push_back(domain);
    }
  });
}

void DnsConfigImpl::SaveConfig() {
  Sim::RequireStack(stack_);
  Sim::Change(Op("SaveConfig"), [](Sim::json& state) {
    Sim::json& dns = Sim::ObjectFor(Sim::ObjectFor(state, "network"), "dns");
    dns["saves"] = dns.value("saves", 0) + 1;
  });
}

}  // namespace HykCtl::Network
