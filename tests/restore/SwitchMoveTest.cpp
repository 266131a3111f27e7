// The move of the management network from its distributed switch onto a
// new standard switch, on the simulated host: names, order, what is taken
// out of service, and what a failure leaves.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "HostTestRoot.h"
#include "host/StandardSwitchMove.h"
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

class SwitchMoveTest : public ::testing::Test {
 protected:
  void SetUp() override {
    HostTest::ClearLog();
    state_ = Sim::DistributedSwitchDemoHostState();
    json& network = state_["network"];
    // A second kernel NIC on the distributed switch, and the names the
    // move must pass over.
    network["hykernelNics"].push_back(
        {{"name", "hyk1"},
         {"mac", "02:6b:4e:10:20:09"},
         {"enabled", true},
         {"connection", {{"type", "dvsPort"}, {"switch", "DSwitch-Lab"}, {"portId", "13"}}}});
    network["switches"].push_back({{"name", "vSwitch0"},
                                   {"type", "standard"},
                                   {"numPorts", 128},
                                   {"uplinks", json::array()}});
    network["portGroups"].push_back(
        {{"name", "Management Network1"}, {"switch", "vSwitch0"}, {"vlanId", 0}});
  }
  json Run() {
    HostTest::WriteHostState(state_);
    moved_ = MoveManagementToNewStandardSwitch();
    return HostTest::ReadHostState()["network"];
  }
  json& Dvs() { return state_["network"]["switches"][1]; }

  json state_;
  bool moved_ = false;
};

TEST_F(SwitchMoveTest, ManagementMovesToTheFirstFreeNamesWithEveryUplinkInOrder) {
  const json network = Run();
  EXPECT_TRUE(moved_);
  const json* created = Find(network["switches"], "vSwitch2");
  ASSERT_NE(created, nullptr);
  EXPECT_EQ((*created)["uplinks"], json({"hynic0", "hynic1", "hynic3"}));
  EXPECT_EQ((*created)["teaming"]["uplinkOrder"], json({"hynic0", "hynic1", "hynic3"}));
  EXPECT_EQ((*created)["teaming"]["maxActive"], 3);
  EXPECT_EQ(Find(network["switches"], "DSwitch-Lab")->at("uplinks"), json::array());
  const json* group = Find(network["portGroups"], "Management Network2");
  ASSERT_NE(group, nullptr);
  EXPECT_EQ((*group)["switch"], "vSwitch2");

  const json& management = *Find(network["hykernelNics"], "hyk0");
  EXPECT_EQ(
      management["connection"],
      json({{"type", "portgroup"}, {"switch", "vSwitch2"}, {"portGroup", "Management Network2"}}));
  EXPECT_TRUE(management["enabled"]);
  EXPECT_FALSE(Find(network["hykernelNics"], "hyk1")->at("enabled"));
}

TEST_F(SwitchMoveTest, AFailedUplinkIsLoggedAndTheNextOneMoved) {
  Dvs()["uplinks"] = {"hynic0", "hynic9", "hynic1"};
  const json network = Run();
  EXPECT_TRUE(Logged("<11>Moving uplink hynic9 failed: Physical NIC hynic9 not found"));
  EXPECT_EQ(Find(network["switches"], "vSwitch2")->at("uplinks"), json({"hynic0", "hynic1"}));
  EXPECT_TRUE(Find(network["hykernelNics"], "hyk0")->at("enabled"));
}

TEST_F(SwitchMoveTest, AFailedTeamingUpdateIsLoggedAndTheUplinksStillMove) {
  state_["faults"]["PortsetImpl::SetTeamingPolicy"] = "teaming refused";
  const json network = Run();
  int lines = 0;
  for (const std::string& line : HostTest::LogLines()) {
    lines += line == "<11>VS: add uplink to teaming policy failed: teaming refused";
  }
  EXPECT_EQ(lines, 3);
  EXPECT_EQ(Find(network["switches"], "vSwitch2")->at("uplinks"),
            json({"hynic0", "hynic1", "hynic3"}));
}

TEST_F(SwitchMoveTest, NothingChangesWithoutADistributedManagementNetworkOrOnAFailure) {
  struct Case {
    const char* what;
    json state;
    const char* line;
  };
  json failing = state_;
  failing["faults"]["VirtualSwitchInfoImpl::AddVirtualSwitch"] = "no room";
  const Case cases[] = {
      {"on a standard switch", Sim::DemoHostState(), "<11>Could not find the management network"},
      {"no management NIC",
       [&] {
         json host = state_;
         host["network"]["managementInterface"] = "";
         return host;
       }(),
       "<11>Could not find the management network"},
      {"the switch cannot be made", failing,
       "<11>Changing to legacy virtual switch failed: no room"},
  };
  for (const Case& c : cases) {
    HostTest::ClearLog();
    state_ = c.state;
    const json before = state_["network"];
    const json after = Run();
    EXPECT_FALSE(moved_) << c.what;
    EXPECT_TRUE(Logged(c.line)) << c.what;
    EXPECT_EQ(after["switches"], before["switches"]) << c.what;
    EXPECT_EQ(after["hykernelNics"], before["hykernelNics"]) << c.what;
  }
}

}  // namespace
