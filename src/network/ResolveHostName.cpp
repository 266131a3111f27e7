#include "network/ResolveHostName.h"

#include <mutex>

#include "host/HostsFileBackup.h"

namespace Tulk {
namespace {

// Never destroyed: an abandoned check may still hold it while the process
// exits.
std::mutex& HostsFileEdit() {
  static std::mutex* edit = new std::mutex;
  return *edit;
}

}  // namespace

void ResolveHostName(const std::string& hostName, const std::shared_ptr<WorkerResult>& result) {
  bool resolved = false;
  {
    std::lock_guard<std::mutex> editing(HostsFileEdit());
    const bool backedUp = BackUpHostsFile();
    if (backedUp) {
      RemoveHostsFileEntry(hostName);
    }
    resolved = ResolveName(hostName);
    if (backedUp) {
      RestoreHostsFile();
    }
  }
  result->Set(resolved ? 0 : 1);
}

}  // namespace Tulk
