#include "platform/api/ResourceInfoImpl.h"

#include "platform/sim/SimState.h"

namespace HykCtl::Resource {
namespace {

std::vector<std::string> Running(const Sim::json& state) {
  std::vector<std::string> names;
  for (const Sim::json& vm : Sim::ArrayAt(state, "vms")) {
    if (Sim::StringAt(vm, "state", "poweredOff") == "running") {
      names.push_back(Sim::StringAt(vm, "name"));
    }
  }
  return names;
}

}  // namespace

bool ResourceInfoImpl::HasRunningVirtualMachines() const {
  return !Running(Sim::Query("HykCtl::Resource::ResourceInfoImpl::HasRunningVirtualMachines"))
              .empty();
}

std::vector<std::string> ResourceInfoImpl::GetRunningVirtualMachines() const {
  return Running(Sim::Query("HykCtl::Resource::ResourceInfoImpl::GetRunningVirtualMachines"));
}

}  // namespace HykCtl::Resource
