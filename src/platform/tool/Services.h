#pragma once
/// The service scripts: "/etc/init.d/TavShell", "/etc/init.d/SSH",
/// "/etc/init.d/zyo-opsagent" and the management agents' "services.sh".

#include "platform/tool/ToolRun.h"

namespace Sim::Tools {

/// An init script: `run`'s name is the service ("TavShell", "SSH",
/// "zyo-opsagent"), its first argument the verb (start, stop, restart,
/// status). Returns the exit status.
int InitScript(ToolRun& run);

/// "services.sh start|stop|restart": the management agents.
int ServicesScript(ToolRun& run);

}  // namespace Sim::Tools
