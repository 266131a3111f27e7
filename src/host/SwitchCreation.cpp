#include "host/SwitchCreation.h"

#include <syslog.h>

#include "host/ManagementNetwork.h"
#include "host/NetworkInventory.h"
#include "platform/api/HostMgrException.h"
#include "platform/api/HykNicImpl.h"
#include "platform/api/PortGroupImpl.h"
#include "platform/api/Portset.h"
#include "platform/api/PortsetImpl.h"
#include "platform/api/VirtualSwitchInfoImpl.h"
#include "runtime/SystemLog.h"

namespace Tulk {

using HostMgr::Lib::HostMgrException;

bool VirtualSwitchNameTaken(const std::string& name) {
  try {
    return HykCtl::Network::PortsetImpl::IsValidVirtualSwitch(name);
  } catch (const HostMgrException&) {
    return true;
  }
}

bool PortGroupNameTaken(const std::string& name) {
  try {
    return HykCtl::Network::PortGroupImpl::IsValidPortGroup(name);
  } catch (const HostMgrException&) {
    return true;
  }
}

std::string ReadManagementInterfaceName() {
  try {
    std::unique_ptr<HykCtl::Network::HykNicImpl> nic = GetManagementInterface();
    return nic ? nic->GetName() : std::string();
  } catch (const HostMgrException&) {
    return {};
  }
}

std::vector<PnicRow> ReadFreePhysicalNics() {
  std::vector<SwitchSummary> switches;
  ScanVirtualSwitches(switches);
  std::vector<PnicRow> pnics;
  GetPhysicalNicList(pnics, BuildPnicUsage(switches));
  std::vector<PnicRow> free;
  for (PnicRow& pnic : pnics) {
    if (pnic.switchName.empty()) {
      free.push_back(std::move(pnic));
    }
  }
  return free;
}

HostOutcome CreateStandardSwitch(const std::string& name, const std::string& uplink) {
  if (uplink.empty()) {
    Log(LOG_INFO, "Creating standard virtual switch %s", name.c_str());
  } else {
    Log(LOG_INFO, "Creating standard virtual switch %s with uplink %s", name.c_str(),
        uplink.c_str());
  }
  HykCtl::Network::VirtualSwitchInfoImpl switches;
  bool created = false;
  try {
    switches.AddVirtualSwitch(name, HostMgr::Network::Portset::DEF_NUM_PORTS);
    created = true;
    if (!uplink.empty()) {
      HykCtl::Network::PortsetImpl portset(name);
      portset.AddUplink(uplink);
      portset.SetTeamingPolicy(HostMgr::Network::NicTeamingPolicy({uplink}, 1));
    }
    return HostOutcome::Done();
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Creating standard virtual switch %s failed: %s", name.c_str(), failure.what());
    if (created) {
      try {
        switches.RemoveVirtualSwitch(name);
      } catch (const HostMgrException&) {
        // Left for the operator: the log line above names the switch.
      }
    }
    return HostOutcome::Failed(failure.what());
  }
}

HostOutcome CreatePortGroup(const std::string& name, const std::string& switchName, int vlanId) {
  Log(LOG_INFO, "Creating portgroup %s on %s with VLAN %d", name.c_str(), switchName.c_str(),
      vlanId);
  try {
    HykCtl::Network::PortsetImpl(switchName).AddPortGroup(name, vlanId);
    return HostOutcome::Done();
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Creating portgroup %s failed: %s", name.c_str(), failure.what());
    return HostOutcome::Failed(failure.what());
  }
}

HostOutcome MigrateKernelNic(const std::string& nic, const std::string& portGroup) {
  Log(LOG_INFO, "Migrating %s to portgroup %s", nic.c_str(), portGroup.c_str());
  try {
    HykCtl::Network::HykNicImpl(nic).ConnectToPortGroup(portGroup);
    return HostOutcome::Done();
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Migrating %s to portgroup %s failed: %s", nic.c_str(), portGroup.c_str(),
        failure.what());
    return HostOutcome::Failed(failure.what());
  }
}

}  // namespace Tulk
