// The welcome screen on the real binary: the summary drawn from the
// simulated host, its layouts and warnings, and what it shows when the
// host cannot be asked.

#include <signal.h>

#include "ScreenTestSupport.h"
#include "include/ColorNumbers.h"

namespace {

using namespace TulkTest;
using nlohmann::json;

// Rows of the standard summary on 80 x 25.
constexpr int kVersionRow = 5;
constexpr int kHardwareRow = 7;
constexpr int kProcessorRow = 9;
constexpr int kMemoryRow = 10;
constexpr int kAddressRow = 13;
constexpr int kWarningRow = 21;
constexpr int kFooterRow = 23;

json& ManagementNic(json& host) {
  return host["network"]["hykernelNics"][0];
}

std::vector<json> Ipv6Networks(int count) {
  std::vector<json> networks;
  for (int i = 1; i <= count; ++i) {
    networks.push_back({{"address", "2001:db8:0:" + std::to_string(i) + "::1"},
                        {"prefix", 64},
                        {"type", 0},
                        {"scope", 3}});
  }
  return networks;
}

// The demo host in two panels; F4 toggles monochrome and other keys
// repaint; a reload whose version query fails keeps the last version line.
TEST(WelcomeScreenTest, ShowsTheDemoHostTogglesMonochromeAndReloads) {
  json host = DemoHostState();
  TulkTest::Options options = ConsoleOptions(host);
  options.keepOutput = true;
  TestConsole console(options);
  ASSERT_TRUE(Settled(console, "To manage this host, go to:"));

  EXPECT_EQ(Cells(console, kVersionRow, 8, 27), "Brimlo Tavi 8.1.0 (HyKernel");
  EXPECT_EQ(Cells(console, kHardwareRow, 8, 36), "Kestrel Computing KX2200 Rack Server");
  EXPECT_NE(console.Row(kProcessorRow).find("2 x Helix H6-4316 16-Core Processor @ 2.30GHz"),
            std::string::npos);
  EXPECT_NE(console.Row(kMemoryRow).find("64 GiB Memory"), std::string::npos);
  const std::vector<std::string> addresses = {
      "To manage this host, go to:",
      "https://tavi-01/",
      "https://10.20.30.41/ (STATIC)",
      "https://[2001:db8:20:30:6b:4eff:fe10:2001]/ (AUTOCONF)",
      "https://[2001:db8:20:30::41]/ (STATIC)",
      "https://[fe80::6b:4eff:fe10:2001]/"};
  for (std::size_t i = 0; i < addresses.size(); ++i) {
    EXPECT_EQ(
        Cells(console, kAddressRow + static_cast<int>(i), 8, static_cast<int>(addresses[i].size())),
        addresses[i]);
  }
  EXPECT_NE(console.Row(kFooterRow).find("<F2> Customize System/View Logs"), std::string::npos);
  EXPECT_NE(console.Row(kFooterRow).find("<F12> Shut Down/Restart "), std::string::npos);

  EXPECT_EQ(console.At(3, 40).bg, Tulk::kDarkGrey);
  EXPECT_EQ(console.At(kHardwareRow, 8).fg, Tulk::kWhite);
  EXPECT_EQ(console.At(18, 40).bg, Tulk::kYellow);
  EXPECT_EQ(console.At(kAddressRow, 8).fg, Tulk::kBlack);
  const int legend = static_cast<int>(console.Row(kFooterRow).find("Customize"));
  EXPECT_EQ(console.At(kFooterRow, legend).fg, Tulk::kDarkGrey);
  EXPECT_EQ(console.At(kFooterRow, 2).fg, Tulk::kBlack);
  EXPECT_EQ(console.At(0, 0).text, "┌");

  console.Key("F4");
  ASSERT_TRUE(console.WaitReady());
  EXPECT_TRUE(console.At(3, 40).reverse) << console.Dump();
  EXPECT_FALSE(console.At(18, 40).reverse);
  EXPECT_NE(console.At(18, 40).bg, Tulk::kYellow);

  console.Key("F4");
  ASSERT_TRUE(console.WaitReady());
  EXPECT_EQ(console.At(18, 40).bg, Tulk::kYellow) << console.Dump();
  EXPECT_FALSE(console.At(3, 40).reverse);

  const std::size_t before = console.BytesReceived();
  console.Type("x");
  ASSERT_TRUE(console.WaitReady());
  // A full repaint: the screen is cleared and every line drawn again.
  const std::string repaint = console.Output().substr(before);
  EXPECT_NE(repaint.find("\x1b[2J"), std::string::npos);
  EXPECT_GT(repaint.size(), 80u * 12u);
  EXPECT_TRUE(console.Contains("https://10.20.30.41/ (STATIC)"));

  host["faults"]["HSI_Get"] = "version unreadable";
  host["network"]["dns"]["hostname"] = "tavi-77";
  ReplaceHostState(console, host);
  console.Signal(SIGUSR1);
  ASSERT_TRUE(Settled(console, "https://tavi-77/"));
  EXPECT_EQ(Cells(console, kVersionRow, 8, 27), "Brimlo Tavi 8.1.0 (HyKernel");
}

// The hardware and memory lines of another host; after reloads, five IPv6
// addresses are all listed and six are cut.
TEST(WelcomeScreenTest, AnotherHostsHardwareAndIpv6Addresses) {
  json host = DemoHostState();
  host["hardware"]["vendor"] = " Acme  Inc. ";
  host["hardware"]["product"] = "Acme   Server 9";
  host["hardware"]["cpu"]["packages"] = 1;
  host["hardware"]["cpu"]["model"] = "Helix  H2";
  host["hardware"]["memory"] = {{"totalPages", 393216}, {"pageSize", 4096}};
  TestConsole console(ConsoleOptions(host));
  ASSERT_TRUE(Settled(console, "1.5 GiB Memory"));
  EXPECT_EQ(Cells(console, kHardwareRow, 8, 24), "Acme Inc. Acme Server 9 ");
  EXPECT_EQ(Cells(console, kProcessorRow, 8, 10), "Helix H2  ");

  for (int count : {5, 6}) {
    host = DemoHostState();
    host["network"]["dns"]["hostname"] = "localhost";
    ManagementNic(host)["ipv4"] = {{"mode", "none"}};
    ManagementNic(host)["ipv6"]["networks"] = Ipv6Networks(count);
    ReplaceHostState(console, host);
    console.Signal(SIGUSR1);
    ASSERT_TRUE(Settled(console, "https://[2001:db8:0:4::1]/ (STATIC)")) << count;
    ASSERT_TRUE(console.WaitUntil(
        [&] { return console.Contains("https://[2001:db8:0:5::1]/") == (count == 5); },
        "the fifth address"));
    EXPECT_EQ(Cells(console, kAddressRow + 1, 8, 30), "https://[2001:db8:0:1::1]/ (ST")
        << "no host name or IPv4 line for localhost without IPv4";
    EXPECT_EQ(console.Contains("https://[2001:db8:0:5::1]/"), count == 5) << count;
    EXPECT_EQ(Cells(console, kAddressRow + 5, 8, 3) == "...", count == 6) << count;
    EXPECT_FALSE(console.Contains("https://[2001:db8:0:6::1]/"));
  }
}

// DHCP without a lease waits and warns; the audit-mode warning replaces
// the DHCP one.
TEST(WelcomeScreenTest, DhcpAndAuditModeWarnings) {
  for (const bool audit : {false, true}) {
    SCOPED_TRACE(audit ? "audit mode" : "no lease");
    json host = DemoHostState();
    ManagementNic(host)["ipv4"] = {{"mode", "dhcp"}};
    ManagementNic(host)["dhcpLease"] = nullptr;
    host["system"]["bootOption"] = audit ? 1 : 0;
    TestConsole console(ConsoleOptions(host));
    ASSERT_TRUE(Settled(console, "https://0.0.0.0/ (Waiting for DHCP...)"));
    EXPECT_EQ(console.Contains("Warning: Host is running in audit mode."), audit);
    EXPECT_EQ(console.Contains("DHCP lookup failed"), !audit);
    if (!audit) {
      EXPECT_EQ(Cells(console, kWarningRow, 16, 28), "Warning: DHCP lookup failed.");
      EXPECT_EQ(console.At(kWarningRow, 16).fg, Tulk::kDarkGrey);
    }
  }
}

TEST(WelcomeScreenTest, NoPhysicalNicRaisesTheAlertOnce) {
  json host = DemoHostState();
  host["network"]["pnics"] = json::array();
  TestConsole console(ConsoleOptions(host));
  ASSERT_TRUE(Settled(console, "No compatible network adapter found. Please consult the"));
  EXPECT_FALSE(console.Contains("To manage this host"));
  console.Type("x");
  console.Key("F4");
  ASSERT_TRUE(console.WaitReady());
  const json alerts = ReadHostState(console.HostStatePath())["system"]["alerts"];
  EXPECT_EQ(alerts, json::array({"No compatible network adapter found."}));
}

TEST(WelcomeScreenTest, CustomMessageAndBackOnReload) {
  json host = DemoHostState();
  host["system"]["welcomeMessage"] = "Lab host of team {color:red}Blue{/color}\nCall 1234";
  TestConsole console(ConsoleOptions(host));
  ASSERT_TRUE(Settled(console, "Lab host of team Blue"));
  EXPECT_EQ(Cells(console, 2, 0, 24), "│ Lab host of team Blue ");
  EXPECT_EQ(console.At(2, 19).fg, Tulk::kRed);
  EXPECT_EQ(Cells(console, 3, 2, 9), "Call 1234");
  EXPECT_FALSE(console.Contains("Customize System"));

  host["system"]["welcomeMessage"] = "";
  host["network"]["dns"]["hostname"] = "tavi-77";
  ReplaceHostState(console, host);
  console.Signal(SIGUSR1);
  ASSERT_TRUE(Settled(console, "https://tavi-77/"));
  EXPECT_FALSE(console.Contains("Lab host"));
  EXPECT_TRUE(console.Contains("<F2> Customize System/View Logs"));
}

// Every query behind the summary fails at once: the console still comes
// up, shows what it can with its fillers, and logs each failure.
TEST(WelcomeScreenTest, FailingHostQueriesLeaveFillersOnTheScreen) {
  json host = DemoHostState();
  host["system"]["bootOption"] = 1;  // audit mode, if it could be read
  const struct {
    const char* fault;
    const char* line;
  } failures[] = {
      {"NetworkInfoImpl::GetPnics", "<11>Getting physical nics failed: F1"},
      {"NetworkInfoImpl::IsHykIpv6Enabled", "<11>Getting IPv6 state failed: F2"},
      {"HykNicImpl::GetIpConfig", "<11>Getting management IP configuration failed: F3"},
      {"DnsConfigImpl::GetHostname", "<11>Getting host name failed: F4"},
      {"HardwareInfoImpl::GetVendorName", "<11>Getting vendor name failed: F5"},
      {"HardwareInfoImpl::GetProductName", "<11>Getting product name failed: F6"},
      {"CpuInfoImpl::GetNumCpuPackages", "<11>Getting processor packages failed: F7"},
      {"CpuInfoImpl::GetModelName", "<11>Getting processor model failed: F8"},
      {"MemoryInfoImpl::GetTotalPages", "<11>Getting memory size failed: F9"},
      {"SystemInfoImpl::GetWelcomeMessage", "<11>Getting welcome message failed: F10"},
      {"HSI_Get", "<11>Getting boot option failed: F11"},
  };
  int number = 0;
  for (const auto& failure : failures) {
    host["faults"][failure.fault] = "F" + std::to_string(++number);
  }
  TestConsole console(ConsoleOptions(host));
  ASSERT_TRUE(Settled(console, "To manage this host, go to:"));
  for (const auto& failure : failures) {
    EXPECT_TRUE(console.WaitForLog(failure.line));
  }
  EXPECT_EQ(Cells(console, kHardwareRow, 8, 4), "N/A ");
  EXPECT_EQ(Cells(console, kProcessorRow, 8, 4), "N/A ");
  EXPECT_EQ(Cells(console, kMemoryRow, 8, 4), "N/A ");
  EXPECT_TRUE(console.Contains("https://0.0.0.0/ (STATIC)")) << console.Dump();
  EXPECT_FALSE(console.Contains("audit mode")) << console.Dump();
  EXPECT_TRUE(console.Contains("<F2> Customize System/View Logs"));
  for (const std::string& line : console.LogLines()) {
    EXPECT_EQ(line.find("aborted"), std::string::npos) << line;
  }
  console.Key("F2");
  EXPECT_TRUE(Settled(console, "Authentication Required"));
}

TEST(WelcomeScreenTest, LoginDisabledDialogClosesOnEnterOnly) {
  TulkTest::Options options = ConsoleOptions();
  options.prepareRoot = nullptr;  // no console-login marker
  TestConsole console(options);
  ASSERT_TRUE(Settled(console, "To manage this host"));
  for (const char* open : {"F12", "F2"}) {
    console.Key(open);
    ASSERT_TRUE(Settled(console, "Authentication Denied"));
    EXPECT_TRUE(console.Contains("Direct console access has been disabled by the"));
    EXPECT_TRUE(console.Contains("administrator for tavi-01.lab.example.net."));
    // Esc is ignored as every key but Enter is.
    for (const char* ignored : {"Esc", "F4"}) {
      console.Key(ignored);
      ASSERT_TRUE(console.WaitReady());
      EXPECT_TRUE(console.Contains("Authentication Denied")) << open << " " << ignored;
    }
    console.Key("Enter");
    ASSERT_TRUE(Gone(console, "Authentication Denied")) << open;
    EXPECT_TRUE(console.WaitForText("https://10.20.30.41/ (STATIC)"));
  }
  EXPECT_TRUE(RecordsWhere(console, "audit.jsonl", "event", "tulk.login").empty());
  EXPECT_TRUE(console.Running());
}

}  // namespace
