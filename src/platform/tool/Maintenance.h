#pragma once
/// Diagnostics and maintenance programs: "hykping", "hykbacktrace",
/// "firmwareConfig.py" and "backup.sh".

#include "platform/tool/ToolRun.h"

namespace Sim::Tools {

/// "hykping [-c count] [-I interface] address": succeeds when the address
/// is in the state's "network.reachable" list (a zone is ignored) and the
/// interface, when given, is an enabled kernel NIC.
int Ping(ToolRun& run);

/// "hykbacktrace -w -n process -o pattern -d folder": writes a core file
/// under the root when the process (a service of the state) runs.
int Backtrace(ToolRun& run);

/// "firmwareConfig.py --reset-only": resets the system configuration.
int FirmwareConfig(ToolRun& run);

/// "backup.sh 0": records a configuration backup.
int Backup(ToolRun& run);

}  // namespace Sim::Tools
