// "Network Restore Options" driven in a pseudo-terminal on the simulated
// host: which entries can be chosen, what the right half shows, the factory
// network restore and the move to a new standard switch.

#include <gtest/gtest.h>

#include <algorithm>
#include <functional>
#include <utility>

#include "ScreenTestSupport.h"
#include "platform/sim/DemoHost.h"

namespace {

using namespace TulkTest;
using Json = nlohmann::json;
using namespace std::chrono_literals;

constexpr int kDarkGrey = 6;

const std::vector<std::string> kRestoreLabels = {"Create Standard Switch",
                                                 "Create Port Group",
                                                 "Migrate Hykernel NIC to Standard Switch",
                                                 "Restore Network Settings",
                                                 "Restore Standard Switch",
                                                 "Restore DVS"};

// Whether the menu draws `label` (its first words, as many as the menu
// shows) in dark grey.
bool Greyed(const TestConsole& console, const std::string& label) {
  const std::string shown = label.substr(0, 24);
  const int row = RowOf(console, shown);
  if (row < 0) {
    ADD_FAILURE() << "no entry " << label << "\n" << console.Dump();
    return false;
  }
  const std::size_t column = console.Row(row).find(shown);
  return console.At(row, static_cast<int>(column)).fg == kDarkGrey;
}

TEST(RestoreMenuScreenTest, EntriesAreGreyedByTheirConditions) {
  struct Case {
    const char* what;
    std::function<Json()> host;
    std::vector<std::string> greyed;
  };
  const Case cases[] = {
      {"agent 3, standard switch",
       [] { return Sim::DemoHostState(); },
       {"Restore Standard Switch", "Restore DVS"}},
      {"no overlay agent",
       [] {
         Json host = Sim::DemoHostState();
         host["services"]["zyo-opsagent"]["installed"] = false;
         return host;
       },
       {"Migrate Hykernel NIC to Standard Switch", "Restore Standard Switch", "Restore DVS"}},
      {"agent 2",
       [] {
         Json host = Sim::DemoHostState();
         host["packages"]["zyo-opsagent"]["version"] = "2.9.4-0.1";
         return host;
       },
       {"Migrate Hykernel NIC to Standard Switch", "Restore Standard Switch", "Restore DVS"}},
  };
  // One console: each case leaves the window, replaces the host and opens
  // the window again.
  TestConsole console(DriverOptions(cases[0].host(), "network-restore"));
  bool first = true;
  for (const Case& c : cases) {
    SCOPED_TRACE(c.what);
    if (!std::exchange(first, false)) {
      console.Key("Esc");
      ASSERT_TRUE(Gone(console, "Restore DVS"));
      ReplaceHostState(console, c.host());
      console.Type("o");
    }
    ASSERT_TRUE(Settled(console, "Restore DVS"));
    for (const std::string& label : kRestoreLabels) {
      const bool expected = std::find(c.greyed.begin(), c.greyed.end(), label) != c.greyed.end();
      EXPECT_EQ(Greyed(console, label), expected) << label << "\n" << console.Dump();
    }
  }
}

// With management on a distributed switch no entry is greyed, and the
// right half follows the selection.
TEST(RestoreMenuScreenTest, RightHalfFollowsTheSelection) {
  TestConsole console(DriverOptions(Sim::DistributedSwitchDemoHostState(), "network-restore"));
  ASSERT_TRUE(Settled(console, "Restore DVS"));
  for (const std::string& label : kRestoreLabels) {
    EXPECT_FALSE(Greyed(console, label)) << label;
  }
  EXPECT_TRUE(console.WaitForLog("<14>zyo-opsagent version >= 3 detected"));
  EXPECT_EQ(RightTitle(console), "Create Standard Switch");
  // The generic footer until the first move.
  EXPECT_EQ(Squeezed(RightFooter(console)), "<Enter> Change <Esc> Exit");
  struct Step {
    const char* title;
    const char* footer;
    const char* description;
  };
  const Step steps[] = {
      {"Create Port Group", "<Enter> Create <Esc> Exit",
       "Create a new port group by name and standard virtual switch to which the port group "
       "should be added."},
      {"Migrate Hykernel NIC to Standard Switch", "<Enter> Migrate <Esc> Exit",
       "Migrate a hyknic to the standard virtual switch of a chosen portgroup."},
      {"Restore Network Settings", "<Enter> Restart <Esc> Exit",
       "Restoring the network settings will stop all the running virtual machines on the host."},
      {"Restore Standard Switch", "<Enter> Restore <Esc> Exit",
       "apart from management interface will be disabled. Try Restore DVS option to manually "
       "repair misconfigured DVS."},
      {"Restore DVS", "<Enter> Restore <Esc> Exit",
       "All other properties will be cloned from original DVS port. This operation is available "
       "only for BrimLo DVS"},
  };
  for (const Step& step : steps) {
    ASSERT_TRUE(SelectEntry(console, step.title));
    EXPECT_TRUE(console.WaitUntil([&] { return Squeezed(RightFooter(console)) == step.footer; },
                                  step.footer));
    EXPECT_TRUE(console.WaitUntil(
        [&] { return RightText(console).find(step.description) != std::string::npos; },
        step.description));
  }
  EXPECT_EQ(RightText(console).find("BrimLo DVS."), std::string::npos);
  console.Key("Esc");
  EXPECT_TRUE(console.WaitForText("result: 1"));
}

// Esc at the VM warning changes nothing but is logged and reported; on the
// next try the VMs are powered off and the network rebuilt.
TEST(FactoryRestoreScreenTest, EscAtTheVmWarningThenTheNetworkIsRebuilt) {
  const Json host = Sim::DemoHostState();
  TestConsole console(DriverOptions(host, "network-restore"));
  ASSERT_TRUE(SelectEntry(console, "Restore Network Settings"));
  console.Key("Enter");
  ASSERT_TRUE(Settled(console, "Are you sure you want to reset the host network"));
  console.Key("Enter");
  EXPECT_FALSE(console.WaitForText("Warning: VMs running on the host", 500ms));
  console.Key("F11");
  ASSERT_TRUE(Settled(console, "Warning: VMs running on the host"));
  console.Key("Esc");
  ASSERT_TRUE(console.WaitForLog("<14>Restoring factory network settings"));
  EXPECT_EQ(Events(console, "qob.user.tulk.factory.network.restored").size(), 1u);
  const Json state = HostState(console);
  EXPECT_EQ(state["network"]["switches"], host["network"]["switches"]);
  EXPECT_TRUE(state["network"]["netDumper"]["enabled"]);
  for (const std::string& command : CommandLines(console)) {
    EXPECT_EQ(command.find("powerOffVms"), std::string::npos) << command;
  }
  EXPECT_TRUE(Settled(console, "Restore Network Settings"));

  ASSERT_TRUE(SelectEntry(console, "Restore Network Settings"));
  console.Key("Enter");
  ASSERT_TRUE(Settled(console, "Are you sure you want to reset the host network"));
  console.Key("F11");
  ASSERT_TRUE(Settled(console, "Warning: VMs running on the host"));
  console.Key("Enter");
  ASSERT_TRUE(console.WaitForText("Auto-configuring network. Done."));
  EXPECT_TRUE(console.Contains("Powering Off VMs. Done."));
  EXPECT_TRUE(console.WaitForLog("<14>Clearing Network Config"));
  EXPECT_TRUE(console.WaitForLog("<14>Auto-Configuring Network"));
  const Json rebuilt = HostState(console);
  ASSERT_EQ(rebuilt["network"]["switches"].size(), 1u);
  EXPECT_EQ(rebuilt["network"]["switches"][0]["name"], "vSwitch0");
  EXPECT_FALSE(rebuilt["network"]["netDumper"]["enabled"]);
  EXPECT_EQ(rebuilt["vms"][0]["state"], "poweredOff");
  const std::vector<std::string> commands = CommandLines(console);
  EXPECT_EQ(std::count(commands.begin(), commands.end(), "powerOffVms"), 1);
  console.Key("Esc");
  console.Key("Enter");
  ASSERT_TRUE(console.WaitUntil(
      [&] { return CountLog(console, "<14>Restoring factory network settings") == 2; },
      "the second restore logged"));
  EXPECT_TRUE(Settled(console, "Restore Network Settings"));
}

TEST(FactoryRestoreScreenTest, AFailedPowerOffLeavesTheNetworkAlone) {
  Json host = Sim::DemoHostState();
  host["commands"]["powerOffVms"] = {{"exitCode", 1}};
  TestConsole console(DriverOptions(host, "network-restore"));
  ASSERT_TRUE(SelectEntry(console, "Restore Network Settings"));
  console.Key("Enter");
  ASSERT_TRUE(Settled(console, "Are you sure you want to reset the host network"));
  console.Key("F11");
  ASSERT_TRUE(Settled(console, "Warning: VMs running on the host"));
  console.Key("Enter");
  ASSERT_TRUE(console.WaitForText("Powering Off VMs. Failed."));
  EXPECT_TRUE(console.WaitForLog("<11>Powering off VMs failed"));
  const Json state = HostState(console);
  EXPECT_EQ(state["network"]["switches"], host["network"]["switches"]);
  EXPECT_FALSE(state["network"]["netDumper"]["enabled"]);
  EXPECT_FALSE(console.Contains("Auto-configuring network."));
}

TEST(SafeModeScreenTest, ManagementMovesToTheNextFreeSwitchAndTheEntryTurnsGrey) {
  Json host = Sim::DistributedSwitchDemoHostState();
  host["network"]["switches"].push_back(
      {{"name", "vSwitch0"}, {"type", "standard"}, {"numPorts", 128}});
  host["network"]["portGroups"].push_back(
      {{"name", "Management Network1"}, {"switch", "vSwitch0"}});
  TestConsole console(DriverOptions(host, "network-restore"));
  ASSERT_TRUE(SelectEntry(console, "Restore Standard Switch"));
  console.Key("Enter");
  ASSERT_TRUE(Settled(console, "Move the management network onto a standard switch?"));
  console.Key("Enter");
  EXPECT_FALSE(console.WaitForLog("Enabling safe mode", 500ms));
  console.Key("F11");
  ASSERT_TRUE(console.WaitForLog(
      "<14>Enabling safe mode networking by moving all uplinks to a new management vSwitch"));
  // The menu is read once the question has gone from over it.
  ASSERT_TRUE(Gone(console, "Move the management network onto a standard switch?"));
  ASSERT_TRUE(console.WaitUntil([&] { return RightTitle(console) == "Restore DVS"; },
                                "the cursor on Restore DVS"));
  EXPECT_TRUE(console.WaitUntil([&] { return Greyed(console, "Restore Standard Switch"); },
                                "entry 69 greyed"));
  const Json network = HostState(console)["network"];
  EXPECT_EQ(
      network["hykernelNics"][0]["connection"],
      Json({{"type", "portgroup"}, {"switch", "vSwitch2"}, {"portGroup", "Management Network2"}}));
  // Up passes over the grey entry.
  console.Key("Up");
  EXPECT_TRUE(
      console.WaitUntil([&] { return RightTitle(console) == "Restore Network Settings"; }, "Up"));
}

}  // namespace
