#pragma once
/// The name check of the network test, run on a worker thread.

#include <memory>
#include <string>

#include "runtime/WorkerResult.h"

namespace Tulk {

/// Checks that `hostName` resolves through DNS rather than through the
/// host's own hosts file:
/// 1. copies "/etc/hosts" to "/etc/hosts.backup";
/// 2. removes the lines naming the host from "/etc/hosts";
/// 3. resolves the name (0 in `result` when it resolved, 1 otherwise);
/// 4. puts the backup back (remove, then rename).
/// Backup and restore failures are only logged (HostsFileBackup.h).
///
/// Decisions of this implementation:
/// - Without a backup the hosts file is neither edited nor restored: the
///   name is resolved with the file as it is, so that a failed backup can
///   never cost the host its entry.
/// - One check at a time edits the hosts file: a check started while an
///   abandoned one (Esc) still runs waits for it, so that no check ever
///   backs up a file another has edited.
/// - A console that ends between backup and restore leaves the backup; the
///   next start puts it back (RecoverHostsFile()).
/// Meant for a detached thread: it shares only `result` with the screen.
void ResolveHostName(const std::string& hostName, const std::shared_ptr<WorkerResult>& result);

}  // namespace Tulk
