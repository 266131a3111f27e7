// The switch operations of the restore options on the simulated host:
// creating switches and portgroups, migrating a kernel NIC, and repairing
// the management network's distributed-switch port.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "HostTestRoot.h"
#include "host/DvsRepair.h"
#include "host/HostCommand.h"
#include "host/SwitchCreation.h"
#include "platform/sim/DemoHost.h"

namespace {

using HostTest::Logged;
using nlohmann::json;
using namespace Tulk;

const json* Find(const json& list, const std::string& name) {
  for (const json& item : list) {
    if (item.value("name", "") == name) {
      return &item;
    }
  }
  return nullptr;
}

json Network() {
  return HostTest::ReadHostState()["network"];
}

int PingThroughManagement() {
  return RunHostCommandLine("/bin/hykping -c 3 -I hyk0 10.20.30.1");
}

class SwitchRepairTest : public ::testing::Test {
 protected:
  void SetUp() override { HostTest::ClearLog(); }
  void Use(const json& state) { HostTest::WriteHostState(state); }
};

TEST_F(SwitchRepairTest, StandardSwitchWithAndWithoutUplink) {
  Use(Sim::DemoHostState());
  ASSERT_EQ(ReadFreePhysicalNics().size(), 1u);
  EXPECT_EQ(ReadFreePhysicalNics()[0].name, "hynic3");

  EXPECT_TRUE(CreateStandardSwitch("vSwitch5", "hynic3").ok);
  const json network = Network();
  const json* created = Find(network["switches"], "vSwitch5");
  ASSERT_NE(created, nullptr);
  EXPECT_EQ((*created)["uplinks"], json({"hynic3"}));
  EXPECT_EQ((*created)["teaming"], json({{"uplinkOrder", {"hynic3"}}, {"maxActive", 1}}));
  EXPECT_TRUE(Logged("<14>Creating standard virtual switch vSwitch5 with uplink hynic3"));
  EXPECT_TRUE(ReadFreePhysicalNics().empty());

  EXPECT_TRUE(CreateStandardSwitch("vSwitch6", "").ok);
  EXPECT_EQ(Find(Network()["switches"], "vSwitch6")->at("uplinks"), json::array());
}

TEST_F(SwitchRepairTest, AFailedSwitchCreationLeavesNothingBehind) {
  Use(Sim::DemoHostState());
  const HostOutcome taken = CreateStandardSwitch("vSwitch7", "hynic0");
  EXPECT_FALSE(taken.ok);
  EXPECT_EQ(taken.error, "Physical NIC hynic0 is already an uplink of vSwitch0");
  EXPECT_EQ(Find(Network()["switches"], "vSwitch7"), nullptr);
  EXPECT_TRUE(
      Logged("<11>Creating standard virtual switch vSwitch7 failed: Physical NIC hynic0 "
             "is already an uplink of vSwitch0"));
  const HostOutcome duplicate = CreateStandardSwitch("vSwitch1", "");
  EXPECT_FALSE(duplicate.ok);
  EXPECT_NE(Find(Network()["switches"], "vSwitch1"), nullptr);
}

TEST_F(SwitchRepairTest, PortGroupsAndMigration) {
  Use(Sim::DistributedSwitchDemoHostState());
  EXPECT_TRUE(CreatePortGroup("Rescue", "vSwitch1", 4095).ok);
  const json network = Network();
  const json* group = Find(network["portGroups"], "Rescue");
  ASSERT_NE(group, nullptr);
  EXPECT_EQ((*group)["vlanId"], 4095);
  EXPECT_FALSE(CreatePortGroup("Rescue", "vSwitch1", 0).ok);
  EXPECT_FALSE(CreatePortGroup("Elsewhere", "DSwitch-Lab", 0).ok);

  EXPECT_EQ(ReadManagementInterfaceName(), "hyk0");
  EXPECT_TRUE(MigrateKernelNic("hyk0", "Rescue").ok);
  EXPECT_EQ(Find(Network()["hykernelNics"], "hyk0")->at("connection"),
            json({{"type", "portgroup"}, {"switch", "vSwitch1"}, {"portGroup", "Rescue"}}));
  EXPECT_TRUE(Logged("<14>Migrating hyk0 to portgroup Rescue"));
  EXPECT_FALSE(MigrateKernelNic("hyk9", "Rescue").ok);
  EXPECT_TRUE(Logged("<11>Migrating hyk9 to portgroup Rescue failed: Hykernel NIC hyk9 not found"));
}

TEST_F(SwitchRepairTest, TheRepairedPortCarriesTheManagementNetwork) {
  json host = Sim::DistributedSwitchDemoHostState();
  Use(host);
  const std::optional<ManagementDvsPort> port = ReadManagementDvsPort();
  ASSERT_TRUE(port);
  EXPECT_EQ(port->switchName, "DSwitch-Lab");
  EXPECT_EQ(port->portId, "12");
  EXPECT_EQ(port->vlanId, 30);
  EXPECT_EQ(port->portUplinks, std::vector<std::string>({"hynic3"}));
  EXPECT_EQ(port->switchUplinks, std::vector<std::string>({"hynic0", "hynic1", "hynic3"}));
  EXPECT_FALSE(port->thirdParty);
  EXPECT_EQ(PingThroughManagement(), 1);

  ASSERT_TRUE(RepairManagementDvsPort({20, {"hynic0", "hynic1"}, false}).ok);
  const json network = Network();
  const json& dvs = *Find(network["switches"], "DSwitch-Lab");
  ASSERT_EQ(dvs["ports"].size(), 3u);
  EXPECT_EQ(dvs["ports"][2], json({{"id", "14"},
                                   {"vlanId", 20},
                                   {"uplinks", {"hynic0", "hynic1"}},
                                   {"blocked", false},
                                   {"hostLocal", true}}));
  EXPECT_EQ(Find(network["hykernelNics"], "hyk0")->at("connection")["portId"], "14");
  EXPECT_TRUE(
      Logged("<14>Restoring DVS DSwitch-Lab: new host local port 14 for hyk0 (VLAN 20, "
             "uplinks hynic0,hynic1)"));
  EXPECT_EQ(PingThroughManagement(), 0);
}

TEST_F(SwitchRepairTest, BlockedSettingAndRefusals) {
  struct Case {
    const char* what;
    bool oldBlocked;
    bool unblock;
    bool thirdParty;
    std::vector<std::string> uplinks;
    bool ok;
    bool newBlocked;
  };
  const Case cases[] = {
      {"blocked stays blocked", true, false, false, {"hynic0"}, true, true},
      {"the default setting unblocks", true, true, false, {"hynic0"}, true, false},
      {"another vendor's switch", false, false, true, {"hynic0"}, false, false},
      {"an uplink of another switch", false, false, false, {"hynic2"}, false, false},
  };
  for (const Case& c : cases) {
    json host = Sim::DistributedSwitchDemoHostState();
    host["network"]["switches"][1]["ports"][0]["blocked"] = c.oldBlocked;
    host["network"]["switches"][1]["thirdParty"] = c.thirdParty;
    Use(host);
    HostTest::ClearLog();
    const HostOutcome outcome = RepairManagementDvsPort({0, c.uplinks, c.unblock});
    EXPECT_EQ(outcome.ok, c.ok) << c.what;
    const json network = Network();
    const json ports = Find(network["switches"], "DSwitch-Lab")->at("ports");
    if (c.ok) {
      EXPECT_EQ(ports.back()["blocked"], c.newBlocked) << c.what;
    } else {
      EXPECT_EQ(ports.size(), 2u) << c.what;
      EXPECT_TRUE(Logged("<11>Restoring DVS failed: " + outcome.error)) << c.what;
    }
  }
  Use(Sim::DemoHostState());
  EXPECT_FALSE(ReadManagementDvsPort());
  EXPECT_TRUE(Logged("<11>The management interface is not on a distributed switch"));
}

}  // namespace
