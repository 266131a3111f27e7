#pragma once
/// Wrappers for the host's command-line tools: the management tool
/// "tavcli", the management-API tool "osk-cmd", the power-off of the
/// virtual machines and the advanced options. Each builds its command line,
/// runs it through the command runner (host/CommandRunner.h) within the
/// time limit its kind of work gets there, and logs the outcome. None of
/// them throws.

#include <cstdint>
#include <string>
#include <vector>

#include "host/CommandRunner.h"

namespace Tulk {

/// The user the management-API tool falls back to when it cannot run a
/// command as the console user (exit code 255): "root", the identity the
/// console itself runs as on a host, which the management agent always
/// accepts.
inline constexpr char kOskFallbackUser[] = "root";

/// The console user: the name of the operator logged in at the console
/// (`currentUser`), or kOskFallbackUser while nobody has logged in yet.
std::string ConsoleUser();

/// Runs "/bin/tavcli" with `arguments` (arguments[0] is "tavcli"),
/// capturing up to 255 bytes of output, limited to `timeoutSeconds`, and
/// logs "Command \"%s\" failed (rc=%d): %s" (with the output) at error
/// level or "Command \"%s\" succeeded" at info level. Returns the exit
/// code.
int RunTavcli(const std::vector<std::string>& arguments,
              int timeoutSeconds = kChangeTimeoutSeconds);

/// A standard-switch command: "tavcli", "network", "vswitch", "standard",
/// then `subcommandAndOptions` (for example "portgroup", "add", "-p",
/// name, "-v", switch), through RunTavcli().
int RunStandardSwitchCommand(const std::vector<std::string>& subcommandAndOptions);

/// Runs "/bin/osk-cmd" with `arguments` ("osk-cmd", "-U", user, command,
/// ...), capturing up to 255 bytes each of output and error. When the exit
/// code is 255 (the tool could not act as that user) it logs "Unable to
/// execute command osk-cmd %s using user %s. Using user %s" at info level
/// (the command and its arguments, the user, the fallback user), puts
/// kOskFallbackUser in place of the user and runs it once more; it never
/// runs more than twice. The outcome of the last run is logged like
/// RunTavcli(). `output`, when given, receives the captured output of the
/// last run. Each run is limited to `timeoutSeconds`; a run killed by it
/// (-1) is not retried. Returns the exit code of the last run.
int RunOskCmd(std::vector<std::string> arguments, std::string* output = nullptr,
              int timeoutSeconds = kChangeTimeoutSeconds);

/// "osk-cmd", "-U", ConsoleUser(), `command` through RunOskCmd(); for
/// example "internalsvc/refresh" after network changes.
int RunOskCommand(const std::string& command);

/// The "get" form of the management-API tool: logs "osk-cmd invocation: get
/// %s" with `path` at info level, runs "osk-cmd", "-U", ConsoleUser(),
/// "get", `path` (a read: kQueryTimeoutSeconds) and stores the printed
/// value (without surrounding white space) in `value`. Returns the exit
/// code.
int RunOskCmdGet(const std::string& path, std::string& value);

/// True when the "get" of `path` succeeds and prints "true" (for example
/// "osksvc/auth/lockdown_is_enabled").
bool OskCmdGetFlag(const std::string& path);

/// Powers off the virtual machines before a shutdown or restart: runs
/// "osk-cmd", "-U", ConsoleUser(), "hostsvc/autostartmanager/autostop",
/// then "/bin/powerOffVms" ("powerOffVms", plus "--terminate" unless
/// `graceful`: running machines are then forcefully terminated), each
/// limited to kPowerOffVmsTimeoutSeconds. Both runs are logged by the
/// runner. Returns the exit code of "powerOffVms".
int PowerOffVirtualMachines(bool graceful);

/// Sets an integer advanced option: runs "/sbin/tavcli" with "tavcli",
/// "system", "settings", "advanced", "set", "-o", `path`, "-i", `value` in
/// an environment of "TAV_USERNAME=" + ConsoleUser() and
/// "TAV_AUDIT_IP=127.0.0.1"; when that fails, the same through
/// "/sbin/localcli" (first argument "localcli"). Each run is logged like
/// RunLoggedCommand(). Returns true when either run succeeded.
bool SetAdvancedOption(const std::string& path, std::int64_t value);

/// The integer value of an advanced option, or `defaultValue` when the
/// host-control library cannot read it (a missing option, a failing
/// library). Nothing is logged.
std::int64_t ReadAdvancedOption(const std::string& path, std::int64_t defaultValue);

}  // namespace Tulk
