#include "platform/api/RoutingInfoImpl.h"

#include "platform/api/HostMgrException.h"

#pragma GCC diagnostic ignored "-Wunused-parameter"

namespace HykCtl::Network {

RoutingInfoImpl::RoutingInfoImpl(std::string stack) : stack_(std::move(stack)) {
}

HostMgr::Network::Ipv4Address RoutingInfoImpl::GetIpv4DefaultGateway() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::RoutingInfoImpl::GetIpv4DefaultGateway is not implemented yet");
}

void RoutingInfoImpl::SetIpv4DefaultGateway(const HostMgr::Network::Ipv4Address& gateway) {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::RoutingInfoImpl::SetIpv4DefaultGateway is not implemented yet");
}

HostMgr::Network::Ipv6Address RoutingInfoImpl::GetIpv6DefaultGateway() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::RoutingInfoImpl::GetIpv6DefaultGateway is not implemented yet");
}

void RoutingInfoImpl::SetIpv6DefaultGateway(const HostMgr::Network::Ipv6Address& gateway) {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::RoutingInfoImpl::SetIpv6DefaultGateway is not implemented yet");
}

}  // namespace HykCtl::Network
