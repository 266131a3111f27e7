#include "host/WelcomeFacts.h"

#include "host/ManagementNetwork.h"
#include "host/NetworkInventory.h"
#include "include/Constants.h"
#include "platform/api/CpuInfoImpl.h"
#include "platform/api/HardwareInfoImpl.h"
#include "platform/api/MemoryInfoImpl.h"
#include "platform/api/NetworkInfoImpl.h"
#include "platform/api/SystemInformation.h"

namespace Tulk {

WelcomeFacts ReadWelcomeFacts() {
  WelcomeFacts facts;
  if (auto nic = GetManagementInterface()) {
    if (nic->IsStale()) {
      nic->Refresh();
    }
    const HostMgr::Network::IpConfig config = nic->GetIpConfig();
    facts.dhcp = config.GetDhcp();
    facts.ipv4None = config.GetIpv4UseNone();
    facts.ipv4Address = config.GetIpv4Address().GetStringAddress();
    for (const HostMgr::Network::Ipv6Network& network : config.GetIpv6Networks()) {
      facts.ipv6.push_back(Ipv6Entry{network.GetStringAddress(), network.GetAddressType()});
    }
  }
  HykCtl::Network::NetworkInfoImpl network;
  facts.kernelIpv6Enabled = network.IsHykIpv6Enabled();
  facts.hostname = GetHostName();
  if (facts.hostname == kNotAvailable) {
    facts.hostname.clear();  // an unreadable name offers no address line
  }
  facts.hasPhysicalNics = !network.GetPnics().empty();

  unsigned char bootOption[3] = {};
  facts.auditMode =
      HSI_Get(HSI_NODE_system_bootOption, bootOption, sizeof bootOption) == 0 && bootOption[0] == 1;

  const HykCtl::Hardware::HardwareInfoImpl hardware;
  facts.vendor = hardware.GetVendorName();
  facts.product = hardware.GetProductName();
  const HykCtl::Hardware::CpuInfoImpl cpu;
  facts.cpuPackages = cpu.GetNumCpuPackages();
  facts.cpuModel = cpu.GetModelName();
  const HykCtl::Hardware::MemoryInfoImpl memory;
  facts.memoryBytes = memory.GetTotalPages() * memory.GetPageSize();
  return facts;
}

}  // namespace Tulk
