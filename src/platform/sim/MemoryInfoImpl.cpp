#include "platform/api/MemoryInfoImpl.h"

#include "platform/sim/SimState.h"

namespace HykCtl::Hardware {
namespace {

const Sim::json& Memory(const char* method) {
  const Sim::json& state = Sim::Query(std::string("HykCtl::Hardware::MemoryInfoImpl::") + method);
  return Sim::ObjectAt(Sim::ObjectAt(state, "hardware"), "memory");
}

}  // namespace

std::uint64_t MemoryInfoImpl::GetTotalPages() const {
  return Memory("GetTotalPages").value("totalPages", std::uint64_t{0});
}
std::uint64_t MemoryInfoImpl::GetPageSize() const {
  return Memory("GetPageSize").value("pageSize", std::uint64_t{4096});
}

}  // namespace HykCtl::Hardware
