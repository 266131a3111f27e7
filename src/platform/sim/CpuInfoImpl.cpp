#include "platform/api/CpuInfoImpl.h"

#include "platform/sim/SimState.h"

namespace HykCtl::Hardware {
namespace {

const Sim::json& Cpu(const char* method) {
  const Sim::json& state = Sim::Query(std::string("HykCtl::Hardware::CpuInfoImpl::") + method);
  return Sim::ObjectAt(Sim::ObjectAt(state, "hardware"), "cpu");
}

}  // namespace

int CpuInfoImpl::GetNumCpuPackages() const {
  return Cpu("GetNumCpuPackages").value("packages", 1);
}
int CpuInfoImpl::GetNumCpuCores() const {
  return Cpu("GetNumCpuCores").value("cores", 1);
}
int CpuInfoImpl::GetNumCpuThreads() const {
  return Cpu("GetNumCpuThreads").value("threads", 1);
}
std::string CpuInfoImpl::GetModelName() const {
  return Sim::StringAt(Cpu("GetModelName"), "model");
}

}  // namespace HykCtl::Hardware
