#include "platform/api/HostsFile.h"

#include "platform/api/HostMgrException.h"

#pragma GCC diagnostic ignored "-Wunused-parameter"

namespace HykCtl::Network {

HostsFile::HostsFile() {
}

HostsFile::HostsFile(std::string path) : path_(std::move(path)) {
}

std::vector<HostsFile::Entry> HostsFile::GetEntries() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::HostsFile::GetEntries is not implemented yet");
}

int HostsFile::RemoveEntryByHostName(const std::string& hostName) {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::HostsFile::RemoveEntryByHostName is not implemented yet");
}

void HostsFile::AddEntry(const Entry& entry) {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::HostsFile::AddEntry is not implemented yet");
}

}  // namespace HykCtl::Network
