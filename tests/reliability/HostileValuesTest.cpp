// Hostile host values: control characters, terminal commands (set the
// clipboard, clear the screen, a C1 introducer) and bidirectional-text
// marks in the host name, the welcome message, a NIC's name and
// description, the hardware vendor and a log file never reach the terminal
// as they are: the console shows them as harmless text.

#include <gtest/gtest.h>
#include <signal.h>

#include <string>
#include <vector>

#include "ReliabilitySupport.h"
#include "ScreenTestSupport.h"

namespace {

using TulkTest::TestConsole;

// Each payload with the bytes that must never appear in the output.
struct Payload {
  const char* name;
  std::string text;
  std::string forbidden;
};

const std::vector<Payload>& Payloads() {
  static const std::vector<Payload> payloads = {
      {"clipboard write", "a\x1b]52;c;aGFja2Vk\x07z", "\x1b]52"},
      {"clear screen", "b\x1b[2Jcleared", "\x1b[2Jcleared"},
      {"C1 introducer",
       "c\xc2\x9b"
       "2Jc1",
       "\xc2\x9b"},
      {"right-to-left override",
       "d\xe2\x80\xae"
       "evil",
       "\xe2\x80\xae"},
      {"isolate",
       "e\xe2\x81\xa6"
       "iso\xe2\x81\xa9",
       "\xe2\x81\xa6"},
      {"right-to-left mark", "f\xe2\x80\x8fmark", "\xe2\x80\x8f"},
  };
  return payloads;
}

std::string AllPayloads() {
  std::string text;
  for (const Payload& payload : Payloads()) {
    text += payload.text;
  }
  return text + "\r\b\t";
}

::testing::AssertionResult Clean(const TestConsole& console, const std::string& where) {
  for (const Payload& payload : Payloads()) {
    if (console.Output().find(payload.forbidden) != std::string::npos) {
      return ::testing::AssertionFailure()
             << "the " << payload.name << " reached the terminal " << where;
    }
  }
  return ::testing::AssertionSuccess();
}

TEST(HostileValues, WelcomeMessageNeverReachesTheTerminalRaw) {
  nlohmann::json host = TulkTest::DemoHostState();
  host["system"]["welcomeMessage"] = "Welcome" + AllPayloads();
  TulkTest::Options options = Reliability::ConsoleOptions(host);
  options.keepOutput = true;
  TestConsole console(options);
  ASSERT_TRUE(console.WaitForText("Welcome"));
  ASSERT_TRUE(console.WaitReady());
  EXPECT_TRUE(Clean(console, "in the welcome message"));
  EXPECT_TRUE(console.Contains("evil")) << console.Dump();
}

TEST(HostileValues, HostNameNicsVendorAndLogNeverReachTheTerminalRaw) {
  nlohmann::json host = TulkTest::DemoHostState();
  const std::string hostile = AllPayloads();
  host["network"]["dns"]["hostname"] = "tavi" + hostile;
  host["hardware"]["vendor"] = "Vendor" + hostile;
  host["network"]["pnics"][3]["name"] = "hynic3" + hostile;
  host["network"]["pnics"][2]["pci"]["description"] = "Adapter" + hostile;
  TulkTest::Options options =
      TulkTest::ConsoleOptions(host, {}, [&](const std::filesystem::path& root) {
        TulkTest::WriteRootFile(root, "/var/log/syslog.log", "log line" + hostile + "\n");
      });
  options.keepOutput = true;
  TestConsole console(options);
  ASSERT_TRUE(console.WaitReady());
  EXPECT_TRUE(Clean(console, "on the welcome screen"));

  ASSERT_TRUE(Reliability::LogIn(console));
  ASSERT_TRUE(Reliability::OpenEntry(console, "Configure Management Network"));
  ASSERT_TRUE(console.WaitReady());
  ASSERT_TRUE(Reliability::OpenEntry(console, "Network Adapters"));
  ASSERT_TRUE(console.WaitReady());
  EXPECT_TRUE(console.Contains("hynic3")) << console.Dump();
  console.Key("Down", 3);
  ASSERT_TRUE(console.WaitReady());
  console.Key("Esc");
  ASSERT_TRUE(Reliability::OpenEntry(console, "DNS Configuration"));
  ASSERT_TRUE(console.WaitReady());
  console.Key("Esc");
  console.Key("Esc");
  ASSERT_TRUE(console.WaitReady());
  EXPECT_TRUE(Clean(console, "in the network screens"));

  ASSERT_TRUE(TulkTest::Settled(console, "System Customization"));
  ASSERT_TRUE(TulkTest::SelectEntry(console, "View System Logs"));
  console.Type("1");
  ASSERT_TRUE(console.WaitForText("log line"));
  console.SendNow("q");
  ASSERT_TRUE(TulkTest::Settled(console, "System Customization"));
  EXPECT_TRUE(Clean(console, "in the log pager"));

  ASSERT_TRUE(Reliability::OpenEntry(console, "View Support Information"));
  ASSERT_TRUE(console.WaitReady());
  console.Key("Esc");
  ASSERT_TRUE(console.WaitReady());
  EXPECT_TRUE(Clean(console, "in the support information"));

  console.Signal(SIGTERM);
  EXPECT_EQ(console.WaitExit(), 0);
}

}  // namespace
