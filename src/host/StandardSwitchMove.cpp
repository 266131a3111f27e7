#include "host/StandardSwitchMove.h"

#include <syslog.h>

#include "host/ManagementNetwork.h"
#include "platform/api/HostMgrException.h"
#include "platform/api/HykernelNicInfoImpl.h"
#include "platform/api/PortGroupImpl.h"
#include "platform/api/Portset.h"
#include "platform/api/PortsetImpl.h"
#include "platform/api/VirtualSwitchInfoImpl.h"
#include "runtime/SystemLog.h"

namespace Tulk {
namespace {

using HostMgr::Lib::HostMgrException;
using HykCtl::Network::ConnectionPoint;
using HykCtl::Network::PortsetImpl;

void AddToTeaming(PortsetImpl& target, const std::string& uplink) {
  try {
    HostMgr::Network::NicTeamingPolicy policy = target.GetTeamingPolicy();
    std::vector<std::string> order = policy.GetUplinkOrder();
    order.push_back(uplink);
    policy.SetUplinkOrder(order);
    policy.SetMaxActiveUplinks(static_cast<int>(order.size()));
    target.SetTeamingPolicy(policy);
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "VS: add uplink to teaming policy failed: %s", failure.what());
  }
}

}  // namespace

std::string FirstFreeName(const std::string& prefix, int first,
                          const std::function<bool(const std::string&)>& taken) {
  for (int number = first;; ++number) {
    std::string name = prefix + std::to_string(number);
    if (!taken(name)) {
      return name;
    }
  }
}

std::string FirstFreeSwitchName(const std::function<bool(const std::string&)>& taken) {
  return FirstFreeName("vSwitch", 0, taken);
}

std::string FirstFreeManagementPortGroupName(const std::function<bool(const std::string&)>& taken) {
  return FirstFreeName("Management Network", 1, taken);
}

bool MoveManagementToNewStandardSwitch() {
  std::unique_ptr<HykCtl::Network::HykNicImpl> management = GetManagementInterface();
  std::optional<ConnectionPoint> point;
  try {
    if (management) {
      point = management->GetConnectionPoint();
    }
  } catch (const HostMgrException&) {
    point.reset();
  }
  if (!point || point->GetType() != ConnectionPoint::kDvsPort) {
    Log(LOG_ERR, "Could not find the management network");
    return false;
  }
  try {
    PortsetImpl distributed(point->GetName());
    const std::string switchName = FirstFreeSwitchName(PortsetImpl::IsValidVirtualSwitch);
    HykCtl::Network::VirtualSwitchInfoImpl().AddVirtualSwitch(
        switchName, HostMgr::Network::Portset::DEF_NUM_PORTS);
    PortsetImpl target(switchName);
    const std::string portGroup =
        FirstFreeManagementPortGroupName(HykCtl::Network::PortGroupImpl::IsValidPortGroup);
    target.AddPortGroup(portGroup);

    for (HykCtl::Network::HykNicImpl& nic :
         HykCtl::Network::HykernelNicInfoImpl().GetHykernelNics()) {
      nic.Disable();
    }
    management->ConnectToPortGroup(portGroup);
    for (const std::string& uplink : distributed.GetUplinks()) {
      try {
        distributed.MoveUplink(uplink, switchName);
      } catch (const HostMgrException& failure) {
        Log(LOG_ERR, "Moving uplink %s failed: %s", uplink.c_str(), failure.what());
        continue;
      }
      AddToTeaming(target, uplink);
    }
    management->Enable();
    return true;
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Changing to legacy virtual switch failed: %s", failure.what());
    return false;
  }
}

}  // namespace Tulk
