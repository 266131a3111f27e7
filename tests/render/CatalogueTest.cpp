#include <gtest/gtest.h>

#include <cstdlib>
#include <string>

#include "render/HostValues.h"
#include "render/StringFactory.h"

namespace {

Tulk::StringFactory& Catalogue() {
  return *Tulk::GetStringFactory("en_US");
}

TEST(CatalogueTest, ThreeAndEveryNumberAboveTheLastAreEmpty) {
  EXPECT_STREQ(Catalogue().GetString(3), "");
  for (unsigned id : {292u, 293u, 1000u, 0xffffffffu}) {
    EXPECT_STREQ(Catalogue().GetString(id), "") << id;
  }
  EXPECT_STREQ(Catalogue().GetString(291),
               "Please choose which Hykernel NIC should be migrated to which portgroup/switch.");
}

TEST(CatalogueTest, VersionLineFollowsTheSourceAndKeepsTheLastGoodText) {
  // The child re-runs this test in a fresh process, where the catalogue has
  // not yet handed out a version line.
  GTEST_FLAG_SET(death_test_style, "threadsafe");
  EXPECT_EXIT(
      {
        Tulk::SetVersionLineSource([](std::string&) { return false; });
        std::exit(std::string(Catalogue().GetString(2)).empty() ? 0 : 1);
      },
      ::testing::ExitedWithCode(0), "");

  bool fail = false;
  std::string version = "Brimlo 8.0.1 (HyKernel 8.0.1 Build 123)";
  Tulk::SetVersionLineSource([&](std::string& line) {
    if (fail) {
      return false;
    }
    line = version;
    return true;
  });
  const char* first = Catalogue().GetString(2);
  EXPECT_STREQ(first, "Brimlo 8.0.1 (HyKernel 8.0.1 Build 123)");
  version = "Brimlo 8.0.2 (HyKernel 8.0.2 Build 456)";
  EXPECT_STREQ(Catalogue().GetString(2), "Brimlo 8.0.2 (HyKernel 8.0.2 Build 456)");
  fail = true;
  EXPECT_STREQ(Catalogue().GetString(2), "Brimlo 8.0.2 (HyKernel 8.0.2 Build 456)");
  // A pointer handed out earlier still holds its text.
  EXPECT_STREQ(first, "Brimlo 8.0.1 (HyKernel 8.0.1 Build 123)");
  Tulk::SetVersionLineSource({});
}

TEST(CatalogueTest, OnlyEnUsCreatesTheCatalogueAndLaterCallsShareIt) {
  // A fresh process: no catalogue exists yet.
  GTEST_FLAG_SET(death_test_style, "threadsafe");
  EXPECT_EXIT(
      {
        bool ok = Tulk::GetStringFactory("de_DE") == nullptr;
        Tulk::StringFactory* created = Tulk::GetStringFactory("en_US");
        ok = ok && created != nullptr && Tulk::GetStringFactory("de_DE") == created &&
             Tulk::GetStringFactory("en_US") == created;
        std::exit(ok ? 0 : 1);
      },
      ::testing::ExitedWithCode(0), "");
}

}  // namespace
