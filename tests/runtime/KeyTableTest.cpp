#include "runtime/KeyTable.h"

#include <curses.h>
#include <gtest/gtest.h>

#include <set>
#include <string>

namespace {

TEST(KeyTable, EveryRowIsUniqueAndStartsWithEscapeButBackspace) {
  std::set<std::string> seen;
  for (const Tulk::KeySequence& entry : Tulk::KeySequences()) {
    std::string sequence = entry.sequence;
    EXPECT_TRUE(seen.insert(sequence).second) << "duplicate sequence";
    if (sequence != "\x7f") {
      EXPECT_EQ(sequence.front(), '\x1b');
    }
  }
}

TEST(KeyTable, EscOGroupHasNoF10OrF11) {
  for (const Tulk::KeySequence& entry : Tulk::KeySequences()) {
    std::string sequence = entry.sequence;
    if (sequence.size() == 3 && sequence.compare(0, 2, "\x1bO") == 0) {
      EXPECT_NE(entry.key, KEY_F(10)) << sequence;
      EXPECT_NE(entry.key, KEY_F(11)) << sequence;
    }
  }
}

TEST(KeyTable, RegistrationOrderStartsWithResizeAndEndsWithBackspace) {
  auto table = Tulk::KeySequences();
  EXPECT_STREQ(table.front().sequence, "\x1bR");
  EXPECT_STREQ(table.back().sequence, "\x7f");
}

TEST(KeyTable, EscapeDelayComesFromTheEnvironmentOnlyWhenItIsAWholeNumber) {
  struct Case {
    const char* value;  // null: unset
    int delay;
  };
  const Case cases[] = {
      {nullptr, Tulk::kEscDelayMs},
      {"", Tulk::kEscDelayMs},
      {"0", 0},
      {"1000", 1000},
      {"60000", 60000},
      {"60001", Tulk::kEscDelayMs},
      {"-5", Tulk::kEscDelayMs},
      {"12ms", Tulk::kEscDelayMs},
      {" 12", Tulk::kEscDelayMs},
      {"99999999999999999999", Tulk::kEscDelayMs},
  };
  for (const Case& c : cases) {
    EXPECT_EQ(Tulk::EscapeDelay(c.value), c.delay) << (c.value != nullptr ? c.value : "unset");
  }
}

}  // namespace
