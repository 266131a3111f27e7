#pragma once
/// The host steps of the factory network restore, one function each, in
/// the order the restore takes them. Nothing here throws.

#include "host/HostOutcome.h"

namespace Tulk {

/// Whether a virtual machine is running on the host.
///
/// Decision of this implementation: a host-control failure logs "Checking
/// for running VMs failed: %s" at error level and gives true, so that the
/// operator is asked before anything may be powered off.
bool HasRunningVirtualMachines();

/// Runs "/sbin/powerOffVms" with the arguments "powerOffVms" alone, logged
/// by the runner (RunLoggedCommand). Returns the exit code.
int PowerOffAllVirtualMachines();

/// Stops the host from sending core dumps over the network
/// (NetworkInfoImpl::DisableNetDumper).
HostOutcome DisableNetworkDumper();

/// Logs "Clearing Network Config" at informational level, then removes the
/// whole network configuration (NetworkInfoImpl::ClearNetworkConfig).
HostOutcome ClearNetworkConfiguration();

/// Logs "Auto-Configuring Network" at informational level, then builds the
/// factory network (NetworkInfoImpl::AutoConfigNetwork).
HostOutcome AutoConfigureNetwork();

}  // namespace Tulk
