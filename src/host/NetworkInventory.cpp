#include "host/NetworkInventory.h"

#include <syslog.h>

#include <string>

#include "platform/api/HostMgrException.h"
#include "platform/api/HykernelNicInfoImpl.h"
#include "platform/api/NetworkInfoImpl.h"
#include "platform/api/PnicImpl.h"
#include "platform/api/VirtualSwitchInfoImpl.h"
#include "runtime/SystemLog.h"

namespace Tulk {
namespace {

using HostMgr::Lib::HostMgrException;
using HykCtl::Network::ConnectionPoint;

constexpr int kAllPortsets = 0;

SwitchSummary Summarize(const HykCtl::Network::PortsetImpl& portset) {
  SwitchSummary summary;
  summary.name = portset.GetName();
  summary.uplinks = portset.GetUplinks();
  summary.portGroups = portset.GetPortGroups();
  summary.numPorts = portset.GetNumPorts();
  summary.usedPorts = portset.GetUsedPorts();
  summary.configuredPorts = portset.GetConfiguredPorts();
  return summary;
}

void AppendSummaries(const std::vector<HykCtl::Network::PortsetImpl>& portsets,
                     std::vector<SwitchSummary>& switches) {
  for (const HykCtl::Network::PortsetImpl& portset : portsets) {
    switches.push_back(Summarize(portset));
  }
}

}  // namespace

bool GetKernelNicList(std::vector<HykNicInfo>& nics) {
  try {
    std::vector<HykCtl::Network::HykNicImpl> found =
        HykCtl::Network::HykernelNicInfoImpl().GetHykernelNics(kAllPortsets);
    nics.reserve(nics.size() + found.size());
    for (const HykCtl::Network::HykNicImpl& nic : found) {
      std::string name = nic.GetName();
      std::optional<ConnectionPoint> point = nic.GetConnectionPoint();
      std::string mac = nic.GetMacAddress().GetStringAddress();
      std::string connection =
          point && !point->GetName().empty() ? point->GetName() : kNotAvailable;
      std::string portGroup = point && point->GetType() == ConnectionPoint::kPortGroup
                                  ? point->GetPortGroupName()
                                  : kNotAvailable;
      nics.emplace_back(std::move(name), std::move(mac), std::move(connection),
                        std::move(portGroup));
    }
    return true;
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Gathering Hykernel NIC list failed: %s", failure.what());
    return false;
  }
}

bool GetPortGroupList(std::vector<PortGroupInfo>& portGroups) {
  try {
    for (const HykCtl::Network::PortGroupImpl& portGroup :
         HykCtl::Network::NetworkInfoImpl().GetAllPortGroups(kAllPortsets)) {
      portGroups.emplace_back(portGroup.GetName(), portGroup.GetVirtualSwitchName(),
                              std::to_string(portGroup.GetActiveClients()),
                              std::to_string(portGroup.GetVlanId()));
    }
    return true;
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Getting physical nics failed: %s", failure.what());
    return false;
  }
}

bool GetPhysicalNicList(std::vector<PnicRow>& pnics, const PnicUsage& usage) {
  try {
    for (const std::string& name : HykCtl::Network::NetworkInfoImpl().GetPnics()) {
      HykCtl::Network::PnicImpl pnic(name);
      PnicRow row;
      row.name = name;
      row.hardwareLabel = pnic.GetPciDevice().description;
      if (row.hardwareLabel.empty()) {
        row.hardwareLabel = kNotAvailable;
      }
      if (pnic.IsStale()) {
        pnic.Refresh();
      }
      row.mac = pnic.GetMacAddress().GetStringAddress();
      row.linkState = pnic.IsLinkUp() ? "Connected" : "Disconnected";
      if (auto user = usage.find(name); user != usage.end()) {
        row.switchName = user->second;
      }
      pnics.push_back(std::move(row));
    }
    return true;
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Getting physical nics failed: %s", failure.what());
    return false;
  }
}

bool ScanVirtualSwitches(std::vector<SwitchSummary>& switches) {
  HykCtl::Network::VirtualSwitchInfoImpl info;
  try {
    AppendSummaries(info.GetVirtualSwitches(), switches);
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Scanning virtual switches failed: %s", failure.what());
    return false;
  }
  try {
    AppendSummaries(info.GetDVSwitches(), switches);
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Scanning dvswitches failed: %s", failure.what());
    return false;
  }
  return true;
}

bool GetStandardSwitchList(std::vector<SwitchSummary>& switches) {
  try {
    AppendSummaries(HykCtl::Network::VirtualSwitchInfoImpl().GetVirtualSwitches(), switches);
    return true;
  } catch (const HostMgrException& failure) {
    Log(LOG_ERR, "Gathering standard virtual switch list failed: %s", failure.what());
    return false;
  }
}

PnicUsage BuildPnicUsage(const std::vector<SwitchSummary>& switches) {
  PnicUsage usage;
  for (const SwitchSummary& summary : switches) {
    for (const std::string& uplink : summary.uplinks) {
      usage.emplace(uplink, summary.name);
    }
  }
  return usage;
}

}  // namespace Tulk
