#include "platform/api/MemoryInfoImpl.h"

#include "platform/api/HostMgrException.h"

#pragma GCC diagnostic ignored "-Wunused-parameter"

namespace HykCtl::Hardware {

std::uint64_t MemoryInfoImpl::GetTotalPages() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Hardware::MemoryInfoImpl::GetTotalPages is not implemented yet");
}

std::uint64_t MemoryInfoImpl::GetPageSize() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Hardware::MemoryInfoImpl::GetPageSize is not implemented yet");
}

}  // namespace HykCtl::Hardware
