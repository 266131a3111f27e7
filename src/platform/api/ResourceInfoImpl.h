#pragma once
/// The host's virtual machines.

#include <string>
#include <vector>

namespace HykCtl::Resource {

/// Every operation may throw HostMgr::Lib::HostMgrException.
class ResourceInfoImpl {
 public:
  /// True when at least one virtual machine is powered on.
  bool HasRunningVirtualMachines() const;
  /// The names of the powered-on virtual machines, in the host's order.
  std::vector<std::string> GetRunningVirtualMachines() const;
};

}  // namespace HykCtl::Resource
