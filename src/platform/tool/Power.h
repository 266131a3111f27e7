#pragma once
/// Powering the host and its virtual machines: "poweroff", "reboot",
/// "powerOffVms". They only mark the host state, never the real machine.

#include "platform/tool/ToolRun.h"

namespace Sim::Tools {

/// "poweroff": the state's "power" becomes "off".
int PowerOff(ToolRun& run);

/// "reboot [-f]": "power" becomes "rebooting" ("powerForced" records -f);
/// settings that wait for a restart (the kernel's IPv6 switch) take
/// effect.
int Reboot(ToolRun& run);

/// "powerOffVms [--terminate]": every running virtual machine is powered
/// off; "lastPowerOff" records "terminate" or "shutdown".
int PowerOffVms(ToolRun& run);

}  // namespace Sim::Tools
