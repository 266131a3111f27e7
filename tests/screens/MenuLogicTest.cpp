// Pure logic of the System Customization menu: log choice by digit and the
// log list, support pages, tool output parsing, environment override, the
// cache of file-derived values.

#include <gtest/gtest.h>

#include <unistd.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <sstream>

#include "screens/EnvironmentOverride.h"
#include "screens/FileValueCache.h"
#include "screens/LogTable.h"
#include "screens/SupportPages.h"
#include "screens/SupportValues.h"

namespace Tulk {
namespace {

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

}  // namespace
}  // namespace Tulk

TEST(FileValueCacheTest, ComputesAgainOnlyWhenTheFileChanges) {
  const std::filesystem::path path =
      std::filesystem::temp_directory_path() / ("tulk-cache-" + std::to_string(getpid()));
  std::filesystem::remove(path);
  int computed = 0;
  Tulk::FileValueCache cache(path.string(), [&] { return "value " + std::to_string(++computed); });

  EXPECT_EQ(cache.Get(), "value 1");  // missing file: computed once
  EXPECT_EQ(cache.Get(), "value 1");
  std::ofstream(path) << "first";
  EXPECT_EQ(cache.Get(), "value 2");  // appeared
  EXPECT_EQ(cache.Get(), "value 2");
  std::ofstream(path) << "second, longer";
  EXPECT_EQ(cache.Get(), "value 3");  // changed
  std::filesystem::remove(path);
  EXPECT_EQ(cache.Get(), "value 4");  // went away
  EXPECT_EQ(computed, 4);
}
