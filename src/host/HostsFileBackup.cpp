#include "host/HostsFileBackup.h"

#include <syslog.h>

#include <boost/filesystem.hpp>

#include "platform/api/HostMgrException.h"
#include "platform/api/HostsFile.h"
#include "platform/api/NameResolver.h"
#include "runtime/HostPath.h"
#include "runtime/SystemLog.h"

namespace Tulk {
namespace {

namespace fs = boost::filesystem;
using boost::system::error_code;

// The backup is written under this name first and renamed into place, so
// that "/etc/hosts.backup" never holds half a copy.
constexpr char kHostsBackupPartial[] = "/etc/hosts.backup.partial";

// A missing file is an answer here, not a failure.
bool Exists(const fs::path& path) {
  error_code ignored;
  return fs::exists(fs::symlink_status(path, ignored));
}

}  // namespace

bool BackUpHostsFile() {
  const fs::path hosts(HostPath(kHostsFile));
  const fs::path partial(HostPath(kHostsBackupPartial));
  const fs::path backup(HostPath(kHostsBackup));
  error_code error;
  fs::copy_file(hosts, partial, fs::copy_options::overwrite_existing, error);
  if (!error) {
    fs::rename(partial, backup, error);
  }
  if (error) {
    Log(LOG_INFO, "failed to backup /etc/hosts: %s", error.message().c_str());
    error_code ignored;
    fs::remove(partial, ignored);
    return false;
  }
  return true;
}

bool RestoreHostsFile() {
  const fs::path hosts(HostPath(kHostsFile));
  const fs::path backup(HostPath(kHostsBackup));
  if (!Exists(backup)) {
    return false;
  }
  error_code error;
  fs::remove(hosts, error);
  if (!error) {
    fs::rename(backup, hosts, error);
  }
  if (error) {
    Log(LOG_INFO, "failed to restore /etc/hosts: %s", error.message().c_str());
    return false;
  }
  return true;
}

bool RecoverHostsFile() {
  if (!Exists(fs::path(HostPath(kHostsBackup))) || !RestoreHostsFile()) {
    return false;
  }
  Log(LOG_WARNING,
      "Restored /etc/hosts from /etc/hosts.backup left by an interrupted network test");
  return true;
}

bool RemoveHostsFileEntry(const std::string& hostName) {
  try {
    HykCtl::Network::HostsFile(HostPath(kHostsFile)).RemoveEntryByHostName(hostName);
    return true;
  } catch (const HostMgr::Lib::HostMgrException& failure) {
    Log(LOG_ERR, "Removing %s from /etc/hosts failed: %s", hostName.c_str(), failure.what());
    return false;
  }
}

bool ResolveName(const std::string& name) {
  try {
    return HykCtl::Network::NameResolver::Resolve(name) == 0;
  } catch (const HostMgr::Lib::HostMgrException& failure) {
    Log(LOG_ERR, "Resolving %s failed: %s", name.c_str(), failure.what());
    return false;
  }
}

}  // namespace Tulk
