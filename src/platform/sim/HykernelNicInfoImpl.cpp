#include "platform/api/HykernelNicInfoImpl.h"

#include "platform/api/HostMgrException.h"

#pragma GCC diagnostic ignored "-Wunused-parameter"

namespace HykCtl::Network {

std::vector<HykNicImpl> HykernelNicInfoImpl::GetHykernelNics(int portsetSelector) const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::HykernelNicInfoImpl::GetHykernelNics is not implemented yet");
}

std::string HykernelNicInfoImpl::AddHykernelNic(const std::string& portGroup) {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::HykernelNicInfoImpl::AddHykernelNic is not implemented yet");
}

void HykernelNicInfoImpl::RemoveHykernelNic(const std::string& name) {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::HykernelNicInfoImpl::RemoveHykernelNic is not implemented yet");
}

}  // namespace HykCtl::Network
