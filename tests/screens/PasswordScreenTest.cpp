// The password change on the real binary, opened from the System
// Customization menu, through the real PAM library.

#include <algorithm>

#include "ScreenTestSupport.h"

namespace {

using namespace TulkTest;
using nlohmann::json;

constexpr char kDialogText[] = "Setting the password will prevent unauthorized access";

std::string PasswordFile(const TestConsole& console) {
  return ReadText(console.PamPasswordFile());
}

::testing::AssertionResult OpenPasswordDialog(TestConsole& console) {
  if (auto login = LogIn(console); !login) {
    return login;
  }
  if (auto menu = Settled(console, "System Customization"); !menu) {
    return menu;
  }
  console.Key("Enter");  // "Configure Password" is the first entry
  return Settled(console, kDialogText);
}

std::vector<json> PasswordAudits(const TestConsole& console) {
  return RecordsWhere(console, "audit.jsonl", "event", "account.changePassword");
}

// Types the old password, then `next` and `confirm` into the two new fields,
// and submits them.
::testing::AssertionResult SubmitPasswords(TestConsole& console, const std::string& next,
                                           const std::string& confirm) {
  console.Type(kRootPassword);
  console.Key("Down");
  if (auto moved = CursorOn(console, "New Password:"); !moved) {
    return moved;
  }
  console.Type(next);
  console.Key("Down");
  console.Type(confirm);
  console.Key("Enter");
  return ::testing::AssertionSuccess();
}

// In one dialog after another: a wrong old password never reaches the new
// field; a mismatch and an empty password are refused before PAM; the same
// password asks first, then changes and reports.
TEST(PasswordScreenTest, RefusalsThenTheSamePasswordAfterAQuestion) {
  TestConsole console(ConsoleOptions());
  ASSERT_TRUE(OpenPasswordDialog(console));
  console.Type("not-it");
  console.Key("Down");
  ASSERT_TRUE(Settled(console, "The old password you entered is incorrect"));
  EXPECT_TRUE(console.Contains("Configure Password: Error"));
  const auto audits = PasswordAudits(console);
  ASSERT_EQ(audits.size(), 1u);
  EXPECT_EQ(audits[0]["result"], "failure");
  EXPECT_EQ(audits[0]["user"], "root");
  EXPECT_EQ(audits[0]["attributes"], json({{"reason", "Invalid login"}}));
  console.Key("Enter");
  ASSERT_TRUE(Gone(console, "incorrect"));
  ASSERT_TRUE(CursorOn(console, "Old Password:"));
  // Tab and Enter check the old password as well.
  console.Key("Tab");
  ASSERT_TRUE(Settled(console, "The old password you entered is incorrect"));
  console.Key("Enter");
  ASSERT_TRUE(CursorOn(console, "Old Password:"));
  EXPECT_EQ(PasswordAudits(console).size(), 2u);
  console.Key("Esc");
  ASSERT_TRUE(Gone(console, kDialogText));

  console.Key("Enter");  // "Configure Password" is the first entry
  ASSERT_TRUE(Settled(console, kDialogText));
  ASSERT_TRUE(SubmitPasswords(console, "first", "second"));
  ASSERT_TRUE(Settled(console, "The new password and the confirmed password do not"));
  console.Key("Enter");
  ASSERT_TRUE(CursorOn(console, "New Password:"));
  EXPECT_EQ(console.Row(RowOf(console, "Confirm Password:")).find('*'), std::string::npos);
  EXPECT_EQ(console.Row(RowOf(console, "New Password:")).find('*'), std::string::npos);

  console.Key("Down");
  console.Key("Enter");
  ASSERT_TRUE(Settled(console, "Empty passwords are not allowed."));
  console.Key("Enter");
  ASSERT_TRUE(CursorOn(console, "New Password:"));
  EXPECT_EQ(PasswordAudits(console).size(), 2u);
  EXPECT_NE(PasswordFile(console).find("root:tulk:"), std::string::npos);
  console.Key("Esc");
  ASSERT_TRUE(Gone(console, kDialogText));
  EXPECT_TRUE(console.Contains("System Customization"));

  console.Key("Enter");
  ASSERT_TRUE(Settled(console, kDialogText));
  console.Type(kRootPassword);
  console.Key("Down");
  ASSERT_TRUE(CursorOn(console, "New Password:"));
  console.Type(kRootPassword);
  console.Key("Tab");
  console.Type(kRootPassword);
  console.Key("Enter");
  ASSERT_TRUE(Settled(console, "New password is same as old password. Are you sure?"));
  EXPECT_TRUE(console.Contains("<Enter> Confirm"));
  console.Key("Esc");
  ASSERT_TRUE(Gone(console, "Are you sure?"));
  EXPECT_TRUE(console.Contains(kDialogText));
  EXPECT_EQ(PasswordAudits(console).size(), 2u);

  console.Key("Enter");
  ASSERT_TRUE(Settled(console, "Are you sure?"));
  console.Key("Enter");
  ASSERT_TRUE(Gone(console, kDialogText));
  ASSERT_TRUE(console.WaitForLog("Login password for user root has changed"));
  EXPECT_EQ(CountLog(console, "<14>Login password for user root has changed"), 1);
  const auto all = PasswordAudits(console);
  ASSERT_EQ(all.size(), 3u);
  EXPECT_EQ(all[2]["result"], "success");
  // The event follows the log line.
  ASSERT_TRUE(console.WaitUntil(
      [&] {
        return !RecordsWhere(console, "events.jsonl", "id", "qob.user.tulk.login.passwd.changed")
                    .empty();
      },
      "the password-changed event"));
  const auto events =
      RecordsWhere(console, "events.jsonl", "id", "qob.user.tulk.login.passwd.changed");
  ASSERT_EQ(events.size(), 1u);
  EXPECT_EQ(events[0]["text"], "Login password for user root changed");
  const std::vector<std::string> commands = CommandLines(console);
  const auto backup = std::find(commands.begin(), commands.end(), "backup.sh 0");
  const auto refresh =
      std::find(commands.begin(), commands.end(), "osk-cmd -U root internalsvc/refresh");
  ASSERT_NE(backup, commands.end());
  ASSERT_NE(refresh, commands.end());
  EXPECT_LT(backup, refresh);
  EXPECT_EQ(ReadHostState(console.HostStatePath())["users"]["configStoreSaves"], 1);
}

TEST(PasswordScreenTest, PamRefusingTheChangeIsReported) {
  PamSetup pam;
  pam.policy = {"root:chauthtok-fails"};
  TestConsole console(ConsoleOptions(DemoHostState(), pam));
  ASSERT_TRUE(OpenPasswordDialog(console));
  ASSERT_TRUE(SubmitPasswords(console, "weak", "weak"));
  ASSERT_TRUE(Settled(console, "The password change operation failed."));
  const auto audits = PasswordAudits(console);
  ASSERT_EQ(audits.size(), 1u);
  EXPECT_EQ(audits[0]["attributes"], json({{"reason", "PAM error"}}));
  console.Key("Enter");
  ASSERT_TRUE(CursorOn(console, "New Password:"));
  EXPECT_EQ(console.Row(RowOf(console, "Confirm Password:")).find('*'), std::string::npos);
  EXPECT_NE(PasswordFile(console).find("root:tulk:"), std::string::npos);
  EXPECT_EQ(CountLog(console, "<14>Login password for user root has changed"), 0);
}

TEST(PasswordScreenTest, FailedStoreStillChangesAndWarns) {
  json host = DemoHostState();
  host["faults"]["HostMgr::Authentication::StoreUserAccountsToCs"] = "store is read-only";
  TestConsole console(ConsoleOptions(host));
  ASSERT_TRUE(OpenPasswordDialog(console));
  ASSERT_TRUE(SubmitPasswords(console, "next-2", "next-2"));
  ASSERT_TRUE(Settled(console, "Configure Password: Warning"));
  EXPECT_TRUE(console.Contains("Error while storing user account information to"));
  EXPECT_EQ(CountLog(console, "<11>Error persisting changes to config store"), 1);
  EXPECT_EQ(CountLog(console,
                     "<11>Error while storing user account information to persistent storage. "
                     "The new information may not be available after reboot. Error: store is "
                     "read-only"),
            1);
  EXPECT_EQ(CountLog(console, "<14>Login password for user root has changed"), 1);
  EXPECT_NE(PasswordFile(console).find("root:next-2:"), std::string::npos);
  console.Key("Enter");
  ASSERT_TRUE(Gone(console, kDialogText));
  EXPECT_TRUE(console.Contains("System Customization"));
}

}  // namespace
