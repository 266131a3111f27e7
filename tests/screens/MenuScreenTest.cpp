// The System Customization menu through the driver: entries and their
// greying, descriptions, support pages with host fingerprints, and the
// screens of other folders opened through the registry.

#include <gtest/gtest.h>

#include <signal.h>

#include <algorithm>
#include <filesystem>
#include <fstream>

#include "ScreenTestSupport.h"

namespace {

using namespace TulkTest;
using Json = nlohmann::json;

constexpr int kDarkGrey = 6;
constexpr int kMenuTop = 4;  // screen row of the first entry

TEST(MenuScreenTest, HostStateGreysEntriesAndSelectionSkipsThem) {
  struct Case {
    const char* name;
    std::function<void(Json&)> change;
    std::vector<std::string> greyed;
    int downs;
    const char* selected;
  };
  const Case cases[] = {
      {"no management NIC",
       [](Json& h) { h["network"].erase("managementInterface"); },
       {"Configure Management Network", "Restart Management Network", "Test Management Network"},
       2,
       "Network Restore Options"},
      {"management NIC down",
       [](Json& h) { h["network"]["hykernelNics"][0]["enabled"] = false; },
       {"Configure Management Network", "Test Management Network"},
       2,
       "Network Restore Options"},
      {"lockdown impossible",
       [](Json& h) {
         h["lockdown"] = {{"enabled", false}, {"possible", false}};
       },
       {"Configure Lockdown Mode"},
       1,
       "Configure Management Network"},
      {"network boot",
       [](Json& h) { h["advancedOptions"]["PXEBootEnabled"] = 1; },
       {"Reset System Configuration"},
       20,
       "View Support Information"},
  };
  // One console: each case leaves the menu, replaces the host and opens
  // the menu again.
  TestConsole console(DriverOptions());
  ASSERT_TRUE(Settled(console, "System Customization"));
  for (const Case& c : cases) {
    SCOPED_TRACE(c.name);
    Json host = DemoHostState();
    c.change(host);
    console.Key("Esc");
    ASSERT_TRUE(Gone(console, "System Customization"));
    ReplaceHostState(console, host);
    console.Type("o");
    ASSERT_TRUE(Settled(console, "System Customization"));
    for (const std::string& label : c.greyed) {
      const int row = MenuRow(console, label);
      ASSERT_GE(row, 0) << label << "\n" << console.Dump();
      EXPECT_EQ(console.At(row, 3).fg, kDarkGrey) << label << "\n" << console.Dump();
    }
    EXPECT_NE(console.At(MenuRow(console, "Network Restore Options"), 3).fg, kDarkGrey);
    console.Key("Down", c.downs);
    ASSERT_TRUE(console.WaitReady());
    EXPECT_EQ(RightTitle(console), c.selected) << console.Dump();
  }
}

// On a local console (the keyboard entry is there): every entry describes
// itself with its footer; the entries open their screens (those of the
// other folders included), and after Esc there the menu starts again from
// the first entry, as when it was opened.
TEST(MenuScreenTest, EveryEntryDescribesItselfAndTheMenuRestartsAfterAScreen) {
  Json host = DemoHostState();
  host["network"]["hykernelNics"][0]["ipv4"] = {{"mode", "dhcp"}};
  TulkTest::Options options = DriverOptions(host);
  options.term = "xterm";
  options.env["TULK_DRIVER_EMPTY_PASSWORD"] = "1";
  TestConsole console(options);
  ASSERT_TRUE(Settled(console, "System Customization"));
  EXPECT_EQ(MenuRow(console, "Configure Keyboard"), kMenuTop + 8);
  EXPECT_EQ(MenuRow(console, "Troubleshooting Options"), kMenuTop + 9);
  struct Entry {
    const char* title;
    const char* text;
    const char* footer;
  };
  const Entry entries[] = {
      {"Configure Password", "Not set", "<Enter> Change"},
      {"Configure Lockdown Mode", "Disabled", "<Enter> Change"},
      {"Configure Management Network", "Network identity acquired from", "<Enter> More"},
      {"Configure Management Network", "2001:db8:20:30::41/64", "<Enter> More"},
      {"Restart Management Network", "Restarting the management", "<Enter> Restart"},
      {"Test Management Network", "To perform a brief network", "<Enter> Run Test"},
      {"Network Restore Options", "To view various network restore", "<Enter> More"},
      {"Configure Keyboard", "To select the layout type", "<Enter> More"},
      {"Troubleshooting Options", "To view various troubleshooting", "<Enter> More"},
      {"View System Logs", "Press the corresponding key", "<Esc> Log Out"},
      {"View Support Information", "", "<Page Up> <Page Down>"},
      {"Reset System Configuration", "Warning!", "<Enter> Reset"},
  };
  for (const Entry& entry : entries) {
    ASSERT_TRUE(SelectEntry(console, entry.title));
    EXPECT_TRUE(console.WaitForText(entry.text)) << entry.title;
    EXPECT_NE(console.Row(22).find(entry.footer), std::string::npos) << entry.title << "\n"
                                                                     << console.Dump();
    EXPECT_NE(console.Row(22).find("<Esc> Log Out"), std::string::npos) << entry.title;
  }
  console.Key("Esc");
  EXPECT_TRUE(console.WaitForText("result: 1"));

  console.Type("o");
  const struct {
    const char* entry;
    const char* dialogText;
  } screens[] = {{"Configure Keyboard", "choose a layout that matches"},
                 {"Configure Lockdown Mode", "[ ] Enable lockdown mode"},
                 {"Restart Management Network", "Restart management network now?"},
                 {"Test Management Network", "Ping Address #1:"},
                 {"Network Restore Options", "Create Standard Switch"}};
  for (const auto& screen : screens) {
    ASSERT_TRUE(SelectEntry(console, screen.entry));
    console.Key("Enter");
    ASSERT_TRUE(Settled(console, screen.dialogText));
    console.Key("Esc");
    ASSERT_TRUE(Gone(console, screen.dialogText));
    EXPECT_TRUE(console.WaitUntil([&] { return RightTitle(console) == "Configure Password"; },
                                  "the first entry"))
        << screen.entry;
  }
}

// Support pages turn within their limits; an unreadable certificate leaves
// the thumbprint empty, and redraws of the page reuse the value (the
// unchanged file is not read again).
TEST(MenuScreenTest, SupportPagesTurnWithinTheirLimits) {
  TulkTest::Options options = DriverOptions();
  options.prepareRoot = [](const std::filesystem::path& root) {
    WriteRootFile(root, "/etc/brimlo/ssl/host.crt", "not a certificate\n");
    WriteRootFile(root, "/etc/brimlo/support",
                  "# not shown\nPage one of {hostname}\nsha256=[{ssl-thumbprint-sha-256}]\n"
                  "$\nPage two\n$\nPage three\n");
  };
  TestConsole console(options);
  ASSERT_TRUE(SelectEntry(console, "View Support Information"));
  EXPECT_TRUE(console.WaitForText("Page one of tavi-01.lab.example.net"));
  EXPECT_TRUE(console.WaitForText("sha256=[]"));
  EXPECT_TRUE(console.WaitForLog("<11>Failed to generate the host's SHA256 SSL thumbprint"));
  EXPECT_FALSE(console.Contains("not shown"));
  console.Key("PageUp");
  EXPECT_TRUE(Settled(console, "Page one"));
  console.Key("PageDown", 2);
  EXPECT_TRUE(Settled(console, "Page three"));
  console.Key("PageDown");
  EXPECT_TRUE(Settled(console, "Page three"));
  console.Key("Up");
  console.Key("Down");
  EXPECT_TRUE(Settled(console, "Page one"));
  EXPECT_TRUE(console.Contains("sha256=[]"));
  EXPECT_EQ(CountLog(console, "<11>Failed to generate the host's SHA256 SSL thumbprint"), 1);
}

TEST(MenuScreenTest, SupportPageShowsHostFingerprints) {
  TulkTest::Options options = DriverOptions();
  options.cols = 220;
  options.prepareRoot = [](const std::filesystem::path& root) {
    const std::string ssl = (root / "etc/brimlo/ssl").string();
    const std::string ssh = (root / "etc/ssh").string();
    Capture("openssl req -x509 -newkey rsa:2048 -nodes -subj /CN=tavi -days 2 -keyout " + ssl +
            "/host.key -out " + ssl + "/host.crt 2>/dev/null");
    Capture("ssh-keygen -q -t ed25519 -N '' -f " + ssh + "/ssh_host_rsa_key");
    WriteRootFile(root, "/etc/brimlo/support",
                  "sha256=[{ssl-thumbprint-sha-256}]\nrsa=[{ssh-rsa-fingerprint}]\n"
                  "dsa=[{ssh-dsa-fingerprint}]\n");
  };
  TestConsole console(options);
  const std::string thumbprint = Capture("openssl x509 -noout -fingerprint -sha256 -in " +
                                         (console.Root() / "etc/brimlo/ssl/host.crt").string() +
                                         " | cut -d= -f2 | tr -d '\\n'");
  const std::string fingerprint =
      Capture("ssh-keygen -l -f " + (console.Root() / "etc/ssh/ssh_host_rsa_key").string() +
              " | cut -d' ' -f2 | tr -d '\\n'");
  ASSERT_EQ(thumbprint.size(), 95U);
  ASSERT_TRUE(SelectEntry(console, "View Support Information", 220));
  EXPECT_TRUE(console.WaitForText("sha256=[" + thumbprint + "]"));
  EXPECT_TRUE(console.WaitForText("rsa=[" + fingerprint + "]"));
  EXPECT_TRUE(console.WaitForText("dsa=[]"));
  EXPECT_TRUE(console.WaitForLog("<11>SSH Key Fingerprint generation failed: "));
}

// On a remote console (no keyboard entry): a Down redraws only the two rows
// and the right half: the first one (to "Configure Lockdown Mode") stays
// under 600 bytes, and none comes near a full repaint of the screen (over
// 2,000 bytes). A management interface that vanished meanwhile is reported
// on restart; the reload signal reads the host again and keeps the
// selection.
TEST(MenuScreenTest, SlowLineMovesVanishedInterfaceAndReloadSignal) {
  TestConsole console(DriverOptions());
  ASSERT_TRUE(Settled(console, "System Customization"));
  EXPECT_EQ(MenuRow(console, "Configure Keyboard"), -1);
  EXPECT_EQ(MenuRow(console, "Troubleshooting Options"), kMenuTop + 8);
  for (int step = 0; step < 9; ++step) {  // to the last entry
    const std::size_t before = console.BytesReceived();
    const std::string from = RightTitle(console);
    console.Key("Down");
    ASSERT_TRUE(console.WaitReady());
    ASSERT_NE(RightTitle(console), from) << console.Dump();
    const std::size_t bytes = console.BytesReceived() - before;
    EXPECT_LT(bytes, step == 0 ? 600U : 1000U) << from << " -> " << RightTitle(console);
  }

  Json host = HostState(console);
  host["network"].erase("managementInterface");
  ReplaceHostState(console, host);
  ASSERT_TRUE(SelectEntry(console, "Restart Management Network"));
  console.Key("Enter");
  EXPECT_TRUE(console.WaitForText("Management network interface cannot be found."));
  EXPECT_TRUE(console.WaitForText("Restart Management Network: Error"));
  console.Key("Esc");
  EXPECT_TRUE(Settled(console, "Management network interface cannot be found."));
  console.Key("Enter");
  EXPECT_TRUE(console.WaitForTextGone("cannot be found"));

  ASSERT_TRUE(SelectEntry(console, "View System Logs"));
  const int lockdownRow = MenuRow(console, "Configure Lockdown Mode");
  EXPECT_NE(console.At(lockdownRow, 3).fg, kDarkGrey);
  host["lockdown"]["possible"] = false;
  ReplaceHostState(console, host);
  console.Signal(SIGUSR1);
  EXPECT_TRUE(console.WaitUntil([&] { return console.At(lockdownRow, 3).fg == kDarkGrey; },
                                "greyed lockdown"));
  ASSERT_TRUE(console.WaitReady());
  EXPECT_EQ(console.At(MenuRow(console, "Test Management Network"), 3).fg, kDarkGrey);
  EXPECT_EQ(RightTitle(console), "View System Logs");
  console.Key("Up");
  EXPECT_TRUE(console.WaitUntil([&] { return RightTitle(console) == "Troubleshooting Options"; },
                                "a move"));
}

}  // namespace
