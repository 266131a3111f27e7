#pragma once
/// The management network as the console shows it: the management kernel
/// NIC, its IPv4 address and the host's fully qualified name. Nothing here
/// throws.

#include <memory>
#include <string>

#include "platform/api/HykNicImpl.h"

namespace Tulk {

/// The management kernel NIC, owned by the caller: UpdateManagementInterface
/// then GetManagementInterface on a fresh NetworkInfoImpl. Null when the
/// host has none, and also when the host-control library fails, which is
/// logged at error level as "Getting management interface failed: %s".
/// Callers that need it and get none log "Could not locate the management
/// interface" (or their own line).
std::unique_ptr<HykCtl::Network::HykNicImpl> GetManagementInterface();

/// The management NIC's IPv4 address in dotted form ("0.0.0.0" when there
/// is no management NIC or no address). The NIC is refreshed first when it
/// is marked stale. A host-control failure logs "Getting management IPv4
/// address failed: %s" at error level and gives "0.0.0.0".
std::string GetManagementIpv4Address();

/// Whether a management kernel NIC exists and is in service; false also
/// when the question fails (logged as "Getting management interface state
/// failed: %s").
bool IsManagementInterfaceUp();

/// The host name (without domain) of "defaultTcpipStack"; "N/A" when it
/// cannot be read (logged as "Getting host name failed: %s").
std::string GetHostName();

/// Host name, ".", domain, from the DNS configuration of
/// "defaultTcpipStack". An empty domain leaves the trailing dot
/// ("tavi-01."). A host-control failure logs "Getting host name failed: %s"
/// at error level and gives "N/A".
std::string GetHostFqdn();

/// Whether the management NIC is attached to a port of a distributed
/// switch. False without a management NIC ("Could not locate the
/// management interface" is logged at error level) and when the question
/// fails ("Could not determine if a DVS was in use: %s").
bool IsManagementOnDistributedSwitch();

}  // namespace Tulk
