// Pure logic of the System Customization menu: entry rows, log choice by
// digit, support pages, tool output parsing, environment override.

#include <gtest/gtest.h>

#include <cstdlib>
#include <sstream>

#include "screens/EnvironmentOverride.h"
#include "screens/LogTable.h"
#include "screens/MenuEntries.h"
#include "screens/ShellQuote.h"
#include "screens/SupportPages.h"
#include "screens/SupportValues.h"

namespace Tulk {
namespace {

std::vector<std::uint32_t> Ids(const std::vector<MenuEntry>& entries) {
  std::vector<std::uint32_t> ids;
  for (const MenuEntry& entry : entries) {
    ids.push_back(entry.id);
  }
  return ids;
}

TEST(MenuEntriesTest, KeyboardRowOnlyOnLocalConsole) {
  const MenuHostState host{false, true, true, false};
  EXPECT_EQ(Ids(BuildMenuEntries(host, true)),
            (std::vector<std::uint32_t>{5, 6, 3, 7, 8, 9, 10, 3, 15, 13, 3, 12, 3, 11, 3, 14}));
  EXPECT_EQ(Ids(BuildMenuEntries(host, false)),
            (std::vector<std::uint32_t>{5, 6, 3, 7, 8, 9, 10, 3, 13, 3, 12, 3, 11, 3, 14}));
}

TEST(MenuEntriesTest, EnablingRules) {
  struct Case {
    MenuHostState host;
    bool lockdown;
    bool network;
    bool reset;
  };
  const Case cases[] = {
      {{true, false, true, false}, true, true, true},    // enabled: possible not asked
      {{false, true, false, false}, true, false, true},  // possible, no management NIC
      {{false, false, true, true}, false, true, false},  // neither; network boot
  };
  for (const Case& c : cases) {
    std::map<std::uint32_t, bool> enabled;
    for (const MenuEntry& entry : BuildMenuEntries(c.host, false)) {
      enabled[entry.id] = entry.enabled;
    }
    EXPECT_EQ(enabled[6], c.lockdown);
    EXPECT_EQ(enabled[7] && enabled[8] && enabled[9], c.network);
    EXPECT_EQ(enabled[7] || enabled[8] || enabled[9], c.network);
    EXPECT_EQ(enabled[14], c.reset);
    EXPECT_FALSE(enabled[3]);
  }
  EXPECT_EQ(EntryLabel("Reset", false), "{color:dark-grey}Reset{/color}");
}

TEST(LogTableTest, DigitChoosesRow) {
  using Flags = std::array<bool, LogTable::kRows>;
  const Flags firstThree{true, true, true, false, false, false, false};
  const Flags all{true, true, true, true, true, true, true};
  const Flags gaps{false, true, false, true, false, false, false};
  struct Case {
    Flags flags;
    int digit;
    std::optional<std::size_t> row;
  };
  const Case cases[] = {
      {firstThree, 1, 0}, {firstThree, 3, 2},     {firstThree, 5, 3},  // past the end: row 4
      {firstThree, 0, 3},                                              // first row exists
      {all, 7, 6},        {all, 8, std::nullopt}, {all, 9, std::nullopt}, {all, 0, std::nullopt},
      {gaps, 1, 1},       {gaps, 2, 3},           {gaps, 0, 0},  // missing first row
      {gaps, 4, 2},
  };
  for (const Case& c : cases) {
    EXPECT_EQ(ChooseLogRow(c.flags, c.digit), c.row) << "digit " << c.digit;
  }
}

TEST(LogTableTest, ListNumbersOnlyExistingFiles) {
  LogTable table;
  table.SetAvailable(1, true);
  table.SetAvailable(6, true);
  EXPECT_EQ(FormatLogList(table.Rows()),
            "{color:white}<1> {color:light-grey}Hykernel{/color}\n"
            "{color:white}<2> {color:light-grey}Brimlo Tavi Observation log (qobd){/color}\n");
}

TEST(SupportPagesTest, CommentsAndPageBreaks) {
  struct Case {
    const char* file;
    std::vector<std::string> pages;
  };
  const Case cases[] = {
      {"# only\n# comments\n", {""}},
      {"a\n$\nb\n$ rest ignored\n", {"a\n", "b\n", ""}},
      {"#x\none {hostname}\ntwo\n$\n\nthree", {"one {hostname}\ntwo\n", "\nthree\n"}},
      {"", {""}},
  };
  for (const Case& c : cases) {
    std::istringstream input(c.file);
    EXPECT_EQ(ParseSupportPages(input), c.pages) << c.file;
  }
}

TEST(SupportValuesTest, ToolOutput) {
  EXPECT_EQ(ParseThumbprint("SHA256 Fingerprint=AB:CD:EF\n"), "AB:CD:EF");
  EXPECT_EQ(ParseThumbprint("SHA1 Fingerprint=\n"), "");
  EXPECT_EQ(ParseThumbprint("sha1 Fingerprint=AB\n"), "");
  EXPECT_EQ(ParseThumbprint("unable to load certificate\n"), "");
  EXPECT_EQ(SecondWord("3072 SHA256:k9Xy root@tavi (RSA)\n"), "SHA256:k9Xy");
  EXPECT_EQ(SecondWord("3072\n"), "");
}

TEST(EnvironmentOverrideTest, UnsetVariableComesBackSetAndEmpty) {
  unsetenv("TULK_TEST_OVERRIDE");
  {
    EnvironmentOverride secure("TULK_TEST_OVERRIDE", "1");
    EXPECT_STREQ(std::getenv("TULK_TEST_OVERRIDE"), "1");
  }
  ASSERT_NE(std::getenv("TULK_TEST_OVERRIDE"), nullptr);
  EXPECT_STREQ(std::getenv("TULK_TEST_OVERRIDE"), "");
  setenv("TULK_TEST_OVERRIDE", "kept", 1);
  { EnvironmentOverride secure("TULK_TEST_OVERRIDE", "1"); }
  EXPECT_STREQ(std::getenv("TULK_TEST_OVERRIDE"), "kept");
}

TEST(ShellQuoteTest, PlainPathsStayAsTheyAre) {
  EXPECT_EQ(ShellQuote("/sbin/firmwareConfig.py"), "/sbin/firmwareConfig.py");
  EXPECT_EQ(ShellQuote("/tmp/a b/it's"), "'/tmp/a b/it'\\''s'");
}

}  // namespace
}  // namespace Tulk
