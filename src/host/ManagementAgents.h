#pragma once
/// The host's management agents: stopping and starting them through the
/// host's service script, and a live-core capture of the management agent
/// taken in the background before a restart.
///
/// The shell lines run through the host-control library's HykCtl_Exec with
/// the flags false, true, false (no capture, wait for the end, no shell);
/// program paths go through HostPath(), so a confined root runs its own
/// scripts. Nothing here throws.
///
/// The capture runs on a thread of its own, created with default attributes
/// and never joined; it shares nothing with the caller but the system log,
/// so it may still run after the screen that started it has gone:
/// 1. logs "Executing hykbacktrace -c against mgmtd" (info);
/// 2. runs "/sbin/hykbacktrace -w -n mgmtd -o mgmtd-restart% -d /var/log/";
/// 3. logs "Mgmtd core dump completed" (info) when it exits with 0, else
///    "hykbacktrace failed, probably mgmtd was down" (error); a host-control
///    failure is logged at error level with its message alone.
///
/// Decisions of this implementation:
/// - The stop and start report nothing, as their outcome is not looked at;
///   a host-control failure to run them (the script cannot be started) is
///   logged at error level with the library's message.
/// - The capture thread is detached once created: it is never joined, and
///   its resources go when it ends.

namespace Tulk {

/// Runs "/bin/sh /sbin/services.sh stop".
void StopManagementAgents();

/// Runs "/bin/sh /sbin/services.sh start".
void StartManagementAgents();

/// Starts the live-core capture thread. Returns true when it was started;
/// otherwise logs "Failed to create live core generation thread: %s" with
/// the system's error text at error level and returns false.
bool StartLiveCoreCapture();

}  // namespace Tulk
