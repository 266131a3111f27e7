#pragma once
/// The operations agent of the network-overlay product ("zyo-opsagent"):
/// start, stop and presence through its init script
/// "/etc/init.d/zyo-opsagent", and the test of its installed major version.
/// Every step is logged; nothing throws. Start and stop are limited to
/// kChangeTimeoutSeconds, the status to kQueryTimeoutSeconds and the version
/// test to kPackageQueryTimeoutSeconds (host/CommandRunner.h); a script
/// killed by its limit counts as failed (or as an absent agent).

namespace Tulk {

/// Logs "Starting zyo-opsagent.", runs the init script with "start" and
/// logs "Failed to start zyo-opsagent." at error level when it fails.
/// Returns true when the script succeeded.
bool StartOpsAgent();

/// Logs "Stopping zyo-opsagent.", runs the init script with "stop" and logs
/// "zyo-opsagent has been successfully stopped." or, at error level,
/// "Failed to stop zyo-opsagent.". Returns true when the script succeeded.
bool StopOpsAgent();

/// Runs the init script with "status" (not when the script does not
/// exist, so that a host without the agent logs no failed start) and logs "zyo-opsagent is
/// %spresent on the system." ("" or "not "). True when the script exits with 0.
bool IsOpsAgentPresent();

/// Starts the agent when it is present; otherwise logs "Skipping
/// zyo-opsagent start.". Returns true when the agent was started.
bool StartOpsAgentIfPresent();

/// Asks the host's package query for the installed "zyo-opsagent" and tests
/// that the major number of its Version field is 3 or more. The test is one
/// shell line (logged first as "Running: %s") run through RunShellCommand:
/// "tavcli --formatter=keyvalue software vib get -n zyo-opsagent" piped into
/// awk, which reads the value of the first key whose dotted name has a part
/// "Version", takes the number before its first full stop and exits with 0
/// for 3 or more and 1 otherwise (also when no version is printed). Exit
/// code 0 logs "zyo-opsagent version >= 3 detected".
bool IsOpsAgentVersion3OrLater();

/// The overlay condition of the network restore menu: the agent is present
/// and at major version 3 or later. When it is absent the version is not
/// asked.
bool HasOpsAgentVersion3OrLater();

/// The version-test command line (see IsOpsAgentVersion3OrLater()).
const char* OpsAgentVersionCommand();

}  // namespace Tulk
