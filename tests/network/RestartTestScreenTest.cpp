// "Restart Management Network" and "Test Management Network" driven in a
// pseudo-terminal on the simulated host: what only F11 starts, what the
// reports say, which commands run, and that the hosts file survives the
// name check, also when the console is killed in the middle of it.

#include <gtest/gtest.h>
#include <signal.h>

#include <algorithm>
#include <filesystem>

#include "ScreenTestSupport.h"

namespace {

using namespace TulkTest;
using Json = nlohmann::json;
using namespace std::chrono_literals;

bool Has(const std::vector<std::string>& lines, const std::string& line) {
  return std::find(lines.begin(), lines.end(), line) != lines.end();
}

// Waits until the report line holding `line` ends with its verdict.
::testing::AssertionResult WaitForVerdict(TestConsole& console, const std::string& line) {
  return console.WaitUntil(
      [&] {
        const int row = RowOf(console, line);
        return row >= 0 && (console.Row(row).find("OK.") != std::string::npos ||
                            console.Row(row).find("Failed.") != std::string::npos);
      },
      "the verdict of " + line, 10s);
}

Json Ipv6(const std::string& address, int type = 0, int scope = 3) {
  return {{"address", address}, {"prefix", 64}, {"type", type}, {"scope", scope}};
}

TEST(RestartNetworkScreenTest, OnlyF11RestartsAndTheReportListsTheAddresses) {
  const Json linkLocal = Ipv6("fe80::6b:4eff:fe10:2001", 1, 1);
  struct Case {
    const char* what;
    bool dhcp;
    Json networks;
    std::vector<std::string> shown;
    std::vector<std::string> hidden;
  };
  const Case cases[] = {
      {"DHCP", true, Json::array({linkLocal, Ipv6("2001:db8::1")}), {}, {"IP address is"}},
      {"three static addresses",
       false,
       Json::array({linkLocal, Ipv6("2001:db8::1"), Ipv6("2001:db8::2"), Ipv6("2001:db8::3")}),
       {"   IP address is 10.20.30.41", "   IP address is 2001:db8::1",
        "   IP address is 2001:db8::2", "   IP address is 2001:db8::3"},
       {"..."}},
      {"four static addresses",
       false,
       Json::array(
           {Ipv6("2001:db8::1"), Ipv6("2001:db8::2"), Ipv6("2001:db8::3"), Ipv6("2001:db8::4")}),
       {"   IP address is 10.20.30.41", "   IP address is 2001:db8::2", "   ..."},
       {"2001:db8::3", "2001:db8::4"}},
  };
  const auto hostOf = [](const Case& c) {
    Json host = DemoHostState();
    Json& nic = host["network"]["hykernelNics"][0];
    nic["ipv6"]["networks"] = c.networks;
    if (c.dhcp) {
      nic["ipv4"] = {{"mode", "dhcp"}};
    }
    return host;
  };
  // One console: each case replaces the host and opens the dialog again.
  TestConsole console(DriverOptions(hostOf(cases[0]), "restart"));
  int restarts = 0;
  for (const Case& c : cases) {
    SCOPED_TRACE(c.what);
    if (restarts > 0) {
      ASSERT_TRUE(Gone(console, "Restart Management Network"));
      ReplaceHostState(console, hostOf(c));
      console.Type("o");
    }
    ASSERT_TRUE(Settled(console, "Restart management network now?"));
    EXPECT_TRUE(console.Contains("Restart Management Network: Confirm"));
    console.Key("Enter");
    console.Key("Space");
    ASSERT_TRUE(console.WaitReady());
    EXPECT_EQ(CountLog(console, "<14>Restarting hyk0"), restarts);
    EXPECT_TRUE(console.Contains("Restart management network now?"));

    console.Key("F11");
    ASSERT_TRUE(console.WaitForText("<Enter> OK"));
    ++restarts;
    EXPECT_TRUE(
        console.WaitUntil([&] { return CountLog(console, "<14>Restarting hyk0") == restarts; },
                          "the restart's log line"));
    const std::vector<Json> events = Events(console, "qob.user.tulk.network.restart");
    ASSERT_EQ(events.size(), static_cast<std::size_t>(restarts));
    EXPECT_EQ(events.back()["text"], "Restarting hyk0");
    EXPECT_EQ(HostState(console)["network"]["hykernelNics"][0].value("restarts", 0), 1);
    EXPECT_TRUE(console.Contains("Stopping management network. Done."));
    const std::string screen = console.Screen();
    for (const std::string& line : c.shown) {
      EXPECT_NE(screen.find(line), std::string::npos) << line << "\n" << console.Dump();
    }
    for (const std::string& text : c.hidden) {
      EXPECT_EQ(screen.find(text), std::string::npos) << text << "\n" << console.Dump();
    }
    console.Key("Esc");
    console.Key("Enter");
    ASSERT_TRUE(console.WaitForText("result: 1"));
  }
}

// The defaults come from the host; skipped inputs keep their numbers and
// every check reports.
TEST(TestNetworkScreenTest, DefaultsFromTheHostAndSkippedInputsKeepTheirNumbers) {
  TestConsole console(DriverOptions(DemoHostState(), "test"));
  ASSERT_TRUE(Settled(console, "Resolve Hostname"));
  for (const char* value : {"Ping Address #1:", "10.20.30.1", "Ping Address #2:", "10.20.30.2",
                            "Ping Address #3:", "10.20.30.3", "tavi-01.lab.example.net"}) {
    EXPECT_TRUE(console.Contains(value)) << value << "\n" << console.Dump();
  }
  console.Key("Backspace");
  console.Key("Down");
  console.Type("fe80::1");
  console.Key("Down");
  console.Type("10.20.30.99");
  console.Key("Enter");
  ASSERT_TRUE(WaitForVerdict(console, "Resolving hostname (tavi-01.lab.example.net)."));
  EXPECT_FALSE(console.Contains("#1"));
  const int linkLocal = RowOf(console, "Pinging address #2 (fe80::1%hyk0).");
  ASSERT_GE(linkLocal, 0) << console.Dump();
  EXPECT_NE(console.Row(linkLocal).find("OK."), std::string::npos);
  const int unreachable = RowOf(console, "Pinging address #3 (10.20.30.99).");
  ASSERT_GE(unreachable, 0) << console.Dump();
  EXPECT_NE(console.Row(unreachable).find("Failed."), std::string::npos);
  const int resolved = RowOf(console, "Resolving hostname (tavi-01.lab.example.net).");
  ASSERT_GE(resolved, 0) << console.Dump();
  EXPECT_NE(console.Row(resolved).find("OK."), std::string::npos);

  const std::vector<std::string> commands = CommandLines(console);
  EXPECT_TRUE(Has(commands, "hykping -c 3 -I hyk0 fe80::1%hyk0"));
  EXPECT_TRUE(Has(commands, "hykping -c 3 -I hyk0 10.20.30.99"));
  EXPECT_EQ(ReadText(console.Root() / "etc/hosts"), kHostsFile);
  EXPECT_FALSE(std::filesystem::exists(console.Root() / "etc/hosts.backup"));
  console.Key("Esc");
  console.Key("Enter");
  EXPECT_TRUE(console.WaitForText("result: 1"));
}

TEST(TestNetworkScreenTest, EscDuringAPingEndsTheTestAtOnce) {
  Json host = DemoHostState();
  host["commands"]["hykping -c 3 -I hyk0 10.20.30.1"] = {{"delayMs", 5000}};
  TestConsole console(DriverOptions(host, "test"));
  ASSERT_TRUE(Settled(console, "Resolve Hostname"));
  console.Key("Enter");
  ASSERT_TRUE(console.WaitForText("Pinging address #1 (10.20.30.1)."));
  ASSERT_TRUE(console.WaitUntil(
      [&] { return Has(CommandLines(console), "hykping -c 3 -I hyk0 10.20.30.1"); },
      "the ping to start"));
  console.Key("Esc");
  // The form's result: it was confirmed; the test itself was cut short.
  ASSERT_TRUE(console.WaitForText("result: 1"));
  EXPECT_FALSE(console.Contains("Resolving hostname"));
  // The ping is still waiting: the dialog did not wait for it.
  for (const Json& record : SimRecords(console.Root(), "commands.jsonl")) {
    EXPECT_TRUE(record["exitCode"].is_null()) << record.dump();
  }
  // The abandoned ping ends by itself (and leaves nothing running).
  EXPECT_TRUE(
      console.WaitUntil([&] { return SimRecords(console.Root(), "commands.jsonl").size() == 2; },
                        "the abandoned ping to end", 15s));
}

TEST(TestNetworkScreenTest, WithoutAManagementInterfaceThePingNamesNoInterface) {
  Json host = DemoHostState();
  host["network"]["managementInterface"] = "";
  TestConsole console(DriverOptions(host, "test"));
  ASSERT_TRUE(Settled(console, "Resolve Hostname"));
  console.Key("Enter");
  ASSERT_TRUE(WaitForVerdict(console, "Resolving hostname (tavi-01.lab.example.net)."));
  const std::vector<std::string> commands = CommandLines(console);
  EXPECT_TRUE(Has(commands, "hykping -c 3 10.20.30.1")) << ::testing::PrintToString(commands);
}

TEST(TestNetworkScreenTest, KilledDuringTheNameCheckTheNextStartRestoresTheHostsFile) {
  Json host = DemoHostState();
  host["network"]["resolverDelayMs"] = 30000;
  TestConsole first(DriverOptions(host, "test"));
  ASSERT_TRUE(Settled(first, "Resolve Hostname"));
  first.Key("Enter");
  ASSERT_TRUE(first.WaitForText("Resolving hostname", 10s));
  const std::filesystem::path backup = first.Root() / "etc/hosts.backup";
  ASSERT_TRUE(first.WaitUntil(
      [&] {
        return std::filesystem::exists(backup) &&
               ReadText(first.Root() / "etc/hosts").find("tavi-01") == std::string::npos;
      },
      "the hosts file to be edited"));
  first.Signal(SIGKILL);
  ASSERT_TRUE(first.WaitExit());
  const std::string edited = ReadText(first.Root() / "etc/hosts");
  const std::string saved = ReadText(backup);
  EXPECT_EQ(saved, kHostsFile);

  // The real console starts on a root in that state.
  TulkTest::Options options;
  options.hostState = DemoHostState().dump();
  options.prepareRoot = [&](const std::filesystem::path& root) {
    WriteRootFile(root, "/etc/hosts", edited);
    WriteRootFile(root, "/etc/hosts.backup", saved);
  };
  TestConsole next(options);
  EXPECT_TRUE(next.WaitForLog(
      "<12>Restored /etc/hosts from /etc/hosts.backup left by an interrupted network test"));
  EXPECT_EQ(ReadText(next.Root() / "etc/hosts"), kHostsFile);
  EXPECT_FALSE(std::filesystem::exists(next.Root() / "etc/hosts.backup"));
}

}  // namespace
