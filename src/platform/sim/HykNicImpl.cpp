#include "platform/api/HykNicImpl.h"

#include "platform/api/HostMgrException.h"

#pragma GCC diagnostic ignored "-Wunused-parameter"

namespace HykCtl::Network {

HykNicImpl::HykNicImpl(const std::string& name) : name_(name) {
}

HykNicImpl::~HykNicImpl() {
}

HykNicImpl::HykNicImpl(const HykNicImpl&) {
}

HykNicImpl& HykNicImpl::operator=(const HykNicImpl&) {
  return *this;
}

HykNicImpl::HykNicImpl(HykNicImpl&&) noexcept {
}

HykNicImpl& HykNicImpl::operator=(HykNicImpl&&) noexcept {
  return *this;
}

bool HykNicImpl::IsStale() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::HykNicImpl::IsStale is not implemented yet");
}

void HykNicImpl::Refresh() {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::HykNicImpl::Refresh is not implemented yet");
}

std::string HykNicImpl::GetName() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::HykNicImpl::GetName is not implemented yet");
}

HostMgr::Network::MacAddress HykNicImpl::GetMacAddress() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::HykNicImpl::GetMacAddress is not implemented yet");
}

std::optional<ConnectionPoint> HykNicImpl::GetConnectionPoint() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::HykNicImpl::GetConnectionPoint is not implemented yet");
}

bool HykNicImpl::IsEnabled() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::HykNicImpl::IsEnabled is not implemented yet");
}

HostMgr::Network::IpConfig HykNicImpl::GetIpConfig() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::HykNicImpl::GetIpConfig is not implemented yet");
}

void HykNicImpl::SetIpConfig(const HostMgr::Network::IpConfig& config) {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::HykNicImpl::SetIpConfig is not implemented yet");
}

bool HykNicImpl::IsDhcpLeaseBound() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::HykNicImpl::IsDhcpLeaseBound is not implemented yet");
}

void HykNicImpl::RenewDhcpLease() {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::HykNicImpl::RenewDhcpLease is not implemented yet");
}

void HykNicImpl::SetMacAddressFromPnic(const std::string& pnicName) {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::HykNicImpl::SetMacAddressFromPnic is not implemented yet");
}

void HykNicImpl::ConnectToPortGroup(const std::string& portGroup) {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::HykNicImpl::ConnectToPortGroup is not implemented yet");
}

void HykNicImpl::Disable() {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::HykNicImpl::Disable is not implemented yet");
}

void HykNicImpl::Enable() {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::HykNicImpl::Enable is not implemented yet");
}

void HykNicImpl::Restart() {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::HykNicImpl::Restart is not implemented yet");
}

}  // namespace HykCtl::Network
