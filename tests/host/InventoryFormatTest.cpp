// The inventory's text formats: memory size, switch summary, name lists.
// Pure functions of their input.

#include <gtest/gtest.h>

#include <cstdint>
#include <string>

#include "host/HardwareInventory.h"
#include "host/SwitchSummary.h"
#include "host/VlanInput.h"

namespace {

constexpr std::uint64_t kMiB = 1024ull * 1024;
constexpr std::uint64_t kGiB = 1024 * kMiB;
constexpr std::uint64_t kTiB = 1024 * kGiB;
constexpr std::uint64_t kPiB = 1024 * kTiB;

TEST(FormatMemoryBytesTest, RoundsUpToQuarterGibibytesAndCutsTheDecimal) {
  struct Case {
    std::uint64_t bytes;
    const char* text;
  };
  const Case cases[] = {
      {8 * kGiB, "8 GB"},
      {6 * kGiB - 1, "6 GB"},
      {2 * kGiB + 768 * kMiB, "2.7 GB"},  // 2.75: cut, not rounded
      {512 * kMiB, "512 MB"},
      {1 * kGiB, "1 GB"},
      {1 * kGiB + 1, "1.2 GB"},  // goes up to 1.25
      {1, "256 MB"},
      {0, "0 MB"},
      {1023 * kMiB, "1 GB"},  // 1023 MiB rounds to 1024 MiB
      {kTiB + 512 * kGiB, "1.5 TB"},
      {3 * kPiB, "3 PB"},
      {2048 * kPiB, "2048 PB"},  // the unit table ends at P
  };
  for (const Case& c : cases) {
    EXPECT_EQ(Tulk::FormatMemoryBytes(c.bytes), c.text) << c.bytes;
  }
}

TEST(SwitchSummaryTest, FormatsCountsAndNameLists) {
  Tulk::SwitchSummary summary{
      "vSwitch0", {"hynic0", "hynic1"}, {"Management Network", "VM Network"}, 128, 5, 128};
  EXPECT_EQ(Tulk::FormatSwitchSummary(summary),
            "Number of ports: 128\nUsed ports: 5\nConfigured ports: 128\n"
            "Uplinks: hynic0,hynic1\nPort groups: Management Network,VM Network");

  Tulk::SwitchSummary bare{"vSwitch9", {}, {}, -1, 0, 0};
  EXPECT_EQ(Tulk::FormatSwitchSummary(bare),
            "Number of ports: -1\nUsed ports: 0\nConfigured ports: 0\nUplinks: None\n"
            "Port groups: None");
}

}  // namespace

namespace {

TEST(VlanInputTest, EmptyIsNoVlanAndOnlyOneTo4095AreIds) {
  using Kind = Tulk::VlanInput::Kind;
  struct Case {
    const char* text;
    Kind kind;
    int id;
  };
  const Case cases[] = {
      {"", Kind::kNone, 0},
      {"1", Kind::kVlan, 1},
      {"4094", Kind::kVlan, 4094},
      {"0042", Kind::kVlan, 42},
      {"4095", Kind::kAllVlans, 4095},
      {"0", Kind::kInvalid, 0},
      {"4096", Kind::kInvalid, 0},
      {"99999999999999999999", Kind::kInvalid, 0},
      {"12a", Kind::kInvalid, 0},
      {"-1", Kind::kInvalid, 0},
  };
  for (const Case& c : cases) {
    const Tulk::VlanInput input = Tulk::VlanInput::Parse(c.text);
    EXPECT_EQ(input.kind, c.kind) << c.text;
    EXPECT_EQ(input.id, c.id) << c.text;
  }
}

}  // namespace
