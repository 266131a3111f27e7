#include "host/DvsRepair.h"

#include <syslog.h>

#include "host/ManagementNetwork.h"
#include "host/SwitchSummary.h"
#include "platform/api/HostMgrException.h"
#include "platform/api/PortsetImpl.h"
#include "runtime/SystemLog.h"

namespace Tulk {

using HostMgr::Lib::HostMgrException;
using HykCtl::Network::ConnectionPoint;

std::optional<ManagementDvsPort> ReadManagementDvsPort() {
  std::unique_ptr<HykCtl::Network::HykNicImpl> nic = GetManagementInterface();
  if (!nic) {
    Log(LOG_ERR, "Could not locate the management interface");
    return std::nullopt;
  }
  try {
    std::optional<ConnectionPoint> point = nic->GetConnectionPoint();
    if (!point || point->GetType() != ConnectionPoint::kDvsPort) {
      Log(LOG_ERR, "The management interface is not on a distributed switch");
      return std::nullopt;
    }
    HykCtl::Network::PortsetImpl dvs(point->GetName());
    ManagementDvsPort port;
    port.nic = nic->GetName();
    port.switchName = point->GetName();
    port.portId = point->GetPortId();
    port.switchUplinks = dvs.GetUplinks();
    port.thirdParty = dvs.IsThirdParty();
    const HostMgr::Network::DvsPort current = dvs.GetDvsPort(port.portId);
    port.vlanId = current.vlanId;
    port.portUplinks = current.uplinks;
    port.blocked = current.blocked;
    return port;
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Reading the management DVS port failed: %s", failure.what());
    return std::nullopt;
  }
}

HostOutcome RepairManagementDvsPort(const DvsPortRepair& repair) {
  try {
    std::unique_ptr<HykCtl::Network::HykNicImpl> nic = GetManagementInterface();
    std::optional<ConnectionPoint> point;
    if (nic) {
      point = nic->GetConnectionPoint();
    }
    if (!point || point->GetType() != ConnectionPoint::kDvsPort) {
      throw HostMgrException("The management interface is not on a distributed switch");
    }
    HykCtl::Network::PortsetImpl dvs(point->GetName());
    HostMgr::Network::DvsPort settings = dvs.GetDvsPort(point->GetPortId());
    settings.vlanId = repair.vlanId;
    settings.uplinks = repair.uplinks;
    if (repair.unblock) {
      settings.blocked = false;
    }
    const std::string portId = dvs.AddHostLocalPort(point->GetPortId(), settings);
    const std::string nicName = nic->GetName();
    Log(LOG_INFO, "Restoring DVS %s: new host local port %s for %s (VLAN %d, uplinks %s)",
        point->GetName().c_str(), portId.c_str(), nicName.c_str(), repair.vlanId,
        JoinNames(repair.uplinks).c_str());
    nic->ConnectToDvsPort(point->GetName(), portId);
    return HostOutcome::Done();
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Restoring DVS failed: %s", failure.what());
    return HostOutcome::Failed(failure.what());
  }
}

}  // namespace Tulk
