#include "platform/api/PortGroupImpl.h"

#include "platform/api/HostMgrException.h"

#pragma GCC diagnostic ignored "-Wunused-parameter"

namespace HykCtl::Network {

PortGroupImpl::PortGroupImpl(const std::string& name) : name_(name) {
}

bool PortGroupImpl::IsValidPortGroup(const std::string& name) {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::PortGroupImpl::IsValidPortGroup is not implemented yet");
}

std::string PortGroupImpl::GetVirtualSwitchName() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::PortGroupImpl::GetVirtualSwitchName is not implemented yet");
}

int PortGroupImpl::GetActiveClients() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::PortGroupImpl::GetActiveClients is not implemented yet");
}

int PortGroupImpl::GetVlanId() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::PortGroupImpl::GetVlanId is not implemented yet");
}

void PortGroupImpl::SetVlanId(int vlanId) {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::PortGroupImpl::SetVlanId is not implemented yet");
}

HostMgr::Network::NicTeamingPolicy PortGroupImpl::GetTeamingPolicy() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::PortGroupImpl::GetTeamingPolicy is not implemented yet");
}

void PortGroupImpl::SetTeamingPolicy(const HostMgr::Network::NicTeamingPolicy& policy) {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::PortGroupImpl::SetTeamingPolicy is not implemented yet");
}

}  // namespace HykCtl::Network
