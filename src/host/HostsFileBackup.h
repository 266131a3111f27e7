#pragma once
/// Keeping the host's name table "/etc/hosts" safe while the network test
/// edits it: a backup beside it, "/etc/hosts.backup", put back afterwards,
/// and put back at the next start when the console died in between.
///
/// The backup exists only while an edited hosts file is to be restored:
/// it is made complete or not at all (copied to a temporary name, then
/// renamed into place), and it is consumed by the restore. So at start-up
/// a "/etc/hosts.backup" is always a complete copy of the hosts file as it
/// was before an edit that was never undone.
///
/// File operations use Boost.Filesystem with error codes; nothing here
/// throws.

#include <string>

namespace Tulk {

/// The hosts file and its backup, as host paths.
inline constexpr char kHostsFile[] = "/etc/hosts";
inline constexpr char kHostsBackup[] = "/etc/hosts.backup";

/// Copies the hosts file to the backup (replacing an older backup). A
/// failure logs "failed to backup /etc/hosts: %s" at informational level
/// with the error text, leaves no backup behind, and gives false.
bool BackUpHostsFile();

/// Puts the backup back: removes the hosts file and renames the backup to
/// it. Only a backup that exists is put back: without one, the hosts file
/// is left alone and false is returned. A failure of either step logs
/// "failed to restore /etc/hosts: %s" at informational level and gives
/// false.
bool RestoreHostsFile();

/// Start-up: when a backup is left over (the console ended between backup
/// and restore), puts it back and logs "Restored /etc/hosts from
/// /etc/hosts.backup left by an interrupted network test" at warning
/// level. Call before anything reads the hosts file. Returns true when a
/// backup was put back.
bool RecoverHostsFile();

/// Removes the lines that name `hostName` from the hosts file
/// (HostsFile::RemoveEntryByHostName). A failure logs "Removing %s from
/// /etc/hosts failed: %s" at error level and gives false.
bool RemoveHostsFileEntry(const std::string& hostName);

/// Resolves `name` the way the host's programs do (NameResolver). True
/// when it resolved; a host-control failure logs "Resolving %s failed: %s"
/// at error level and gives false.
bool ResolveName(const std::string& name);

}  // namespace Tulk
