#include "runtime/Terminal.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <optional>
#include <string>

#include "include/ProcessFlags.h"

namespace {

TEST(VtArgument, AcceptsOneToSixtyThreeWithStrtolRules) {
  struct Case {
    const char* text;
    std::optional<int> expected;
  };
  const Case cases[] = {
      {"1", 1},
      {"63", 63},
      {"7x", 7},
      {" 12", 12},
      {"0", std::nullopt},
      {"64", std::nullopt},
      {"-1", std::nullopt},
      {"abc", std::nullopt},
      {"", std::nullopt},
      {"99999999999999999999", std::nullopt},
  };
  for (const Case& c : cases) {
    EXPECT_EQ(Tulk::ParseVtArgument(c.text), c.expected) << "argument \"" << c.text << "\"";
  }
}

struct TermCase {
  const char* name;
  bool linuxConsole;
  const char* term;       // null: unset
  const char* sshClient;  // null: unset
  const char* terminfo;   // null: unset
  const char* expectedTerm;
  const char* expectedTerminfo;
  bool expectedLocal;
};

class TerminalTypeTest : public ::testing::TestWithParam<TermCase> {};

void SetOrUnset(const char* name, const char* value) {
  if (value == nullptr) {
    unsetenv(name);
  } else {
    setenv(name, value, 1);
  }
}

TEST_P(TerminalTypeTest, AppliesTermRulesAndLocalConsole) {
  const TermCase& c = GetParam();
  SetOrUnset("TERM", c.term);
  SetOrUnset("SSH_CLIENT", c.sshClient);
  SetOrUnset("TERMINFO", c.terminfo);
  Tulk::localConsole = false;

  Tulk::ApplyTerminalType(c.linuxConsole);

  EXPECT_STREQ(std::getenv("TERM"), c.expectedTerm);
  EXPECT_STREQ(std::getenv("TERMINFO"), c.expectedTerminfo);
  EXPECT_EQ(Tulk::localConsole, c.expectedLocal);
}

INSTANTIATE_TEST_SUITE_P(
    Rules, TerminalTypeTest,
    ::testing::Values(TermCase{"LinuxConsoleOverwritesTerm", true, "xterm", nullptr, nullptr,
                               "linux", "/usr/share/terminfo", true},
                      TermCase{"UnsetTermBecomesVt102", false, nullptr, nullptr, nullptr, "vt102",
                               "/usr/share/terminfo", false},
                      TermCase{"LinuxOverSerialBecomesVt102", false, "linux", nullptr, nullptr,
                               "vt102", "/usr/share/terminfo", false},
                      TermCase{"LocalXtermIsLocalConsole", false, "xterm", nullptr, nullptr,
                               "xterm", "/usr/share/terminfo", true},
                      TermCase{"XtermOverSshIsRemote", false, "xterm", "10.0.0.1 5000 22", nullptr,
                               "xterm", "/usr/share/terminfo", false},
                      TermCase{"OtherXtermIsRemote", false, "xterm-256color", nullptr, nullptr,
                               "xterm-256color", "/usr/share/terminfo", false},
                      TermCase{"TerminfoKeptWhenSet", false, "vt220", nullptr, "/opt/terminfo",
                               "vt220", "/opt/terminfo", false}),
    [](const ::testing::TestParamInfo<TermCase>& param) { return std::string(param.param.name); });

}  // namespace
