// The inventory queries on the simulated demo host and on edge hosts made
// from it, with fault injection reaching each query's failure line.

#include <gtest/gtest.h>

#include <nlohmann/json.hpp>
#include <string>
#include <vector>

#include "HostTestRoot.h"
#include "host/HardwareInventory.h"
#include "host/HostValueProviders.h"
#include "host/ManagementNetwork.h"
#include "host/NetworkInventory.h"
#include "platform/sim/DemoHost.h"
#include "render/HostValues.h"

namespace {

using HostTest::Logged;
using Lines = std::vector<std::string>;
using nlohmann::json;

class InventoryTest : public ::testing::Test {
 protected:
  void SetUp() override {
    HostTest::ClearLog();
    state_ = Sim::DemoHostState();
    Apply();
  }

  // Writes the edited state as the host's state file.
  void Apply() { HostTest::WriteHostState(state_.dump()); }

  void Fault(const std::string& operation, const std::string& message = "injected") {
    state_["faults"][operation] = message;
    Apply();
  }

  json& Network() { return state_["network"]; }
  json& ManagementNic() { return Network()["hykernelNics"][0]; }

  json state_;
};

std::vector<Tulk::SwitchSummary> Scan(bool* ok = nullptr) {
  std::vector<Tulk::SwitchSummary> switches;
  bool result = Tulk::ScanVirtualSwitches(switches);
  if (ok != nullptr) {
    *ok = result;
  }
  return switches;
}

TEST_F(InventoryTest, KernelNicsOnTheDemoHost) {
  std::vector<Tulk::HykNicInfo> nics;
  ASSERT_TRUE(Tulk::GetKernelNicList(nics));
  ASSERT_EQ(nics.size(), 1u);
  EXPECT_EQ(nics[0].Name(), "hyk0");
  EXPECT_EQ(nics[0].Mac(), "02:6b:4e:10:20:01");
  EXPECT_EQ(nics[0].Portset(), "vSwitch0");
  EXPECT_EQ(nics[0].Portgroup(), "Management Network");
}

TEST_F(InventoryTest, KernelNicColumnsFollowTheAttachment) {
  struct Case {
    const char* name;
    json connection;
    const char* portset;
    const char* portgroup;
  };
  const Case cases[] = {
      {"distributed switch",
       {{"type", "dvsPort"}, {"switch", "dvs-lab"}, {"portId", "12"}},
       "dvs-lab",
       "N/A"},
      {"opaque network", {{"type", "opaqueNetwork"}, {"name", "overlay-7"}}, "overlay-7", "N/A"},
      {"nothing", nullptr, "N/A", "N/A"},
  };
  Network()["switches"].push_back({{"name", "dvs-lab"},
                                   {"type", "distributed"},
                                   {"numPorts", 512},
                                   {"uplinks", json::array()}});
  for (const Case& c : cases) {
    SCOPED_TRACE(c.name);
    ManagementNic()["connection"] = c.connection;
    Apply();
    std::vector<Tulk::HykNicInfo> nics;
    ASSERT_TRUE(Tulk::GetKernelNicList(nics));
    ASSERT_EQ(nics.size(), 1u);
    EXPECT_EQ(nics[0].Portset(), c.portset);
    EXPECT_EQ(nics[0].Portgroup(), c.portgroup);
  }
}

TEST_F(InventoryTest, NoKernelNicsIsAnEmptySuccess) {
  Network()["hykernelNics"] = json::array();
  Network().erase("managementInterface");
  Apply();
  std::vector<Tulk::HykNicInfo> nics;
  EXPECT_TRUE(Tulk::GetKernelNicList(nics));
  EXPECT_TRUE(nics.empty());
  EXPECT_TRUE(HostTest::LogLines().empty());
}

TEST_F(InventoryTest, PortGroupsCarryClientsAndVlan) {
  Network()["portGroups"][1]["vlanId"] = 42;
  Apply();
  std::vector<Tulk::PortGroupInfo> groups;
  ASSERT_TRUE(Tulk::GetPortGroupList(groups));
  ASSERT_EQ(groups.size(), 2u);
  EXPECT_EQ((Lines{groups[0].Name(), groups[0].VirtualSwitch(), groups[0].ActiveClients(),
                   groups[0].VlanId()}),
            (Lines{"Management Network", "vSwitch0", "1", "0"}));
  EXPECT_EQ((Lines{groups[1].Name(), groups[1].VirtualSwitch(), groups[1].ActiveClients(),
                   groups[1].VlanId()}),
            (Lines{"VM Network", "vSwitch1", "1", "42"}));
}

TEST_F(InventoryTest, SwitchScanListsStandardThenDistributed) {
  Network()["switches"].push_back(
      {{"name", "dvs-lab"}, {"type", "distributed"}, {"numPorts", 512}, {"uplinks", {"hynic3"}}});
  Network()["switches"].push_back({{"name", "vSwitch2"}, {"type", "standard"}, {"numPorts", 64}});
  Apply();
  bool ok = false;
  std::vector<Tulk::SwitchSummary> switches = Scan(&ok);
  ASSERT_TRUE(ok);
  Lines names;
  for (const Tulk::SwitchSummary& summary : switches) {
    names.push_back(summary.name);
  }
  EXPECT_EQ(names, (Lines{"vSwitch0", "vSwitch1", "vSwitch2", "dvs-lab"}));
  EXPECT_EQ(switches[0].uplinks, (Lines{"hynic0", "hynic1"}));
  EXPECT_EQ(switches[0].portGroups, (Lines{"Management Network"}));
  EXPECT_EQ(switches[0].numPorts, 128);
  // A switch without uplinks or portgroups.
  EXPECT_NE(Tulk::FormatSwitchSummary(switches[2]).find("\nUplinks: None\nPort groups: None"),
            std::string::npos);

  std::vector<Tulk::SwitchSummary> standard;
  ASSERT_TRUE(Tulk::GetStandardSwitchList(standard));
  EXPECT_EQ(standard.size(), 3u);
}

TEST_F(InventoryTest, PhysicalNicsWithLabelLinkAndSwitch) {
  Network()["pnics"][2]["pci"]["description"] = "";
  Apply();
  std::vector<Tulk::PnicRow> rows;
  ASSERT_TRUE(Tulk::GetPhysicalNicList(rows, Tulk::BuildPnicUsage(Scan())));
  ASSERT_EQ(rows.size(), 4u);
  auto fields = [](const Tulk::PnicRow& row) {
    return Lines{row.name, row.hardwareLabel, row.mac, row.linkState, row.switchName};
  };
  EXPECT_EQ(fields(rows[0]), (Lines{"hynic0", "Kestrel Networks KN-X540 10GbE SFP+ Adapter",
                                    "02:6b:4e:10:20:01", "Connected", "vSwitch0"}));
  EXPECT_EQ(fields(rows[2]),
            (Lines{"hynic2", "N/A", "02:6b:4e:10:30:01", "Disconnected", "vSwitch1"}));
  EXPECT_EQ(fields(rows[3]), (Lines{"hynic3", "Kestrel Networks KN-I350 Gigabit Network Connection",
                                    "02:6b:4e:10:30:02", "Disconnected", ""}));
}

TEST_F(InventoryTest, EachQueryLogsItsOwnFailureLine) {
  struct Case {
    const char* operation;
    bool (*query)();
    const char* line;
  };
  const Case cases[] = {
      {"HykCtl::Network::HykernelNicInfoImpl::GetHykernelNics",
       [] {
         std::vector<Tulk::HykNicInfo> rows;
         return Tulk::GetKernelNicList(rows);
       },
       "<11>Gathering Hykernel NIC list failed: injected"},
      {"HykCtl::Network::NetworkInfoImpl::GetAllPortGroups",
       [] {
         std::vector<Tulk::PortGroupInfo> rows;
         return Tulk::GetPortGroupList(rows);
       },
       "<11>Getting physical nics failed: injected"},
      {"HykCtl::Network::NetworkInfoImpl::GetPnics",
       [] {
         std::vector<Tulk::PnicRow> rows;
         return Tulk::GetPhysicalNicList(rows, {});
       },
       "<11>Getting physical nics failed: injected"},
      {"HykCtl::Network::PnicImpl::GetPciDevice",
       [] {
         std::vector<Tulk::PnicRow> rows;
         return Tulk::GetPhysicalNicList(rows, {});
       },
       "<11>Getting physical nics failed: injected"},
      {"HykCtl::Network::VirtualSwitchInfoImpl::GetVirtualSwitches",
       [] {
         std::vector<Tulk::SwitchSummary> rows;
         return Tulk::ScanVirtualSwitches(rows);
       },
       "<11>Scanning virtual switches failed: injected"},
      {"HykCtl::Network::VirtualSwitchInfoImpl::GetDVSwitches",
       [] {
         std::vector<Tulk::SwitchSummary> rows;
         return Tulk::ScanVirtualSwitches(rows);
       },
       "<11>Scanning dvswitches failed: injected"},
      {"HykCtl::Network::VirtualSwitchInfoImpl::GetVirtualSwitches",
       [] {
         std::vector<Tulk::SwitchSummary> rows;
         return Tulk::GetStandardSwitchList(rows);
       },
       "<11>Gathering standard virtual switch list failed: injected"},
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(c.operation);
    SetUp();
    Fault(c.operation);
    EXPECT_FALSE(c.query());
    EXPECT_EQ(HostTest::LogLines(), Lines{c.line});
  }
}

TEST_F(InventoryTest, DistributedScanFailureKeepsTheStandardRows) {
  Fault("HykCtl::Network::VirtualSwitchInfoImpl::GetDVSwitches");
  bool ok = true;
  EXPECT_EQ(Scan(&ok).size(), 2u);
  EXPECT_FALSE(ok);
}

TEST_F(InventoryTest, ManagementAddressAndDistributedSwitch) {
  EXPECT_EQ(Tulk::GetManagementIpv4Address(), "10.20.30.41");
  EXPECT_FALSE(Tulk::IsManagementOnDistributedSwitch());

  ManagementNic()["connection"] = {{"type", "dvsPort"}, {"switch", "dvs-lab"}, {"portId", "7"}};
  Network()["switches"].push_back({{"name", "dvs-lab"}, {"type", "distributed"}});
  Apply();
  EXPECT_TRUE(Tulk::IsManagementOnDistributedSwitch());
  EXPECT_TRUE(HostTest::LogLines().empty());
}

TEST_F(InventoryTest, NoManagementInterfaceGivesTheZeroAddress) {
  Network().erase("managementInterface");
  Apply();
  EXPECT_EQ(Tulk::GetManagementInterface(), nullptr);
  EXPECT_EQ(Tulk::GetManagementIpv4Address(), "0.0.0.0");
  EXPECT_FALSE(Tulk::IsManagementOnDistributedSwitch());
  EXPECT_EQ(HostTest::LogLines(), Lines{"<11>Could not locate the management interface"});
}

TEST_F(InventoryTest, ManagementFailuresAreLoggedNotThrown) {
  Fault("HykCtl::Network::NetworkInfoImpl::GetManagementInterface");
  EXPECT_EQ(Tulk::GetManagementIpv4Address(), "0.0.0.0");
  EXPECT_EQ(HostTest::LogLines(), Lines{"<11>Getting management interface failed: injected"});
}

TEST_F(InventoryTest, FqdnKeepsTheDotOfAnEmptyDomain) {
  EXPECT_EQ(Tulk::GetHostFqdn(), "tavi-01.lab.example.net");
  Network()["dns"]["domain"] = "";
  Apply();
  EXPECT_EQ(Tulk::GetHostFqdn(), "tavi-01.");
}

TEST_F(InventoryTest, MemorySizeFromPagesAndPageSize) {
  struct Case {
    std::int64_t pages;
    std::int64_t pageSize;
    const char* text;
  };
  for (const Case& c : {Case{16777216, 4096, "64 GB"}, Case{262144, 4096, "1 GB"},
                        Case{1073741825, 1, "1.2 GB"}, Case{720896, 4096, "2.7 GB"}}) {
    state_["hardware"]["memory"] = {{"totalPages", c.pages}, {"pageSize", c.pageSize}};
    Apply();
    EXPECT_EQ(Tulk::FormatMemorySize(), c.text);
  }
  Fault("HykCtl::Hardware::MemoryInfoImpl::GetPageSize");
  EXPECT_EQ(Tulk::FormatMemorySize(), "N/A");
  EXPECT_TRUE(Logged("<11>Getting memory size failed: injected"));
}

TEST_F(InventoryTest, VersionStringsByIdAndInvalidIds) {
  EXPECT_EQ(Tulk::GetVersionString(1), "2.0.11-1");
  EXPECT_EQ(Tulk::GetVersionString(2), "5.10.50.00");
  EXPECT_EQ(Tulk::GetVersionString(3), "2.14.1 (2.14) 09/30/2025");
  EXPECT_EQ(Tulk::GetVersionString(4), "Brimlo Tavi 8.1.0 build-24519031");
  EXPECT_TRUE(HostTest::LogLines().empty());

  for (int id : {0, 5}) {
    HostTest::ClearLog();
    EXPECT_EQ(Tulk::GetVersionString(id), "N/A");
    EXPECT_EQ(HostTest::LogLines(),
              Lines{"<11>Invalid version id: " + std::to_string(id) + " requested"});
  }
}

TEST_F(InventoryTest, VersionFailuresNameTheirSource) {
  state_["storage"]["adapters"].erase(0);
  Apply();
  EXPECT_EQ(Tulk::GetVersionString(1), "N/A");
  EXPECT_TRUE(Logged("<11>Get hyhba0 version string failed, err=Storage adapter hyhba0 not found"));

  state_["hardware"]["firmware"]["bmc"] = "";
  Fault("HostMgr::HostFactory::GetHost", "host unreachable");
  EXPECT_EQ(Tulk::GetVersionString(3), "N/A");
  EXPECT_TRUE(Logged("<11>Get BIOS version string failed, err=host unreachable"));
  state_["faults"] = json::object();
  Apply();
  EXPECT_EQ(Tulk::GetVersionString(2), "N/A");  // empty value
}

TEST_F(InventoryTest, RendererValuesComeFromTheHost) {
  Tulk::RegisterHostValueProviders();
  struct Case {
    const char* key;
    const char* value;
  };
  const Case cases[] = {
      {"ip", "10.20.30.41"},         {"hostname", "tavi-01.lab.example.net"},
      {"tavproduct", "Brimlo Tavi"}, {"tavversion", "8.1.0"},
      {"memory", "64 GB"},           {"servicetag", "7F3Q91A"},
      {"assettag", "IT-004217"},     {"BIOSversion", "2.14.1 (2.14) 09/30/2025"},
      {"BMCversion", "5.10.50.00"},  {"CPLDversion", "1.0.9"},
      {"PLSAversion", "3.2.0"},
  };
  for (const Case& c : cases) {
    const Tulk::ValueProvider* provider = Tulk::FindValueProvider(c.key);
    ASSERT_NE(provider, nullptr) << c.key;
    EXPECT_EQ((*provider)(), c.value) << c.key;
  }

  std::string line = "kept";
  ASSERT_TRUE(Tulk::GetVersionLineSource()(line));
  EXPECT_EQ(line, "Brimlo Tavi 8.1.0 (HyKernel Releasebuild-24519031 Build 24519031)");

  Fault("HSI_Get");
  line = "kept";
  EXPECT_FALSE(Tulk::GetVersionLineSource()(line));
  EXPECT_EQ(line, "kept");
  EXPECT_EQ((*Tulk::FindValueProvider("tavproduct"))(), "N/A");
  state_["hardware"]["assetTag"] = "";
  Fault("HykCtl::Hardware::HardwareInfoImpl::GetServiceTag");
  EXPECT_EQ((*Tulk::FindValueProvider("servicetag"))(), "N/A");
  EXPECT_EQ((*Tulk::FindValueProvider("assettag"))(), "N/A");
}

}  // namespace
