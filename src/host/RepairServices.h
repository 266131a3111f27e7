#pragma once
/// The host's two repair services, the local Tavi Shell and the SSH server:
/// their state as their init scripts report it, switching them on and off,
/// and restarting the ones that run.
///
/// Every function runs its commands through the command runner
/// (host/CommandRunner.h) and the management-API wrapper (host/HostTools.h)
/// and never throws. Host paths go through HostPath(), so under a confined
/// root "sh /etc/init.d/SSH status" runs the root's script.
///
/// Switching a service (SwitchService()), `on` being its state before:
/// 1. "osk-cmd -U <console user> hostsvc/stop_<suffix>" when `on`, else
///    "hostsvc/start_<suffix>". When that fails: "Unable to run osk-cmd to
///    start/stop <log name>" at warning level, then the init script with
///    "stop" or "start"; for a service with a firewall ruleset (SSH), the
///    ruleset is then switched to match (SwitchFirewallRuleset()).
/// 2. "hostsvc/disable_<suffix>" when `on`, else "hostsvc/enable_<suffix>";
///    when that fails: "Unable to run osk-cmd to enable/disable <log name>"
///    at warning level, with no fallback.
///
/// Decisions of this implementation:
/// - The status query runs unlogged (a stopped service is not a failure);
///   start, stop and restart through the init script are logged by the
///   runner ("Command \"%s\" succeeded" / "... failed (rc=%d): ...").
/// - The firewall ruleset's gate is FirewallRuleset::IsManagedWithService():
///   only a ruleset that opens and closes with its service is switched by
///   whoever starts or stops the service by hand. A ruleset the
///   administrator pinned open or closed is left alone. The switch itself is
///   FirewallRuleset::Enable() (service started) and Disable() (stopped).

#include <string>

namespace Tulk {

/// One repair service.
struct RepairService {
  /// The service's name in the warning lines ("Tavi Shell", "ssh").
  const char* logName;
  /// Its init script ("/etc/init.d/TavShell").
  const char* initScript;
  /// The suffix of its management-API commands ("tav_shell" gives
  /// "hostsvc/start_tav_shell").
  const char* commandSuffix;
  /// The firewall ruleset switched on the init-script fallback; null: none.
  const char* firewallRuleset;
};

/// The local Tavi Shell.
inline constexpr RepairService kTaviShellService{"Tavi Shell", "/etc/init.d/TavShell", "tav_shell",
                                                 nullptr};
/// The SSH server, whose firewall ruleset is "sshServer".
inline constexpr RepairService kSshService{"ssh", "/etc/init.d/SSH", "ssh", "sshServer"};

/// What became of a firewall ruleset.
enum class FirewallChange {
  /// Not asked to change, or its gate said no.
  kUntouched,
  /// Enabled or disabled as asked.
  kSwitched,
  /// The host-control library failed (logged).
  kFailed,
};

/// What SwitchService() ran and how it went.
struct ServiceSwitch {
  /// Exit code of "hostsvc/start_…" or "hostsvc/stop_…".
  int startStopCode = 0;
  /// Whether the init script stood in for it.
  bool initScriptUsed = false;
  /// Exit code of the init script's "start" or "stop" (0 when unused).
  int initScriptCode = 0;
  /// The firewall ruleset on the fallback path.
  FirewallChange firewall = FirewallChange::kUntouched;
  /// Exit code of "hostsvc/enable_…" or "hostsvc/disable_…".
  int enableDisableCode = 0;
};

/// Runs "/bin/sh" with "sh", the init script and "status": true exactly
/// when it exits with 0. A script that cannot be run reads as stopped.
bool IsServiceRunning(const RepairService& service);

/// Runs "/bin/sh" with "sh", the init script and `verb` ("start", "stop",
/// "restart"), logged by the runner. Returns the exit code.
int RunServiceScript(const RepairService& service, const char* verb);

/// Switches `service` off when `on`, else on, in the order described
/// above, as the console user (ConsoleUser()).
ServiceSwitch SwitchService(const RepairService& service, bool on);

/// Opens (`open`) or closes the firewall ruleset `id` when its gate,
/// IsManagedWithService(), holds. A host-control failure is logged at
/// warning level as "Failed to update firewall <id> ruleset status: %s"
/// with the library's message.
FirewallChange SwitchFirewallRuleset(const std::string& id, bool open);

/// Restarts each repair service whose status reports it running (the
/// shell first, then SSH), through its init script. Returns how many were
/// restarted.
int RestartRunningRepairServices();

}  // namespace Tulk
