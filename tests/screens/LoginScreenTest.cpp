// The login on the real binary through the real PAM library (pam_wrapper
// with pam_matrix and the test policy module): modes, outcomes and their
// log lines, audit records and events.

#include <signal.h>

#include <ostream>

#include "ScreenTestSupport.h"

namespace {

using namespace TulkTest;
using nlohmann::json;

// The name and password mode, Esc leaving no trace, typing that sends only
// the changed cells, and F3 switching to the PIN mode and back.
TEST(LoginScreenTest, NamePasswordAndPinModes) {
  TestConsole console(ConsoleOptions());
  ASSERT_TRUE(Settled(console, "To manage this host"));
  const std::size_t logBefore = console.LogLines().size();
  console.Key("F2");
  ASSERT_TRUE(Settled(console, "Authentication Required"));
  EXPECT_TRUE(console.Contains("Enter an authorized login name and password for"));
  EXPECT_TRUE(console.Contains("tavi-01.lab.example.net."));
  EXPECT_TRUE(console.Contains("Login Name:        [ root "));
  EXPECT_TRUE(console.Contains("Password:          [      "));
  EXPECT_TRUE(console.Contains("<Enter> OK  <Esc> Cancel"));
  EXPECT_FALSE(console.Contains("Configured Keyboard"));
  EXPECT_EQ(console.Cursor().row, RowOf(console, "Login Name:"));
  EXPECT_TRUE(console.Cursor().visible);

  console.Type("x");
  console.Key("Esc");
  ASSERT_TRUE(Gone(console, "Authentication Required"));
  EXPECT_EQ(console.LogLines().size(), logBefore);
  EXPECT_TRUE(RecordsWhere(console, "audit.jsonl", "event", "tulk.login").empty());
  EXPECT_FALSE(console.Cursor().visible);

  // Typing sends only the changed cells.
  console.Key("F2");
  ASSERT_TRUE(Settled(console, "Login Name:        [ root "));
  // The first key replaces the pre-filled name, every later one adds a cell;
  // a serial console shows about 1,000 bytes a second.
  for (const char* key : {"o", "p", "s"}) {
    const std::size_t before = console.BytesReceived();
    console.Type(key);
    ASSERT_TRUE(console.WaitReady());
    EXPECT_LT(console.BytesReceived() - before, 40u) << key;
  }
  EXPECT_TRUE(console.Contains("Login Name:        [ ops "));

  console.Key("Down");
  console.Type("abc");
  console.Key("F3");
  ASSERT_TRUE(Settled(console, "Enter the smart card login PIN for"));
  EXPECT_TRUE(console.Contains("Login Id:          [       "));
  EXPECT_TRUE(console.Contains("PIN:               [       "));
  EXPECT_TRUE(console.Contains("<F3> Switch PIN/Password Login"));
  EXPECT_FALSE(console.Contains("***"));
  console.Key("F3");
  ASSERT_TRUE(Settled(console, "Login Name:        [ root "));
  EXPECT_TRUE(console.Contains("Enter an authorized login name and password for"));
}

struct FailedLogin {
  const char* user;
  const char* password;
  const char* policy;
  const char* logLine;  // authentication facility, error level
  const char* reason;
  const char* eventText;
  const char* message;
};

void PrintTo(const FailedLogin& login, std::ostream* out) {
  *out << login.reason;
}

class FailedLoginTest : public ::testing::TestWithParam<FailedLogin> {};

TEST_P(FailedLoginTest, IsLoggedAuditedPostedAndShown) {
  const FailedLogin& c = GetParam();
  PamSetup pam;
  pam.policy = {c.policy};
  TestConsole console(ConsoleOptions(DemoHostState(), pam));
  ASSERT_TRUE(LogIn(console, c.user, c.password));
  ASSERT_TRUE(Settled(console, c.message));
  EXPECT_TRUE(console.Contains("Authentication failed"));
  EXPECT_EQ(CountLog(console, std::string("<35>") + c.logLine), 1);
  const auto audit = RecordsWhere(console, "audit.jsonl", "event", "tulk.login");
  ASSERT_EQ(audit.size(), 1u);
  EXPECT_EQ(audit[0]["result"], "failure");
  EXPECT_EQ(audit[0]["user"], c.user);
  EXPECT_EQ(audit[0]["attributes"], json({{"reason", c.reason}}));
  const auto events = RecordsWhere(console, "events.jsonl", "id", "qob.user.tulk.login.failed");
  ASSERT_EQ(events.size(), 1u);
  EXPECT_EQ(events[0]["text"], c.eventText);
}

INSTANTIATE_TEST_SUITE_P(
    Outcomes, FailedLoginTest,
    ::testing::Values(
        FailedLogin{"root", "wrong", "", "Authentication of user root failed", "Invalid login",
                    "Authentication of user root failed", "Invalid login or password."},
        FailedLogin{"operator", "operator", "operator:denied", "Access denied for user operator",
                    "No permission", "Access denied for user operator",
                    "User does not have permission to login to TULK."},
        FailedLogin{"root", "tulk", "root:expired", "Password has expired for user root",
                    "Password expired", "Access denied for user root",
                    "You will be prompted to set a new password and then"}),
    [](const ::testing::TestParamInfo<FailedLogin>& param) {
      std::string name;
      for (char c : std::string(param.param.reason)) {
        if (c != ' ') {
          name += c;
        }
      }
      return name;
    });

TEST(LoginScreenTest, FailedLoginKeepsTheNameAndCanBeRetried) {
  TestConsole console(ConsoleOptions());
  ASSERT_TRUE(LogIn(console, "root", "wrong"));
  ASSERT_TRUE(Settled(console, "Invalid login or password."));
  console.Key("Esc");  // only Enter closes the message
  ASSERT_TRUE(console.WaitReady());
  EXPECT_TRUE(console.Contains("Invalid login or password."));
  console.Key("Enter");
  ASSERT_TRUE(Gone(console, "Invalid login or password."));
  EXPECT_TRUE(console.Contains("Login Name:        [ root "));
  EXPECT_FALSE(console.Contains("*****"));
  console.Type(kRootPassword);
  console.Key("Enter");
  ASSERT_TRUE(Settled(console, "System Customization"));
  EXPECT_EQ(CountLog(console, "<32>Authentication of user root succeeded"), 1);
  EXPECT_EQ(CountLog(console, "<14>User root logged in"), 1);
  const auto logins = RecordsWhere(console, "audit.jsonl", "event", "tulk.login");
  ASSERT_EQ(logins.size(), 2u);
  EXPECT_EQ(logins[1]["result"], "success");
  EXPECT_EQ(logins[1]["attributes"], json::object());
}

TEST(LoginScreenTest, ExpiredPasswordIsChangedThenLoginAgain) {
  PamSetup pam;
  pam.policy = {"root:expired"};
  TestConsole console(ConsoleOptions(DemoHostState(), pam));
  ASSERT_TRUE(LogIn(console));
  ASSERT_TRUE(Settled(console, "Password has expired."));
  console.Key("Enter");
  ASSERT_TRUE(Settled(console, "Setting the password will prevent unauthorized access"));
  console.Type(kRootPassword);
  console.Key("Down");
  ASSERT_TRUE(CursorOn(console, "New Password:"));
  console.Type("fresh-1");
  console.Key("Down");
  console.Type("fresh-1");
  console.Key("Enter");
  ASSERT_TRUE(Gone(console, "Confirm Password:"));
  ASSERT_TRUE(Settled(console, "Authentication Required"));
  EXPECT_FALSE(console.Contains("System Customization"));
  EXPECT_NE(ReadText(console.PamPasswordFile()).find("root:fresh-1:"), std::string::npos);

  console.Type("fresh-1");
  console.Key("Enter");
  ASSERT_TRUE(Settled(console, "System Customization"));
  EXPECT_TRUE(console.Contains("Set"));
}

TEST(LoginScreenTest, EmptyPasswordMarksThePasswordNotSet) {
  PamSetup pam;
  pam.users = {{"root", ""}};
  TestConsole console(ConsoleOptions(DemoHostState(), pam));
  ASSERT_TRUE(LogIn(console, "root", ""));
  ASSERT_TRUE(Settled(console, "System Customization"));
  EXPECT_TRUE(console.WaitForText("Not set"));
}

TEST(LoginScreenTest, SmartCardLoginAndRemoval) {
  json host = DemoHostState();
  host["smartCards"] = json::array({{{"userId", "cardholder"}, {"valid", true}}});
  PamSetup pam;
  pam.users["cardholder"] = "2468";
  TestConsole console(ConsoleOptions(host, pam));
  ASSERT_TRUE(Settled(console, "Customize System/View Logs"));
  console.Key("F2");
  ASSERT_TRUE(Settled(console, "Enter the smart card login PIN for"));
  EXPECT_TRUE(console.Contains("Login Id:          [ cardholder "));
  EXPECT_EQ(CountLog(console, "<14>Found smart card with user id 'cardholder'"), 1);
  console.Key("Down");
  console.Type("2468");
  console.Key("Enter");
  ASSERT_TRUE(Settled(console, "System Customization"));
  // The check runs on SIGUSR1 whichever frame has the keys; here the
  // password dialog opened from the menu.
  console.Key("Enter");
  ASSERT_TRUE(Settled(console, "Old Password:"));

  host["smartCards"][0]["valid"] = false;
  ReplaceHostState(console, host);
  console.Signal(SIGUSR1);
  ASSERT_TRUE(console.WaitForLog("Logging out user id 'cardholder'"));
  EXPECT_EQ(console.WaitExit(), 0);
}

TEST(LoginScreenTest, KeyboardLabelAndCursorOnALocalConsole) {
  TulkTest::Options options = ConsoleOptions();
  options.term = "xterm";
  TestConsole console(options);
  ASSERT_TRUE(Settled(console, "Customize System/View Logs"));
  console.Key("F2");
  ASSERT_TRUE(Settled(console, "Configured Keyboard (US Default)"));
  const int label = RowOf(console, "Configured Keyboard");
  EXPECT_EQ(RowOf(console, "Login Name:"), label + 1);
  EXPECT_EQ(RowOf(console, "Password:"), label + 2);
  console.Key("Tab");
  ASSERT_TRUE(CursorOn(console, "Login Name:"));
  console.Key("Up");
  console.Key("Enter");
  ASSERT_TRUE(Settled(console, "Configure Keyboard"));
  console.Key("Esc");
  ASSERT_TRUE(Gone(console, "Configure Keyboard"));

  // The cursor marks the selected item, the keyboard label included: at
  // the start of its text, on opening, after moving back to it and after
  // the keyboard dialog it opens.
  console.Key("Esc");
  ASSERT_TRUE(Gone(console, "Authentication Required"));
  console.Key("F2");
  ASSERT_TRUE(Settled(console, "Configured Keyboard (US Default)"));
  int column = -1;
  for (int col = 0; col < 70 && column < 0; ++col) {
    if (Cells(console, label, col, 10) == "Configured") {
      column = col;
    }
  }
  ASSERT_GE(column, 0);
  const auto onLabel = [&] {
    const CursorState cursor = console.Cursor();
    return cursor.visible && cursor.row == label && cursor.col == column;
  };
  EXPECT_TRUE(console.WaitUntil(onLabel, "the cursor on the label")) << console.Dump();
  console.Key("Tab");
  ASSERT_TRUE(
      console.WaitUntil([&] { return console.Cursor().row == label + 1; }, "the login name"));
  console.Key("Up");
  EXPECT_TRUE(console.WaitUntil(onLabel, "the cursor back on the label")) << console.Dump();
  console.Key("Enter");
  ASSERT_TRUE(Settled(console, "Configure Keyboard"));
  console.Key("Esc");
  ASSERT_TRUE(Gone(console, "Configure Keyboard"));
  EXPECT_TRUE(console.WaitUntil(onLabel, "the cursor on the label after the dialog"))
      << console.Dump();
}

}  // namespace
