// How a typed timeout field is read: the day-long limit, leading zeros and
// the fields' five digits.

#include <gtest/gtest.h>

#include "host/TimeoutOptions.h"

namespace {

using Tulk::ReadTimeoutInput;
using Kind = Tulk::TimeoutInput::Kind;

TEST(TimeoutInputTest, LimitIsOneDayInclusive) {
  struct Case {
    const char* field;
    Kind kind;
    std::uint32_t minutes;
  };
  const Case cases[] = {
      {"", Kind::kEmpty, 0},
      {"0", Kind::kValid, 0},
      {"00000", Kind::kValid, 0},
      {"1440", Kind::kValid, 1440},
      {"01440", Kind::kValid, 1440},
      {"1441", Kind::kTooLarge, 0},
      {"99999", Kind::kTooLarge, 0},
      {"00144", Kind::kValid, 144},
      {"4294967296", Kind::kTooLarge, 0},
      {"12a", Kind::kTooLarge, 0},
  };
  for (const Case& c : cases) {
    const Tulk::TimeoutInput input = ReadTimeoutInput(c.field);
    EXPECT_EQ(input.kind, c.kind) << '"' << c.field << '"';
    EXPECT_EQ(input.minutes, c.minutes) << '"' << c.field << '"';
  }
}

}  // namespace
