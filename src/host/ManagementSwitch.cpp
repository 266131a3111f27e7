#include "host/ManagementSwitch.h"

#include <syslog.h>

#include <algorithm>
#include <optional>

#include "platform/api/HostMgrException.h"
#include "platform/api/HykNicImpl.h"
#include "platform/api/PortGroupImpl.h"
#include "platform/api/PortsetImpl.h"
#include "platform/api/VirtualSwitchInfoImpl.h"
#include "runtime/SystemLog.h"

namespace Tulk {
namespace {

using HostMgr::Lib::HostMgrException;
using HostMgr::Network::NicTeamingPolicy;
using HykCtl::Network::ConnectionPoint;
using HykCtl::Network::PortsetImpl;

/// Where the management NIC is attached.
struct Attachment {
  std::string switchName;
  /// The management portgroup (empty on a distributed switch).
  std::string portGroup;
};

/// The NIC's switch and portgroup, refused unless the switch is a standard
/// one; every failure is logged.
std::optional<Attachment> FindStandardSwitch(const std::string& nic) {
  Attachment attachment;
  try {
    std::optional<ConnectionPoint> point = HykCtl::Network::HykNicImpl(nic).GetConnectionPoint();
    if (!point || (point->GetType() != ConnectionPoint::kPortGroup &&
                   point->GetType() != ConnectionPoint::kDvsPort &&
                   point->GetType() != ConnectionPoint::kOpaqueNetwork)) {
      Log(LOG_ERR, "Unsupported connectee type");
      return std::nullopt;
    }
    if (point->GetType() == ConnectionPoint::kOpaqueNetwork) {
      Log(LOG_ERR, "Opaque network connectee type not supported");
      return std::nullopt;
    }
    attachment.switchName = point->GetName();
    attachment.portGroup = point->GetPortGroupName();
    if (PortsetImpl(attachment.switchName).GetType() != PortsetImpl::kStandard) {
      Log(LOG_ERR, "Unsupported vSwitch type");
      return std::nullopt;
    }
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Getting switch name failed: %s", failure.what());
    return std::nullopt;
  }
  return attachment;
}

void Erase(std::vector<std::string>& names, const std::string& name) {
  names.erase(std::remove(names.begin(), names.end(), name), names.end());
}

// The policy once `pnic` has left a switch that keeps `remaining` uplinks.
NicTeamingPolicy WithoutUplink(NicTeamingPolicy policy, const std::string& pnic, int remaining) {
  std::vector<std::string> order = policy.GetUplinkOrder();
  Erase(order, pnic);
  policy.SetUplinkOrder(std::move(order));
  const int floor = std::min(1, remaining);
  policy.SetMaxActiveUplinks(std::clamp(policy.GetMaxActiveUplinks() - 1, floor, remaining));
  return policy;
}

// Lowers the teaming policy of standard switch `owner` that `pnic` has left.
void ShrinkPolicyOf(const std::string& owner, const std::string& pnic) {
  PortsetImpl source(owner);
  if (source.GetType() == PortsetImpl::kStandard) {
    const int remaining = static_cast<int>(source.GetUplinks().size());
    source.SetTeamingPolicy(WithoutUplink(source.GetTeamingPolicy(), pnic, remaining));
  }
}

std::string OwnerOf(const std::string& pnic) {
  HykCtl::Network::VirtualSwitchInfoImpl info;
  for (const auto& list : {info.GetVirtualSwitches(), info.GetDVSwitches()}) {
    for (const PortsetImpl& portset : list) {
      const std::vector<std::string> uplinks = portset.GetUplinks();
      if (std::find(uplinks.begin(), uplinks.end(), pnic) != uplinks.end()) {
        return portset.GetName();
      }
    }
  }
  return "";
}

}  // namespace

bool GetMgmtSwitchName(const std::string& nic, std::string& name) {
  std::optional<Attachment> attachment = FindStandardSwitch(nic);
  if (!attachment) {
    return false;
  }
  name = attachment->switchName;
  return true;
}

bool GetMgmtVlanId(const std::string& nic, std::uint16_t& vlanId) {
  std::optional<Attachment> attachment = FindStandardSwitch(nic);
  if (!attachment) {
    return false;
  }
  try {
    vlanId = static_cast<std::uint16_t>(
        HykCtl::Network::PortGroupImpl(attachment->portGroup).GetVlanId());
    return true;
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Getting VlanID failed: %s", failure.what());
    return false;
  }
}

bool SetMgmtVlanId(const std::string& nic, std::uint16_t vlanId) {
  std::optional<Attachment> attachment = FindStandardSwitch(nic);
  if (!attachment) {
    return false;
  }
  try {
    HykCtl::Network::PortGroupImpl(attachment->portGroup).SetVlanId(vlanId);
    return true;
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Setting VlanID failed: %s", failure.what());
    return false;
  }
}

bool GetMaxActiveUplinks(const std::string& nic, int& count) {
  std::optional<Attachment> attachment = FindStandardSwitch(nic);
  if (!attachment) {
    return false;
  }
  try {
    count = PortsetImpl(attachment->switchName).GetTeamingPolicy().GetMaxActiveUplinks();
    return true;
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Getting max number of active uplinks failed: %s", failure.what());
    return false;
  }
}

bool GetMgmtUplinks(const std::string& nic, std::vector<std::string>& uplinks) {
  std::optional<Attachment> attachment = FindStandardSwitch(nic);
  if (!attachment) {
    return false;
  }
  try {
    uplinks = PortsetImpl(attachment->switchName).GetUplinks();
    return true;
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Getting uplinks failed: %s", failure.what());
    return false;
  }
}

bool AddMgmtUplink(const std::string& nic, const std::string& pnic) {
  std::optional<Attachment> attachment = FindStandardSwitch(nic);
  if (!attachment) {
    return false;
  }
  const std::string& target = attachment->switchName;
  std::string owner;
  try {
    owner = OwnerOf(pnic);
    if (!owner.empty() && owner != target) {
      PortsetImpl(owner).MoveUplink(pnic, target);
    } else {
      PortsetImpl(target).AddUplink(pnic);
    }
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Adding uplink %s failed: %s", pnic.c_str(), failure.what());
    return false;
  }
  if (!owner.empty() && owner != target) {
    try {
      ShrinkPolicyOf(owner, pnic);
    } catch (const HostMgrException& failure) {
      Log(LOG_ERR, "VS: remove uplink from teaming policy failed: %s", failure.what());
    }
  }
  try {
    PortsetImpl portset(target);
    NicTeamingPolicy policy = portset.GetTeamingPolicy();
    std::vector<std::string> order = policy.GetUplinkOrder();
    Erase(order, pnic);
    order.push_back(pnic);
    const int size = static_cast<int>(order.size());
    policy.SetUplinkOrder(std::move(order));
    policy.SetMaxActiveUplinks(std::min(policy.GetMaxActiveUplinks() + 1, size));
    portset.SetTeamingPolicy(policy);
    return true;
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "VS: add uplink to teaming policy failed: %s", failure.what());
    return false;
  }
}

bool RemoveMgmtUplink(const std::string& nic, const std::string& pnic) {
  std::optional<Attachment> attachment = FindStandardSwitch(nic);
  if (!attachment) {
    return false;
  }
  const std::string& name = attachment->switchName;
  try {
    PortsetImpl(name).RemoveUplink(pnic);
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Removing uplink %s failed: %s", pnic.c_str(), failure.what());
    return false;
  }
  try {
    PortsetImpl portset(name);
    const int remaining = static_cast<int>(portset.GetUplinks().size());
    portset.SetTeamingPolicy(WithoutUplink(portset.GetTeamingPolicy(), pnic, remaining));
    return true;
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "VS: remove uplink from teaming policy failed: %s", failure.what());
    return false;
  }
}

bool SetMgmtUplinkOrder(const std::string& nic, const std::vector<std::string>& order) {
  std::optional<Attachment> attachment = FindStandardSwitch(nic);
  if (!attachment) {
    return false;
  }
  try {
    PortsetImpl portset(attachment->switchName);
    const std::vector<std::string> uplinks = portset.GetUplinks();
    std::vector<std::string> ordered;
    for (const std::string& name : order) {
      if (std::find(uplinks.begin(), uplinks.end(), name) != uplinks.end()) {
        ordered.push_back(name);
      }
    }
    for (const std::string& name : uplinks) {
      if (std::find(ordered.begin(), ordered.end(), name) == ordered.end()) {
        ordered.push_back(name);
      }
    }
    NicTeamingPolicy policy = portset.GetTeamingPolicy();
    if (policy.GetUplinkOrder() != ordered) {
      policy.SetUplinkOrder(std::move(ordered));
      portset.SetTeamingPolicy(policy);
    }
    return true;
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Setting uplink order failed: %s", failure.what());
    return false;
  }
}

}  // namespace Tulk
