// The inventory queries on the simulated demo host and on edge hosts made
// from it, with fault injection reaching each query's failure line.

#include <gtest/gtest.h>

#include <functional>
#include <string>
#include <vector>

#include "HostTestRoot.h"
#include "host/HardwareInventory.h"
#include "host/HostValueProviders.h"
#include "host/ManagementNetwork.h"
#include "host/NetworkInventory.h"
#include "render/HostValues.h"

namespace {

using HostTest::Logged;
using Lines = std::vector<std::string>;
using nlohmann::json;

const json kDistributedSwitch = {
    {"name", "dvs-lab"}, {"type", "distributed"}, {"numPorts", 512}, {"uplinks", {"hynic3"}}};

template <typename Row>
std::vector<Row> Query(bool (*query)(std::vector<Row>&), bool expected = true) {
  std::vector<Row> rows;
  EXPECT_EQ(query(rows), expected);
  return rows;
}

class InventoryTest : public HostTest::HostStateTest {
 protected:
  void Fault(const std::string& operation, const std::string& message = "injected") {
    state_["faults"][operation] = message;
    Apply();
  }
  json& ManagementNic() { return Network()["hykernelNics"][0]; }
};

TEST_F(InventoryTest, KernelNicColumnsFollowTheAttachment) {
  Network()["switches"].push_back(kDistributedSwitch);
  struct Case {
    json connection;
    const char* portset;
    const char* portgroup;
  };
  for (const Case& c :
       {Case{ManagementNic()["connection"], "vSwitch0", "Management Network"},
        Case{{{"type", "dvsPort"}, {"switch", "dvs-lab"}, {"portId", "12"}}, "dvs-lab", "N/A"},
        Case{{{"type", "opaqueNetwork"}, {"name", "overlay-7"}}, "overlay-7", "N/A"},
        Case{nullptr, "N/A", "N/A"}}) {
    ManagementNic()["connection"] = c.connection;
    Apply();
    std::vector<Tulk::HykNicInfo> nics = Query(Tulk::GetKernelNicList);
    ASSERT_EQ(nics.size(), 1u);
    EXPECT_EQ((Lines{nics[0].Name(), nics[0].Mac(), nics[0].Portset(), nics[0].Portgroup()}),
              (Lines{"hyk0", "02:6b:4e:10:20:01", c.portset, c.portgroup}));
  }

  Network()["hykernelNics"] = json::array();
  Network().erase("managementInterface");
  Apply();
  EXPECT_TRUE(Query(Tulk::GetKernelNicList).empty());
}

TEST_F(InventoryTest, PortGroupsCarryClientsAndVlan) {
  Network()["portGroups"][1]["vlanId"] = 42;
  Apply();
  Lines rows;
  for (const Tulk::PortGroupInfo& group : Query(Tulk::GetPortGroupList)) {
    rows.push_back(group.Name() + "|" + group.VirtualSwitch() + "|" + group.ActiveClients() + "|" +
                   group.VlanId());
  }
  EXPECT_EQ(rows, (Lines{"Management Network|vSwitch0|1|0", "VM Network|vSwitch1|1|42"}));
}

TEST_F(InventoryTest, SwitchScanListsStandardThenDistributed) {
  Network()["switches"].push_back(kDistributedSwitch);
  Network()["switches"].push_back({{"name", "vSwitch2"}, {"type", "standard"}, {"numPorts", 64}});
  Apply();
  std::vector<Tulk::SwitchSummary> switches = Query(Tulk::ScanVirtualSwitches);
  Lines names;
  for (const Tulk::SwitchSummary& summary : switches) {
    names.push_back(summary.name);
  }
  EXPECT_EQ(names, (Lines{"vSwitch0", "vSwitch1", "vSwitch2", "dvs-lab"}));
  EXPECT_EQ(Tulk::FormatSwitchSummary(switches[0]),
            "Number of ports: 128\nUsed ports: 3\nConfigured ports: 128\n"
            "Uplinks: hynic0,hynic1\nPort groups: Management Network");
  EXPECT_NE(Tulk::FormatSwitchSummary(switches[2]).find("Uplinks: None"), std::string::npos);
  EXPECT_EQ(Query(Tulk::GetStandardSwitchList).size(), 3u);
}

TEST_F(InventoryTest, PhysicalNicsWithLabelLinkAndSwitch) {
  Network()["pnics"][2]["pci"]["description"] = "";
  Apply();
  std::vector<Tulk::PnicRow> rows;
  ASSERT_TRUE(
      Tulk::GetPhysicalNicList(rows, Tulk::BuildPnicUsage(Query(Tulk::ScanVirtualSwitches))));
  Lines text;
  for (const Tulk::PnicRow& row : rows) {
    text.push_back(row.name + "|" + row.hardwareLabel + "|" + row.mac + "|" + row.linkState + "|" +
                   row.switchName);
  }
  EXPECT_EQ(text, (Lines{"hynic0|Kestrel Networks KN-X540 10GbE SFP+ Adapter|02:6b:4e:10:20:01|"
                         "Connected|vSwitch0",
                         "hynic1|Kestrel Networks KN-X540 10GbE SFP+ Adapter|02:6b:4e:10:20:02|"
                         "Connected|vSwitch0",
                         "hynic2|N/A|02:6b:4e:10:30:01|Disconnected|vSwitch1",
                         "hynic3|Kestrel Networks KN-I350 Gigabit Network Connection|"
                         "02:6b:4e:10:30:02|Disconnected|"}));
}

TEST_F(InventoryTest, EachQueryLogsItsOwnFailureLine) {
  std::vector<Tulk::PnicRow> pnics;
  auto pnicQuery = [&pnics] { EXPECT_FALSE(Tulk::GetPhysicalNicList(pnics, {})); };
  auto rows = [](auto query) { return [query] { Query(query, false); }; };
  const std::string prefix = "HykCtl::Network::";
  struct Case {
    std::string operation;
    std::function<void()> query;
    std::string line;
  };
  const Case cases[] = {
      {prefix + "HykernelNicInfoImpl::GetHykernelNics", rows(Tulk::GetKernelNicList),
       "Gathering Hykernel NIC list failed"},
      {prefix + "NetworkInfoImpl::GetAllPortGroups", rows(Tulk::GetPortGroupList),
       "Getting physical nics failed"},
      {prefix + "NetworkInfoImpl::GetPnics", pnicQuery, "Getting physical nics failed"},
      {prefix + "PnicImpl::GetPciDevice", pnicQuery, "Getting physical nics failed"},
      {prefix + "VirtualSwitchInfoImpl::GetVirtualSwitches", rows(Tulk::ScanVirtualSwitches),
       "Scanning virtual switches failed"},
      {prefix + "VirtualSwitchInfoImpl::GetDVSwitches", rows(Tulk::ScanVirtualSwitches),
       "Scanning dvswitches failed"},
      {prefix + "VirtualSwitchInfoImpl::GetVirtualSwitches", rows(Tulk::GetStandardSwitchList),
       "Gathering standard virtual switch list failed"},
  };
  for (const Case& c : cases) {
    SetUp();
    Fault(c.operation);
    c.query();
    EXPECT_EQ(HostTest::LogLines(), Lines{"<11>" + c.line + ": injected"}) << c.operation;
  }
  // Rows gathered before the failure stay.
  SetUp();
  Fault(prefix + "VirtualSwitchInfoImpl::GetDVSwitches");
  std::vector<Tulk::SwitchSummary> switches;
  EXPECT_FALSE(Tulk::ScanVirtualSwitches(switches));
  EXPECT_EQ(switches.size(), 2u);
}

TEST_F(InventoryTest, ManagementNetworkAndHostName) {
  EXPECT_EQ(Tulk::GetManagementIpv4Address(), "10.20.30.41");
  EXPECT_EQ(Tulk::GetHostFqdn(), "tavi-01.lab.example.net");
  EXPECT_FALSE(Tulk::IsManagementOnDistributedSwitch());

  ManagementNic()["connection"] = {{"type", "dvsPort"}, {"switch", "dvs-lab"}, {"portId", "7"}};
  Network()["switches"].push_back(kDistributedSwitch);
  Network()["dns"]["domain"] = "";
  Apply();
  EXPECT_TRUE(Tulk::IsManagementOnDistributedSwitch());
  EXPECT_EQ(Tulk::GetHostFqdn(), "tavi-01.");
  EXPECT_TRUE(HostTest::LogLines().empty());

  Network().erase("managementInterface");
  Apply();
  EXPECT_EQ(Tulk::GetManagementInterface(), nullptr);
  EXPECT_EQ(Tulk::GetManagementIpv4Address(), "0.0.0.0");
  EXPECT_FALSE(Tulk::IsManagementOnDistributedSwitch());
  EXPECT_EQ(HostTest::LogLines(), Lines{"<11>Could not locate the management interface"});

  Fault("HykCtl::Network::NetworkInfoImpl::GetManagementInterface");
  EXPECT_EQ(Tulk::GetManagementIpv4Address(), "0.0.0.0");
  EXPECT_TRUE(Logged("<11>Getting management interface failed: injected"));
}

TEST_F(InventoryTest, MemorySizeFromPagesAndPageSize) {
  for (auto [pages, pageSize, text] : {std::tuple{16777216, 4096, "64 GB"},
                                       {262144, 4096, "1 GB"},
                                       {1073741825, 1, "1.2 GB"},
                                       {720896, 4096, "2.7 GB"}}) {
    state_["hardware"]["memory"] = {{"totalPages", pages}, {"pageSize", pageSize}};
    Apply();
    EXPECT_EQ(Tulk::FormatMemorySize(), text);
  }
  Fault("HykCtl::Hardware::MemoryInfoImpl::GetPageSize");
  EXPECT_EQ(Tulk::FormatMemorySize(), "N/A");
  EXPECT_TRUE(Logged("<11>Getting memory size failed: injected"));
}

TEST_F(InventoryTest, VersionStringsByIdWithTheirFailures) {
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

  state_["storage"]["adapters"].erase(0);
  Fault("HostMgr::HostFactory::GetHost", "host unreachable");
  EXPECT_EQ(Tulk::GetVersionString(3), "N/A");
  EXPECT_TRUE(Logged("<11>Get BIOS version string failed, err=host unreachable"));
  state_["faults"] = json::object();
  Apply();
  EXPECT_EQ(Tulk::GetVersionString(1), "N/A");
  EXPECT_TRUE(Logged("<11>Get hyhba0 version string failed, err=Storage adapter hyhba0 not found"));
}

TEST_F(InventoryTest, RendererValuesComeFromTheHost) {
  Tulk::RegisterHostValueProviders();
  auto value = [](const char* key) {
    const Tulk::ValueProvider* provider = Tulk::FindValueProvider(key);
    return provider != nullptr ? (*provider)() : std::string("<none>");
  };
  Lines values;
  for (const char* key : {"ip", "hostname", "tavproduct", "tavversion", "memory", "servicetag",
                          "assettag", "BIOSversion", "BMCversion", "CPLDversion", "PLSAversion"}) {
    values.push_back(value(key));
  }
  EXPECT_EQ(values, (Lines{"10.20.30.41", "tavi-01.lab.example.net", "Brimlo Tavi", "8.1.0",
                           "64 GB", "7F3Q91A", "IT-004217", "2.14.1 (2.14) 09/30/2025",
                           "5.10.50.00", "1.0.9", "3.2.0"}));
  std::string line = "kept";
  ASSERT_TRUE(Tulk::GetVersionLineSource()(line));
  EXPECT_EQ(line, "Brimlo Tavi 8.1.0 (HyKernel 8.1.0 Build 24519031)");

  state_["hardware"]["assetTag"] = "";
  Fault("HSI_Get");
  line = "kept";
  EXPECT_FALSE(Tulk::GetVersionLineSource()(line));
  EXPECT_EQ(line, "kept");
  EXPECT_EQ(value("tavproduct"), "N/A");
  EXPECT_EQ(value("assettag"), "N/A");
}

}  // namespace
