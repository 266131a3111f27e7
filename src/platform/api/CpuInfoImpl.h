#pragma once
/// The host's processors.

#include <string>

namespace HykCtl::Hardware {

/// Every getter may throw HostMgr::Lib::HostMgrException.
class CpuInfoImpl {
 public:
  /// The number of processor packages (sockets).
  int GetNumCpuPackages() const;
  /// Cores over all packages.
  int GetNumCpuCores() const;
  /// Hardware threads over all packages.
  int GetNumCpuThreads() const;
  /// The processor model as the CPU reports it (may carry stray blanks).
  std::string GetModelName() const;
};

}  // namespace HykCtl::Hardware
