#pragma once
/// The host's memory.

#include <cstdint>

namespace HykCtl::Hardware {

/// Every getter may throw HostMgr::Lib::HostMgrException.
class MemoryInfoImpl {
 public:
  /// Installed memory in pages.
  std::uint64_t GetTotalPages() const;
  /// The size of one page in bytes.
  std::uint64_t GetPageSize() const;
};

}  // namespace HykCtl::Hardware
