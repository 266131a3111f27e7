#pragma once
/// The host's management-API command tool ("osk-cmd"): service control,
/// the autostart manager, the agent refresh and the lockdown mode.

#include "platform/tool/ToolRun.h"

namespace Sim::Tools {

/// Acts on `run` and returns its exit status: 255 when the "-U" user may
/// not run the tool (see docs/simulated-host.md for the commands).
int OskCmd(ToolRun& run);

}  // namespace Sim::Tools
