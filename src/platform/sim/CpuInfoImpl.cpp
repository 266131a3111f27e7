#include "platform/api/CpuInfoImpl.h"

#include "platform/api/HostMgrException.h"

#pragma GCC diagnostic ignored "-Wunused-parameter"

namespace HykCtl::Hardware {

int CpuInfoImpl::GetNumCpuPackages() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Hardware::CpuInfoImpl::GetNumCpuPackages is not implemented yet");
}

int CpuInfoImpl::GetNumCpuCores() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Hardware::CpuInfoImpl::GetNumCpuCores is not implemented yet");
}

int CpuInfoImpl::GetNumCpuThreads() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Hardware::CpuInfoImpl::GetNumCpuThreads is not implemented yet");
}

std::string CpuInfoImpl::GetModelName() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Hardware::CpuInfoImpl::GetModelName is not implemented yet");
}

}  // namespace HykCtl::Hardware
