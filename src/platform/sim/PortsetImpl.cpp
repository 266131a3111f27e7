#include "platform/api/PortsetImpl.h"

#include "platform/api/HostMgrException.h"

#pragma GCC diagnostic ignored "-Wunused-parameter"

namespace HykCtl::Network {

PortsetImpl::PortsetImpl(const std::string& name) : name_(name) {
}

bool PortsetImpl::IsValidVirtualSwitch(const std::string& name) {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::PortsetImpl::IsValidVirtualSwitch is not implemented yet");
}

int PortsetImpl::GetType() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::PortsetImpl::GetType is not implemented yet");
}

std::vector<std::string> PortsetImpl::GetUplinks() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::PortsetImpl::GetUplinks is not implemented yet");
}

std::vector<std::string> PortsetImpl::GetPortGroups() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::PortsetImpl::GetPortGroups is not implemented yet");
}

std::int64_t PortsetImpl::GetNumPorts() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::PortsetImpl::GetNumPorts is not implemented yet");
}

std::int64_t PortsetImpl::GetUsedPorts() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::PortsetImpl::GetUsedPorts is not implemented yet");
}

std::int64_t PortsetImpl::GetConfiguredPorts() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::PortsetImpl::GetConfiguredPorts is not implemented yet");
}

void PortsetImpl::AddUplink(const std::string& pnic) {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::PortsetImpl::AddUplink is not implemented yet");
}

void PortsetImpl::RemoveUplink(const std::string& pnic) {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::PortsetImpl::RemoveUplink is not implemented yet");
}

void PortsetImpl::MoveUplink(const std::string& pnic, const std::string& targetSwitch) {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::PortsetImpl::MoveUplink is not implemented yet");
}

HostMgr::Network::NicTeamingPolicy PortsetImpl::GetTeamingPolicy() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::PortsetImpl::GetTeamingPolicy is not implemented yet");
}

void PortsetImpl::SetTeamingPolicy(const HostMgr::Network::NicTeamingPolicy& policy) {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::PortsetImpl::SetTeamingPolicy is not implemented yet");
}

void PortsetImpl::AddPortGroup(const std::string& name, int vlanId) {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::PortsetImpl::AddPortGroup is not implemented yet");
}

void PortsetImpl::RemovePortGroup(const std::string& name) {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::PortsetImpl::RemovePortGroup is not implemented yet");
}

}  // namespace HykCtl::Network
