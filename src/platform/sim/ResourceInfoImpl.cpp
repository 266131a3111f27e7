#include "platform/api/ResourceInfoImpl.h"

#include "platform/api/HostMgrException.h"

#pragma GCC diagnostic ignored "-Wunused-parameter"

namespace HykCtl::Resource {

bool ResourceInfoImpl::HasRunningVirtualMachines() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Resource::ResourceInfoImpl::HasRunningVirtualMachines is not implemented yet");
}

std::vector<std::string> ResourceInfoImpl::GetRunningVirtualMachines() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Resource::ResourceInfoImpl::GetRunningVirtualMachines is not implemented yet");
}

}  // namespace HykCtl::Resource
