#include "host/WelcomeFacts.h"

#include <syslog.h>

#include "host/ManagementNetwork.h"
#include "host/NetworkInventory.h"
#include "include/Constants.h"
#include "platform/api/CpuInfoImpl.h"
#include "platform/api/HardwareInfoImpl.h"
#include "platform/api/HostMgrException.h"
#include "platform/api/MemoryInfoImpl.h"
#include "platform/api/NetworkInfoImpl.h"
#include "platform/api/SystemInformation.h"
#include "runtime/SystemLog.h"

namespace Tulk {
namespace {

// The answer of `query`, or `filler` after logging "Getting <what>
// failed: <the host-control exception's text>".
template <typename Value, typename Query>
Value Ask(const char* what, Value filler, Query query) {
  try {
    return query();
  } catch (const HostMgr::Lib::HostMgrException& error) {
    Log(LOG_ERR, "Getting %s failed: %s", what, error.what());
    return filler;
  }
}

void ReadManagementAddresses(WelcomeFacts& facts) {
  auto nic = GetManagementInterface();
  if (!nic) {
    return;
  }
  try {
    if (nic->IsStale()) {
      nic->Refresh();
    }
    const HostMgr::Network::IpConfig config = nic->GetIpConfig();
    std::vector<Ipv6Entry> ipv6;
    for (const HostMgr::Network::Ipv6Network& network : config.GetIpv6Networks()) {
      ipv6.push_back(Ipv6Entry{network.GetStringAddress(), network.GetAddressType()});
    }
    facts.dhcp = config.GetDhcp();
    facts.ipv4None = config.GetIpv4UseNone();
    facts.ipv4Address = config.GetIpv4Address().GetStringAddress();
    facts.ipv6 = std::move(ipv6);
  } catch (const HostMgr::Lib::HostMgrException& error) {
    Log(LOG_ERR, "Getting management IP configuration failed: %s", error.what());
  }
}

bool ReadAuditMode() {
  return Ask("boot option", false, [] {
    unsigned char bootOption[3] = {};
    return HSI_Get(HSI_NODE_system_bootOption, bootOption, sizeof bootOption) == 0 &&
           bootOption[0] == 1;
  });
}

}  // namespace

WelcomeFacts ReadWelcomeFacts() {
  WelcomeFacts facts;
  ReadManagementAddresses(facts);
  facts.kernelIpv6Enabled = Ask(
      "IPv6 state", false, [] { return HykCtl::Network::NetworkInfoImpl().IsHykIpv6Enabled(); });
  facts.hostname = GetHostName();
  if (facts.hostname == kNotAvailable) {
    facts.hostname.clear();  // an unreadable name offers no address line
  }
  facts.hasPhysicalNics = Ask(
      "physical nics", true, [] { return !HykCtl::Network::NetworkInfoImpl().GetPnics().empty(); });
  facts.auditMode = ReadAuditMode();

  facts.vendor = Ask("vendor name", std::string(),
                     [] { return HykCtl::Hardware::HardwareInfoImpl().GetVendorName(); });
  facts.product = Ask("product name", std::string(kNotAvailable),
                      [] { return HykCtl::Hardware::HardwareInfoImpl().GetProductName(); });
  facts.cpuPackages = Ask("processor packages", 0,
                          [] { return HykCtl::Hardware::CpuInfoImpl().GetNumCpuPackages(); });
  facts.cpuModel = Ask("processor model", std::string(kNotAvailable),
                       [] { return HykCtl::Hardware::CpuInfoImpl().GetModelName(); });
  facts.memoryBytes = Ask("memory size", std::uint64_t{0}, [] {
    const HykCtl::Hardware::MemoryInfoImpl memory;
    return memory.GetTotalPages() * memory.GetPageSize();
  });
  return facts;
}

}  // namespace Tulk
