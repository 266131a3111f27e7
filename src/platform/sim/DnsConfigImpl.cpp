#include "platform/api/DnsConfigImpl.h"

#include "platform/api/HostMgrException.h"

#pragma GCC diagnostic ignored "-Wunused-parameter"

namespace HykCtl::Network {

DnsConfigImpl::DnsConfigImpl(std::string stack) : stack_(std::move(stack)) {
}

void DnsConfigImpl::Refresh() {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::DnsConfigImpl::Refresh is not implemented yet");
}

std::string DnsConfigImpl::GetHostname() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::DnsConfigImpl::GetHostname is not implemented yet");
}

std::string DnsConfigImpl::GetDomain() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::DnsConfigImpl::GetDomain is not implemented yet");
}

void DnsConfigImpl::SetHostname(const std::string& name) {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::DnsConfigImpl::SetHostname is not implemented yet");
}

void DnsConfigImpl::SetFqdn(const std::string& fqdn) {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::DnsConfigImpl::SetFqdn is not implemented yet");
}

std::vector<HostMgr::Network::IpAddress> DnsConfigImpl::GetNameServers() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::DnsConfigImpl::GetNameServers is not implemented yet");
}

std::vector<HostMgr::Network::IpAddress> DnsConfigImpl::GetUserNameServers() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::DnsConfigImpl::GetUserNameServers is not implemented yet");
}

void DnsConfigImpl::RemoveAllUserNameServers() {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::DnsConfigImpl::RemoveAllUserNameServers is not implemented yet");
}

void DnsConfigImpl::AddUserNameServer(const HostMgr::Network::IpAddress& server) {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::DnsConfigImpl::AddUserNameServer is not implemented yet");
}

std::vector<std::string> DnsConfigImpl::GetSearchDomains() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::DnsConfigImpl::GetSearchDomains is not implemented yet");
}

std::string DnsConfigImpl::GetSearchDomainsString() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::DnsConfigImpl::GetSearchDomainsString is not implemented yet");
}

void DnsConfigImpl::SetSearchDomainsString(const std::string& domains) {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::DnsConfigImpl::SetSearchDomainsString is not implemented yet");
}

void DnsConfigImpl::AddUserSearchDomain(const std::string& domain) {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::DnsConfigImpl::AddUserSearchDomain is not implemented yet");
}

void DnsConfigImpl::SaveConfig() {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::DnsConfigImpl::SaveConfig is not implemented yet");
}

}  // namespace HykCtl::Network
