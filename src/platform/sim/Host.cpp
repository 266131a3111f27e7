#include "platform/api/Host.h"

#include "platform/api/HostMgrException.h"

namespace HostMgr {

const StorageAdapter* StorageInfo::FindAdapter(const std::string& name) const {
  for (const StorageAdapter& adapter : adapters) {
    if (adapter.name == name) {
      return &adapter;
    }
  }
  return nullptr;
}

std::unique_ptr<Host> HostFactory::GetHost() {
  throw HostMgr::Lib::HostMgrException("HostMgr::HostFactory::GetHost is not implemented yet");
}

}  // namespace HostMgr
