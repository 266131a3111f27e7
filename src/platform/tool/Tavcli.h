#pragma once
/// The host's command-line management tool ("tavcli", also run as
/// "localcli"): advanced options, installed packages, standard switches.

#include "platform/tool/ToolRun.h"

namespace Sim::Tools {

/// Acts on `run` and returns its exit status (see docs/simulated-host.md
/// for the commands).
int Tavcli(ToolRun& run);

}  // namespace Sim::Tools
