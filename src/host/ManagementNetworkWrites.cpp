#include "host/ManagementNetworkWrites.h"

#include <memory>

#include "include/Constants.h"
#include "platform/api/DnsConfigImpl.h"
#include "platform/api/HostMgrException.h"
#include "platform/api/HykNicImpl.h"
#include "platform/api/NetworkInfoImpl.h"
#include "platform/api/RoutingInfoImpl.h"

namespace Tulk {
namespace {

using HostMgr::Lib::HostMgrException;

// Runs `operation`; a host-control failure becomes the result.
template <typename Operation>
NetworkWrite Attempt(Operation&& operation) {
  try {
    operation();
    return {};
  } catch (const HostMgrException& failure) {
    return NetworkWrite::Failed(failure.what());
  }
}

}  // namespace

NetworkWrite ReadNicIpConfig(const std::string& nic, HostMgr::Network::IpConfig& config) {
  return Attempt([&] { config = HykCtl::Network::HykNicImpl(nic).GetIpConfig(); });
}

NetworkWrite WriteNicIpConfig(const std::string& nic, const HostMgr::Network::IpConfig& config) {
  return Attempt([&] { HykCtl::Network::HykNicImpl(nic).SetIpConfig(config); });
}

NetworkWrite WriteKernelIpv6Enabled(bool enabled) {
  return Attempt([&] { HykCtl::Network::NetworkInfoImpl().SetHykIpv6Enabled(enabled); });
}

NetworkWrite IsNicLeaseBound(const std::string& nic, bool& bound) {
  return Attempt([&] { bound = HykCtl::Network::HykNicImpl(nic).IsDhcpLeaseBound(); });
}

NetworkWrite RenewNicLease(const std::string& nic) {
  return Attempt([&] { HykCtl::Network::HykNicImpl(nic).RenewDhcpLease(); });
}

NetworkWrite TakeMacFromPnic(const std::string& nic, const std::string& pnic) {
  return Attempt([&] { HykCtl::Network::HykNicImpl(nic).SetMacAddressFromPnic(pnic); });
}

NetworkWrite RestartNicInterface(const std::string& nic) {
  return Attempt([&] { HykCtl::Network::HykNicImpl(nic).Restart(); });
}

NetworkWrite ReadIpv4DefaultGateway(HostMgr::Network::Ipv4Address& gateway) {
  return Attempt([&] {
    gateway = HykCtl::Network::RoutingInfoImpl(kDefaultTcpipStack).GetIpv4DefaultGateway();
  });
}

NetworkWrite WriteIpv4DefaultGateway(const HostMgr::Network::Ipv4Address& gateway) {
  return Attempt(
      [&] { HykCtl::Network::RoutingInfoImpl(kDefaultTcpipStack).SetIpv4DefaultGateway(gateway); });
}

NetworkWrite WriteIpv6DefaultGateway(const HostMgr::Network::Ipv6Address& gateway) {
  return Attempt(
      [&] { HykCtl::Network::RoutingInfoImpl(kDefaultTcpipStack).SetIpv6DefaultGateway(gateway); });
}

NetworkWrite WriteHostName(const std::string& name) {
  return Attempt([&] {
    HykCtl::Network::DnsConfigImpl dns(kDefaultTcpipStack);
    if (name.find('.') != std::string::npos) {
      dns.SetFqdn(name);
    } else {
      dns.SetHostname(name);
    }
  });
}

NetworkWrite ReplaceNameServers(const std::vector<std::string>& servers) {
  return Attempt([&] {
    HykCtl::Network::DnsConfigImpl dns(kDefaultTcpipStack);
    dns.RemoveAllUserNameServers();
    for (const std::string& text : servers) {
      std::unique_ptr<HostMgr::Network::IpAddress> server =
          HostMgr::Network::IpAddress::Parse(text);
      if (server && !server->IsZero()) {
        dns.AddUserNameServer(*server);
      }
    }
  });
}

NetworkWrite ResetSearchDomains(const std::vector<std::string>& suffixes) {
  return Attempt([&] {
    HykCtl::Network::DnsConfigImpl dns(kDefaultTcpipStack);
    dns.SetSearchDomainsString(dns.GetDomain());
    for (const std::string& suffix : suffixes) {
      dns.AddUserSearchDomain(suffix);
    }
    dns.SaveConfig();
  });
}

}  // namespace Tulk
