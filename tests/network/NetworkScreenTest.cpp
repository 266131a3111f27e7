// The management network window driven through the real console: a change
// of every entry applied and seen again, the ways of leaving, the restart
// an IPv6 change needs, and the hosts the window cannot serve in full.

#include <gtest/gtest.h>

#include <algorithm>

#include "NetworkTestSupport.h"
#include "ScreenTestSupport.h"
#include "include/ColorNumbers.h"

namespace {

using namespace TulkTest;
using Json = nlohmann::json;

::testing::AssertionResult PaneShows(TestConsole& console, const std::string& row) {
  return console.WaitUntil(
      [&] {
        const std::vector<std::string> rows = RightPane(console);
        return std::find(rows.begin(), rows.end(), row) != rows.end();
      },
      "pane row " + row);
}

// Edits every entry the way an operator would.
void ChangeEverything(TestConsole& console) {
  ASSERT_TRUE(OpenDialog(console, "Network Adapters", "Select the adapters"));
  console.Key("Down", 2);  // hynic2, an uplink of vSwitch1
  console.Key("Space");
  ASSERT_TRUE(Settled(console, "[X] hynic2"));
  console.Key("Enter");
  ASSERT_TRUE(Settled(console, "Remove these adapters from their current connections?"));
  ASSERT_TRUE(CloseDialog(console, "Enter", "Select the adapters"));

  ASSERT_TRUE(OpenDialog(console, "VLAN (optional)", "VLAN ID (1-4094"));
  console.Type("20");
  ASSERT_TRUE(CloseDialog(console, "Enter", "VLAN ID (1-4094"));

  ASSERT_TRUE(OpenDialog(console, "IPv4 Configuration", "Set static IPv4"));
  console.Key("Down", 3);
  console.Type("10.20.30.50");
  console.Key("Down");
  console.Type("255.255.0.0");
  console.Key("Down");
  console.Type("10.20.30.254");
  ASSERT_TRUE(CloseDialog(console, "Enter", "Set static IPv4"));

  ASSERT_TRUE(OpenDialog(console, "IPv6 Configuration", "Use DHCPv6"));
  console.Key("Down", 3);
  console.Key("Space");
  ASSERT_TRUE(Settled(console, "(o) Set static IPv6"));
  console.Key("Down");
  console.Type("2001:db8::50/64");
  console.Key("Down", 3);
  console.Type("2001:db8::1");
  ASSERT_TRUE(CloseDialog(console, "Enter", "Use DHCPv6"));

  ASSERT_TRUE(OpenDialog(console, "DNS Configuration", "Use the following DNS"));
  console.Key("Down", 2);
  console.Type("10.20.30.9");
  console.Key("Down");
  console.Type("2001:db8::53");
  console.Key("Down");
  console.Type("tavi-02");
  ASSERT_TRUE(CloseDialog(console, "Enter", "Use the following DNS"));

  ASSERT_TRUE(OpenDialog(console, "Custom DNS Suffixes", "Suffixes:"));
  console.Type("a.example, b.example  c.example");
  ASSERT_TRUE(CloseDialog(console, "Enter", "Suffixes:"));
}

TEST(NetworkWindowScreenTest, EveryEntryChangedAppliedAndSeenAgain) {
  TestConsole console(ConsoleOptions());
  ASSERT_TRUE(OpenWindow(console));
  ChangeEverything(console);
  ASSERT_TRUE(ApplyChanges(console));

  const Json network = HostState(console)["network"];
  EXPECT_EQ(network["switches"][0]["uplinks"], Json({"hynic0", "hynic1", "hynic2"}));
  EXPECT_EQ(network["portGroups"][0]["vlanId"], 20);
  EXPECT_EQ(network["hykernelNics"][0]["ipv4"]["address"], "10.20.30.50");
  EXPECT_EQ(network["routing"]["ipv6Gateway"], "2001:db8::1");
  EXPECT_EQ(network["dns"]["hostname"], "tavi-02");
  EXPECT_EQ(network["dns"]["nameServers"], Json({"10.20.30.9", "2001:db8::53"}));
  EXPECT_EQ(network["dns"]["searchDomains"],
            Json({"lab.example.net", "a.example", "b.example", "c.example"}));

  // The menu's own description (the menu is back at its first entry) and,
  // after logging out, the welcome screen show the new address.
  ASSERT_TRUE(SelectEntry(console, "Configure Management Network"));
  EXPECT_TRUE(console.WaitForText("10.20.30.50"));
  console.Key("Esc");
  EXPECT_TRUE(Settled(console, "https://10.20.30.50/ (STATIC)"));
  EXPECT_TRUE(console.WaitForText("https://tavi-02/"));

  // A fresh entry reads the host again.
  ASSERT_TRUE(OpenWindow(console));
  const std::pair<const char*, const char*> shown[] = {
      {"Network Adapters", "hynic2 (Kestrel Networks KN-I350"},
      {"VLAN (optional)", "20"},
      {"IPv4 Configuration", "IPv4 Address: 10.20.30.50"},
      {"IPv6 Configuration", "2001:db8::50/64"},
      {"DNS Configuration", "2001:db8::53"},
      {"Custom DNS Suffixes", "lab.example.net, a.example,"},
  };
  for (const auto& [entry, row] : shown) {
    ASSERT_TRUE(SelectEntry(console, entry));
    EXPECT_TRUE(PaneShows(console, row)) << entry;
  }
}

TEST(NetworkWindowScreenTest, LeavingAsksOnlyAfterARealChange) {
  Json host = DemoHostState();
  Json& nic = host["network"]["hykernelNics"][0];
  nic["ipv4"]["mode"] = "dhcp";
  nic["dhcpLease"] = {{"bound", true},
                      {"address", "10.20.30.141"},
                      {"netmask", "255.255.255.0"},
                      {"gateway", "10.20.30.1"}};
  TestConsole console(ConsoleOptions(host));
  ASSERT_TRUE(OpenWindow(console));

  // The IPv4 dialog of a DHCP host confirmed without an edit: no question.
  ASSERT_TRUE(OpenDialog(console, "IPv4 Configuration", "Set static IPv4"));
  ASSERT_TRUE(CloseDialog(console, "Enter", "Set static IPv4"));
  console.Key("Esc");
  ASSERT_TRUE(Settled(console, "System Customization"));
  EXPECT_FALSE(console.Contains("Configure Management Network: Confirm"));

  // Esc in the question keeps the edits; N drops them.
  ASSERT_TRUE(SelectEntry(console, "Configure Management Network"));
  console.Key("Enter");
  ASSERT_TRUE(Settled(console, "Custom DNS Suffixes"));
  ASSERT_TRUE(OpenDialog(console, "VLAN (optional)", "VLAN ID (1-4094"));
  console.Type("30");
  ASSERT_TRUE(CloseDialog(console, "Enter", "VLAN ID (1-4094"));
  console.Key("Esc");
  ASSERT_TRUE(Settled(console, "Apply changes and restart management network?"));
  console.Key("Esc");
  ASSERT_TRUE(Gone(console, "Apply changes and restart management network?"));
  EXPECT_TRUE(PaneShows(console, "30"));
  console.Key("Esc");
  ASSERT_TRUE(Settled(console, "Apply changes and restart management network?"));
  console.Type("n");
  ASSERT_TRUE(Settled(console, "System Customization"));
  EXPECT_EQ(HostState(console)["network"]["portGroups"][0]["vlanId"], 0);
  EXPECT_FALSE(Logged(console, "Network settings changed."));
}

// Switches IPv6 off in the dialog and applies; returns at the restart
// question.
void SwitchIpv6OffAndApply(TestConsole& console) {
  ASSERT_TRUE(OpenWindow(console));
  ASSERT_TRUE(OpenDialog(console, "IPv6 Configuration", "Use DHCPv6"));
  console.Key("Space");
  ASSERT_TRUE(Settled(console, "[X] Disable IPv6"));
  ASSERT_TRUE(CloseDialog(console, "Enter", "Use DHCPv6"));
  EXPECT_TRUE(PaneShows(console, "IPv6 is disabled."));
  console.Key("Esc");
  ASSERT_TRUE(Settled(console, "Apply changes and reboot host?"));
  console.Type("y");
  ASSERT_TRUE(Settled(console, "Disable IPv6: Restart Required"));
  EXPECT_TRUE(console.Contains("This host must be restarted before IPv6 will be disabled."));
  EXPECT_TRUE(Logged(console, "Network settings changed."));
}

TEST(NetworkWindowScreenTest, Ipv6ChangeRestartsLaterOrNow) {
  {
    TestConsole console(ConsoleOptions());
    SwitchIpv6OffAndApply(console);
    console.Key("Esc");  // later
    ASSERT_TRUE(Settled(console, "System Customization"));
    const Json host = HostState(console);
    EXPECT_EQ(host["network"]["ipv6EnabledNextBoot"], false);
    EXPECT_EQ(host["network"]["ipv6Enabled"], true);
    EXPECT_EQ(host["power"], "on");
  }
  TestConsole console(ConsoleOptions());
  SwitchIpv6OffAndApply(console);
  console.Key("F11");
  ASSERT_TRUE(Settled(console, "Restart in progress..."));
  ASSERT_TRUE(
      console.WaitUntil([&] { return HostState(console)["power"] == "rebooting"; }, "the reboot"));
  EXPECT_EQ(HostState(console)["network"]["ipv6Enabled"], false);
  // The agent refresh ran before the reboot started.
  const std::vector<std::string> commands = CommandLines(console);
  const auto refresh =
      std::find(commands.begin(), commands.end(), "osk-cmd -U root internalsvc/refresh");
  const auto reboot = std::find(commands.begin(), commands.end(), "reboot");
  EXPECT_NE(reboot, commands.end());
  EXPECT_LT(refresh, reboot);
}

TEST(NetworkWindowScreenTest, AFailedIpv6StepIsShownAndTheRestGoesOn) {
  Json host = DemoHostState();
  host["faults"]["NetworkInfoImpl::SetHykIpv6Enabled"] = "IPv6 module busy";
  TestConsole console(ConsoleOptions(host));
  ASSERT_TRUE(OpenWindow(console));
  ASSERT_TRUE(OpenDialog(console, "IPv6 Configuration", "Use DHCPv6"));
  console.Key("Space");
  ASSERT_TRUE(Settled(console, "[X] Disable IPv6"));
  ASSERT_TRUE(CloseDialog(console, "Enter", "Use DHCPv6"));
  console.Key("Esc");
  ASSERT_TRUE(Settled(console, "Apply changes and reboot host?"));
  console.Type("y");
  ASSERT_TRUE(Settled(console, "Enable Management Network: Error"));
  EXPECT_TRUE(console.Contains("Setting ipv6 configuration failed: IPv6 module busy"));
  console.Key("Enter");
  // No restart is offered for a flag that did not change.
  ASSERT_TRUE(Settled(console, "System Customization"));
  EXPECT_TRUE(Logged(console, "Setting suffixes to lab.example.net, example.net"));
  EXPECT_TRUE(Logged(console, "Network settings changed."));
}

TEST(NetworkWindowScreenTest, DistributedSwitchGreysAdaptersAndVlan) {
  Json host = DemoHostState();
  host["network"]["switches"].push_back(
      {{"name", "dvs-lab"}, {"type", "distributed"}, {"uplinks", {"hynic3"}}});
  host["network"]["hykernelNics"][0]["connection"] = {
      {"type", "dvsPort"}, {"switch", "dvs-lab"}, {"portId", "17"}};
  TestConsole console(ConsoleOptions(host));
  ASSERT_TRUE(OpenWindow(console));
  EXPECT_EQ(RightTitle(console), "IPv4 Configuration");
  EXPECT_EQ(console.At(4, 4).fg, Tulk::kDarkGrey);  // "Network Adapters"
  EXPECT_EQ(console.At(5, 4).fg, Tulk::kDarkGrey);  // "VLAN (optional)"
  console.Key("Up");
  console.WaitReady();
  EXPECT_EQ(RightTitle(console), "IPv4 Configuration");
  console.Key("Esc");
  EXPECT_TRUE(Settled(console, "System Customization"));
}

TEST(NetworkWindowScreenTest, ManagementInterfaceGoneBeforeEntry) {
  TestConsole console(ConsoleOptions());
  ASSERT_TRUE(OpenMenuEntry(console, "Configure Management Network"));
  Json host = HostState(console);
  host["network"]["managementInterface"] = "";
  ReplaceHostState(console, host);
  console.Key("Enter");
  ASSERT_TRUE(Settled(console, "Enable Management Network: Error"));
  EXPECT_TRUE(console.Contains("Management network interface cannot be found."));
  EXPECT_TRUE(Logged(console, "Could not get a suitable management interface"));
  console.Key("Enter");
  ASSERT_TRUE(Settled(console, "System Customization"));
  EXPECT_FALSE(console.Contains("Custom DNS Suffixes"));
}

}  // namespace
