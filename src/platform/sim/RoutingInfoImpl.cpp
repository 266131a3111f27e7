#include "platform/api/RoutingInfoImpl.h"

#include "platform/sim/SimState.h"

namespace HykCtl::Network {
namespace {

std::string Op(const char* method) {
  return std::string("HykCtl::Network::RoutingInfoImpl::") + method;
}

const Sim::json& Routing(const Sim::json& state) {
  return Sim::ObjectAt(Sim::ObjectAt(state, "network"), "routing");
}

}  // namespace

RoutingInfoImpl::RoutingInfoImpl(std::string stack) : stack_(std::move(stack)) {
}

HostMgr::Network::Ipv4Address RoutingInfoImpl::GetIpv4DefaultGateway() const {
  const Sim::json& state = Sim::Query(Op("GetIpv4DefaultGateway"));
  Sim::RequireStack(stack_);
  const std::string gateway = Sim::StringAt(Routing(state), "ipv4Gateway");
  return gateway.empty() ? HostMgr::Network::Ipv4Address() : HostMgr::Network::Ipv4Address(gateway);
}

void RoutingInfoImpl::SetIpv4DefaultGateway(const HostMgr::Network::Ipv4Address& gateway) {
  Sim::RequireStack(stack_);
  Sim::Change(Op("SetIpv4DefaultGateway"), [&](Sim::json& state) {
    Sim::json& routing = Sim::ObjectFor(Sim::ObjectFor(state, "network"), "routing");
    if (gateway.IsZero()) {
      routing.erase("ipv4Gateway");
    } else {
      routing["ipv4Gateway"] = gateway.GetStringAddress();
    }
  });
}

HostMgr::Network::Ipv6Address RoutingInfoImpl::GetIpv6DefaultGateway() const {
  const Sim::json& state = Sim::Query(Op("GetIpv6DefaultGateway"));
  Sim::RequireStack(stack_);
  const std::string gateway = Sim::StringAt(Routing(state), "ipv6Gateway");
  return gateway.empty() ? HostMgr::Network::Ipv6Address() : HostMgr::Network::Ipv6Address(gateway);
}

void RoutingInfoImpl::SetIpv6DefaultGateway(const HostMgr::Network::Ipv6Address& gateway) {
  Sim::RequireStack(stack_);
  Sim::Change(Op("SetIpv6DefaultGateway"), [&](Sim::json& state) {
    Sim::json& routing = Sim::ObjectFor(Sim::ObjectFor(state, "network"), "routing");
    if (gateway.IsZero()) {
      routing.erase("ipv6Gateway");
    } else {
      routing["ipv6Gateway"] = gateway.GetScopedStringAddress();
    }
  });
}

}  // namespace HykCtl::Network
