#pragma once
/// Ending what a test started, and removing what pam_wrapper left for it.
///
/// pam_wrapper gives every process it is preloaded into (the console and
/// every command the console runs) a folder "/tmp/pam.X" holding a copy of
/// the PAM service folder and a "pid" file. X is one of about sixty letters
/// and digits, picked from the process id with ten tries; TMPDIR is not
/// consulted. A process that ends normally removes its folder. One that is
/// killed keeps it until a later process happens to pick the same letter
/// and finds that pid gone, and for good when it died before writing the
/// pid file or its pid was reused. Once the tries of a new process all hit
/// folders still held, it refuses to start ("Failed to find a possible
/// path"), so every test removes what its processes left.

#include <sys/types.h>

#include <string>
#include <vector>

namespace TulkTest {

/// The processes of the session led by `leader` (the pseudo-terminal's
/// program and whatever it started and did not move to a session of its
/// own), except the leader.
std::vector<pid_t> SessionMembers(pid_t leader);

/// The text of /proc/<pid>/<name> ("comm", "status"), empty when it cannot
/// be read (also when the process ends during the read).
std::string ProcFile(pid_t pid, const std::string& name);

/// Sends `signal` to every process of the session led by `leader` (the
/// pseudo-terminal's program and whatever it started and did not move to a
/// session of its own), except the leader; returns their ids. The leader
/// must not be reaped yet, so that its id still names this session.
std::vector<pid_t> SignalSession(pid_t leader, int signal);

/// Removes every pam_wrapper folder whose files mention `marker` (a path
/// unique to the test) or whose pid file names one of `pids`.
void RemovePamFolders(const std::string& marker, const std::vector<pid_t>& pids);

/// The pam_wrapper folders whose files mention `marker`.
std::vector<std::string> PamFoldersOf(const std::string& marker);

}  // namespace TulkTest
