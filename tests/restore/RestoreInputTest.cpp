// The names an operator may give new switches and portgroups, and the
// first free names the standard-switch restore picks.

#include <gtest/gtest.h>

#include <set>
#include <string>

#include "host/StandardSwitchMove.h"
#include "restore/RestoreInput.h"

namespace {

using namespace Tulk;

TEST(RestoreInputTest, SwitchAndPortGroupNames) {
  struct Case {
    std::string name;
    bool switchName;
    bool portGroupName;
  };
  const Case cases[] = {
      {"vSwitch2", true, true},
      {"vs-backup_1.lab", true, true},
      {"Management Network2", false, true},
      {"", false, false},
      {" leading", false, false},
      {"trailing ", false, false},
      {"-vs", false, true},
      {"_vs", false, true},
      {std::string(31, 'a'), true, true},
      {std::string(32, 'a'), false, true},
      {std::string(59, 'a'), false, true},
      {std::string(60, 'a'), false, false},
      {"tab\tname", false, false},
      {"caf\xc3\xa9", false, false},
  };
  for (const Case& c : cases) {
    EXPECT_EQ(IsValidSwitchName(c.name), c.switchName) << "[" << c.name << "]";
    EXPECT_EQ(IsValidPortGroupName(c.name), c.portGroupName) << "[" << c.name << "]";
  }
}

TEST(RestoreInputTest, FirstFreeNames) {
  struct Case {
    std::set<std::string> taken;
    std::string switchName;
    std::string portGroup;
  };
  const Case cases[] = {
      {{}, "vSwitch0", "Management Network1"},
      {{"vSwitch0", "vSwitch1", "Management Network1"}, "vSwitch2", "Management Network2"},
      {{"vSwitch1", "Management Network", "Management Network2"},
       "vSwitch0",
       "Management Network1"},
      {{"vSwitch0", "vSwitch1", "vSwitch2", "vSwitch3", "vSwitch4", "vSwitch5", "vSwitch6",
        "vSwitch7", "vSwitch8", "vSwitch9"},
       "vSwitch10",
       "Management Network1"},
  };
  for (const Case& c : cases) {
    const auto taken = [&](const std::string& name) { return c.taken.count(name) > 0; };
    EXPECT_EQ(FirstFreeSwitchName(taken), c.switchName);
    EXPECT_EQ(FirstFreeManagementPortGroupName(taken), c.portGroup);
  }
}

}  // namespace
