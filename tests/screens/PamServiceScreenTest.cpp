// The console's PAM service file as a host installs it (dist/pam.d/tulk),
// driven through the real console and the real PAM library (pam_wrapper),
// over common stacks shaped like Debian's whose password module is
// pam_matrix: logins and password changes pass through the common stacks,
// every failed login is delayed, and the lock-out opt-in locks a user out
// through the console's failed-login path, but never root.

#include <chrono>
#include <fstream>
#include <regex>
#include <sstream>

#include "ScreenTestSupport.h"

namespace {

using namespace TulkTest;
using nlohmann::json;
namespace fs = std::filesystem;
using namespace std::chrono_literals;

constexpr char kRightPassword[] = "right-1";
constexpr char kInvalid[] = "Invalid login or password.";
// The shipped delay is 3 s, which libpam varies by up to half either way.
constexpr auto kLeastDelay = 1400ms;
// The longest a delayed attempt may take before the test calls it lost.
constexpr auto kAttemptDeadline = 20s;

// The service file with the lock-out opt-in applied as its comment says:
// "@include common-auth" commented out, the pam_faillock lines taken in.
std::string WithLockout(const std::string& text) {
  std::string result = std::regex_replace(
      text, std::regex("^@include common-auth$", std::regex::multiline), "#@include common-auth");
  return std::regex_replace(result, std::regex("^#((auth|account) .*)$", std::regex::multiline),
                            "$1");
}

// The test's own settings: libpam 1.5 looks up "@include" and "substack"
// names in the machine's /etc/pam.d even for a service read from another
// folder, so the common stacks are named by their full path; pam_faillock
// reads a settings file of the test folder instead of the machine's.
std::string Localised(const std::string& text, const fs::path& folder) {
  std::string result = std::regex_replace(text, std::regex("(@include|substack) +(common-[a-z]+)"),
                                          "$1 " + folder.string() + "/$2");
  return std::regex_replace(result, std::regex("(pam_faillock\\.so.*)$", std::regex::multiline),
                            "$1 conf=" + (folder / "faillock.conf").string());
}

// Debian's shape of a common stack, with pam_matrix as its password module.
std::string CommonStack(const std::string& type, const fs::path& folder) {
  const std::string matrix =
      std::string(TULK_TEST_PAM_MATRIX_MODULE) + " passdb=" + (folder / "passdb").string();
  const std::string success = type == "account" ? "[success=1 new_authtok_reqd=done default=ignore]"
                                                : "[success=1 default=ignore]";
  return type + " " + success + " " + matrix + "\n" + type + " requisite pam_deny.so\n" + type +
         " required pam_permit.so\n";
}

// A console, not yet started, whose "tulk" service is the shipped file.
// "nobody" stands for an ordinary user: pam_faillock counts only users the
// machine's user database knows.
std::unique_ptr<TestConsole> ShippedServiceConsole(bool lockout) {
  PamSetup pam;
  pam.users = {{"root", kRightPassword}, {"nobody", kRightPassword}};
  TulkTest::Options options = ConsoleOptions(DemoHostState(), pam);
  options.start = false;
  auto console = std::make_unique<TestConsole>(options);
  const fs::path folder = console->PamPasswordFile().parent_path();
  std::string service = ReadText(TULK_TEST_PAM_SERVICE_FILE);
  if (lockout) {
    service = WithLockout(service);
  }
  std::ofstream(folder / "tulk") << Localised(service, folder);
  for (const char* type : {"auth", "account", "password"}) {
    std::ofstream(folder / ("common-" + std::string(type))) << CommonStack(type, folder);
  }
  std::ofstream(folder / "faillock.conf")
      << "dir = " << (folder / "faillock").string() << "\ndeny = 3\nfail_interval = 900\n"
      << "unlock_time = 600\n";
  console->Start();
  return console;
}

// Waits for failed attempt number `count` of `user` and closes its message.
::testing::AssertionResult Failed(TestConsole& console, const std::string& user, int count) {
  const std::string line = "<35>Authentication of user " + user + " failed";
  if (auto logged = console.WaitUntil([&] { return CountLog(console, line) == count; }, line,
                                      kAttemptDeadline);
      !logged) {
    return logged;
  }
  if (auto shown = Settled(console, kInvalid); !shown) {
    return shown;
  }
  console.Key("Enter");
  return Gone(console, kInvalid);
}

// A failed login is delayed, the right password then logs in, and a
// password change goes through the common password stack.
TEST(PamServiceScreenTest, FailedLoginIsDelayedThenLoginAndPasswordChange) {
  std::unique_ptr<TestConsole> console = ShippedServiceConsole(false);
  ASSERT_TRUE(Settled(*console, "Customize System/View Logs"));
  console->Key("F2");
  ASSERT_TRUE(Settled(*console, "Authentication Required"));
  console->Key("Down");
  console->Type("wrong");
  const auto pressed = std::chrono::steady_clock::now();
  console->Key("Enter");
  ASSERT_TRUE(console->WaitUntil(
      [&] { return CountLog(*console, "<35>Authentication of user root failed") == 1; },
      "the failed login", kAttemptDeadline));
  EXPECT_GE(std::chrono::steady_clock::now() - pressed, kLeastDelay);
  ASSERT_TRUE(Settled(*console, kInvalid));
  console->Key("Enter");
  ASSERT_TRUE(Gone(*console, kInvalid));

  console->Type(kRightPassword);
  console->Key("Enter");
  ASSERT_TRUE(Settled(*console, "System Customization"));
  EXPECT_EQ(CountLog(*console, "<32>Authentication of user root succeeded"), 1);

  console->Key("Enter");  // Configure Password
  ASSERT_TRUE(Settled(*console, "Old Password:"));
  console->Type(kRightPassword);
  console->Key("Down");
  ASSERT_TRUE(
      console->WaitUntil([&] { return console->Cursor().row == RowOf(*console, "New Password:"); },
                         "the new-password field"));
  console->Type("fresh-2");
  console->Key("Down");
  console->Type("fresh-2");
  console->Key("Enter");
  ASSERT_TRUE(console->WaitForLog("Login password for user root has changed"));
  EXPECT_NE(ReadText(console->PamPasswordFile()).find("root:fresh-2:"), std::string::npos);
}

struct Lockout {
  const char* user;
  bool locked;  // the right password fails after three wrong ones
};

void PrintTo(const Lockout& lockout, std::ostream* out) {
  *out << lockout.user;
}

class LockoutTest : public ::testing::TestWithParam<Lockout> {};

TEST_P(LockoutTest, ThreeFailuresLockOrdinaryUsersOnly) {
  const Lockout& c = GetParam();
  std::unique_ptr<TestConsole> console = ShippedServiceConsole(true);
  ASSERT_TRUE(LogIn(*console, c.user, "wrong"));
  ASSERT_TRUE(Failed(*console, c.user, 1));
  for (int attempt = 2; attempt <= 3; ++attempt) {
    console->Type("wrong");
    console->Key("Enter");
    ASSERT_TRUE(Failed(*console, c.user, attempt));
  }

  console->Type(kRightPassword);
  console->Key("Enter");
  auto logins = [&] { return RecordsWhere(*console, "audit.jsonl", "event", "tulk.login"); };
  if (c.locked) {
    ASSERT_TRUE(Failed(*console, c.user, 4));
    EXPECT_FALSE(console->Contains("System Customization"));
    const auto audit = logins();
    ASSERT_EQ(audit.size(), 4u);
    EXPECT_EQ(audit[3]["result"], "failure");
    EXPECT_EQ(audit[3]["user"], c.user);
    EXPECT_EQ(audit[3]["attributes"], json({{"reason", "Invalid login"}}));
  } else {
    ASSERT_TRUE(console->WaitUntil([&] { return console->Contains("System Customization"); },
                                   "the menu", kAttemptDeadline));
    const auto audit = logins();
    ASSERT_EQ(audit.size(), 4u);
    EXPECT_EQ(audit[3]["result"], "success");
  }
}

INSTANTIATE_TEST_SUITE_P(Users, LockoutTest,
                         ::testing::Values(Lockout{"nobody", true}, Lockout{"root", false}),
                         [](const ::testing::TestParamInfo<Lockout>& param) {
                           return std::string(param.param.user);
                         });

}  // namespace
