// The four switch dialogs of "Network Restore Options" driven in a
// pseudo-terminal: bad input is refused with its message and the dialog
// stays, good input changes the simulated host.

#include <gtest/gtest.h>

#include "ScreenTestSupport.h"
#include "platform/sim/DemoHost.h"

namespace {

using namespace TulkTest;
using Json = nlohmann::json;

const Json* Find(const Json& list, const std::string& name) {
  for (const Json& item : list) {
    if (item.value("name", "") == name) {
      return &item;
    }
  }
  return nullptr;
}

// Shows the message `text`, closes it with Enter and waits for it to go.
::testing::AssertionResult Acknowledge(TestConsole& console, const std::string& text) {
  if (auto shown = Settled(console, text); !shown) {
    return shown;
  }
  console.Key("Enter");
  return Gone(console, text);
}

TEST(RestoreDialogsScreenTest, CreateStandardSwitchThenPortGroupOnAChosenSwitch) {
  TestConsole console(DriverOptions(Sim::DemoHostState(), "network-restore"));
  {
    ASSERT_TRUE(SelectEntry(console, "Create Standard Switch"));
    console.Key("Enter");
    ASSERT_TRUE(Settled(console, "hynic3 (Disconnected)"));
    EXPECT_TRUE(console.Contains("(o) No adapter"));
    EXPECT_FALSE(console.Contains("hynic0"));
    console.Key("Enter");
    EXPECT_TRUE(console.WaitForText("Invalid Argument"));
    ASSERT_TRUE(Acknowledge(console, "Please enter a valid standard switch name."));
    console.Type("vSwitch5");
    console.Key("Down", 2);
    console.Key("Space");
    ASSERT_TRUE(console.WaitForText("(o) hynic3 (Disconnected)"));
    console.Key("Enter");
    ASSERT_TRUE(Acknowledge(console, "Successfully created standard virtual switch: vSwitch5"));
    ASSERT_TRUE(Settled(console, "Restore DVS"));
    const Json network = HostState(console)["network"];
    const Json* created = Find(network["switches"], "vSwitch5");
    ASSERT_NE(created, nullptr);
    EXPECT_EQ((*created)["uplinks"], Json({"hynic3"}));
  }
  {
    ASSERT_TRUE(SelectEntry(console, "Create Port Group"));
    console.Key("Enter");
    ASSERT_TRUE(Settled(console, "VLAN ID (1-4094, or 4095 to access all VLANs):"));
    EXPECT_TRUE(console.Contains("< vSwitch0"));
    console.Type("Rescue Net");
    console.Key("Down");
    console.Key("Right");
    ASSERT_TRUE(console.WaitForText("< vSwitch1"));
    console.Key("Down");
    console.Type("5000");
    console.Key("Enter");
    EXPECT_TRUE(console.WaitForText("Invalid VLAN ID"));
    ASSERT_TRUE(Acknowledge(console, "Please reenter a valid VLAN ID (1-4095)."));
    // The refused value stays for correction.
    EXPECT_TRUE(console.Contains("[ 5000"));
    console.Key("Backspace", 4);
    console.Type("20");
    console.Key("Enter");
    ASSERT_TRUE(Acknowledge(console, "Successfully created portgroup: Rescue Net"));
    const Json network = HostState(console)["network"];
    const Json* group = Find(network["portGroups"], "Rescue Net");
    ASSERT_NE(group, nullptr);
    EXPECT_EQ((*group)["switch"], "vSwitch1");
    EXPECT_EQ((*group)["vlanId"], 20);
  }
}

TEST(RestoreDialogsScreenTest, RestoreDvsRepairsAPortThenTheNicMigratesToAPortGroup) {
  TestConsole console(DriverOptions(Sim::DistributedSwitchDemoHostState(), "network-restore"));
  {
    ASSERT_TRUE(SelectEntry(console, "Restore DVS"));
    console.Key("Enter");
    ASSERT_TRUE(Settled(console, "DVS Uplinks: hynic3"));
    EXPECT_TRUE(console.Contains("[ ] Restore to default blocked setting (unblocked)"));
    console.Type("4095");
    console.Key("Enter");
    ASSERT_TRUE(Acknowledge(console, "Please enter a valid VLAN ID (1-4094)."));
    console.Key("Backspace", 4);
    console.Type("20");
    console.Key("Down");
    console.Key("Space");
    console.Key("Down");
    console.Key("Enter");
    ASSERT_TRUE(Settled(console, "Select the DVS Uplinks (one or more)"));
    EXPECT_TRUE(console.Contains("[X] hynic3"));
    console.Key("Down", 2);
    console.Key("Space");
    console.Key("Enter");
    ASSERT_TRUE(Settled(console, "No uplinks were selected."));
    console.Type("n");
    ASSERT_TRUE(Gone(console, "No uplinks were selected."));
    console.Key("Up", 2);
    console.Key("Space");
    console.Key("Down");
    console.Key("Space");
    console.Key("Enter");
    ASSERT_TRUE(Settled(console, "DVS Uplinks: hynic0,hynic1"));
    console.Key("Up");
    console.Key("Enter");
    ASSERT_TRUE(Acknowledge(console, "Operation Succeeded"));

    const Json network = HostState(console)["network"];
    const Json& port = Find(network["switches"], "DSwitch-Lab")->at("ports").back();
    EXPECT_EQ(port["vlanId"], 20);
    EXPECT_EQ(port["uplinks"], Json({"hynic0", "hynic1"}));
    EXPECT_FALSE(port["blocked"]);
    EXPECT_EQ(network["hykernelNics"][0]["connection"]["portId"], port["id"]);
  }
  {
    ASSERT_TRUE(SelectEntry(console, "Migrate Hykernel NIC to Standard Switch"));
    console.Key("Enter");
    ASSERT_TRUE(Settled(console, "Please choose which Hykernel NIC should be migrated"));
    EXPECT_TRUE(console.Contains("hyk0"));
    EXPECT_TRUE(console.Contains("VM Network"));
    console.Key("Down");
    console.Key("Enter");
    ASSERT_TRUE(Settled(console, "Operation Succeeded"));
    EXPECT_TRUE(console.Contains("Hykernel NIC Name: hyk0"));
    EXPECT_TRUE(console.Contains("Portgroup Name: VM Network"));
    console.Key("Enter");
    EXPECT_EQ(HostState(console)["network"]["hykernelNics"][0]["connection"],
              Json({{"type", "portgroup"}, {"switch", "vSwitch1"}, {"portGroup", "VM Network"}}));
  }
}

TEST(RestoreDialogsScreenTest, RestoreDvsRefusesAnotherVendorsSwitch) {
  Json host = Sim::DistributedSwitchDemoHostState();
  host["network"]["switches"][1]["thirdParty"] = true;
  TestConsole console(DriverOptions(host, "network-restore"));
  ASSERT_TRUE(SelectEntry(console, "Restore DVS"));
  console.Key("Enter");
  EXPECT_TRUE(console.WaitForText("Restore DVS: Error"));
  ASSERT_TRUE(Acknowledge(console, "performed on 3rd party DVS."));
  EXPECT_FALSE(console.Contains("VLAN (optional)"));
  EXPECT_EQ(HostState(console)["network"]["switches"], host["network"]["switches"]);
}

}  // namespace
