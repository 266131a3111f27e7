#include "platform/api/VirtualSwitchInfoImpl.h"

#include "platform/api/HostMgrException.h"

#pragma GCC diagnostic ignored "-Wunused-parameter"

namespace HykCtl::Network {

std::vector<PortsetImpl> VirtualSwitchInfoImpl::GetVirtualSwitches() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::VirtualSwitchInfoImpl::GetVirtualSwitches is not implemented yet");
}

std::vector<PortsetImpl> VirtualSwitchInfoImpl::GetDVSwitches() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::VirtualSwitchInfoImpl::GetDVSwitches is not implemented yet");
}

void VirtualSwitchInfoImpl::AddVirtualSwitch(const std::string& name, int numPorts) {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::VirtualSwitchInfoImpl::AddVirtualSwitch is not implemented yet");
}

void VirtualSwitchInfoImpl::RemoveVirtualSwitch(const std::string& name) {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::VirtualSwitchInfoImpl::RemoveVirtualSwitch is not implemented yet");
}

}  // namespace HykCtl::Network
