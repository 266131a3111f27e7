#include "platform/api/NetworkInfoImpl.h"

#include "platform/api/HostMgrException.h"

#pragma GCC diagnostic ignored "-Wunused-parameter"

namespace HykCtl::Network {

std::vector<PortGroupImpl> NetworkInfoImpl::GetAllPortGroups(int portsetSelector) const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::NetworkInfoImpl::GetAllPortGroups is not implemented yet");
}

std::vector<std::string> NetworkInfoImpl::GetPnics() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::NetworkInfoImpl::GetPnics is not implemented yet");
}

void NetworkInfoImpl::UpdateManagementInterface() {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::NetworkInfoImpl::UpdateManagementInterface is not implemented yet");
}

std::unique_ptr<HykNicImpl> NetworkInfoImpl::GetManagementInterface() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::NetworkInfoImpl::GetManagementInterface is not implemented yet");
}

bool NetworkInfoImpl::IsHykIpv6Enabled() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::NetworkInfoImpl::IsHykIpv6Enabled is not implemented yet");
}

void NetworkInfoImpl::SetHykIpv6Enabled(bool enabled) {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::NetworkInfoImpl::SetHykIpv6Enabled is not implemented yet");
}

void NetworkInfoImpl::DisableNetDumper() {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::NetworkInfoImpl::DisableNetDumper is not implemented yet");
}

void NetworkInfoImpl::ClearNetworkConfig() {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::NetworkInfoImpl::ClearNetworkConfig is not implemented yet");
}

void NetworkInfoImpl::AutoConfigNetwork() {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::NetworkInfoImpl::AutoConfigNetwork is not implemented yet");
}

}  // namespace HykCtl::Network
