#include "runtime/AttributeFilter.h"

#include <curses.h>
#include <gtest/gtest.h>
#include <term.h>

#include <random>
#include <string>
#include <vector>

#include "ControlStream.h"
#include "KeyNames.h"
#include "VirtualTerminal.h"
#include "runtime/TerminalOutput.h"

namespace Tulk {
namespace {

using TulkTest::VisibleBytes;

struct FilterCase {
  const char* name;
  std::vector<std::string> updates;
  std::vector<std::string> sent;
  bool defaultColours = true;
};

TEST(AttributeFilterTest, SendsWhatChangesOnce) {
  const FilterCase cases[] = {
      {"a line-drawing run in curses' combined control keeps its colours",
       {"\x1b(B\x1b[m\x1b(0\x1b[0m\x1b[37m\x1b[42mqq\x1b(B\x1b[0m\x1b[37m\x1b[42mx\x1b(B\x1b[m"},
       {"\x1b(0\x1b[0;37;42mqq\x1b(Bx\x1b[m"}},
      {"only the colour that changed",
       {"\x1b[m\x1b[37m\x1b[43ma\x1b[30m\x1b[43mb\x1b[m"},
       {"\x1b[0;37;43ma\x1b[30mb\x1b[m"}},
      {"a change undone across a move costs nothing",
       {"\x1b[m\x1b[37ma\x1b[39m\x1b[5;1H\x1b[37mb\x1b[m"},
       {"\x1b[0;37ma\x1b[5;1Hb\x1b[m"}},
      {"an attribute switched off takes a reset and what stays",
       {"\x1b[0;1;37ma\x1b[0;37mb"},
       {"\x1b[0;1;37ma\x1b[0;37mb"}},
      {"a default colour is SGR 49 where the description has it",
       {"\x1b[0;1;37;42ma\x1b[0;1;37mb"},
       {"\x1b[0;1;37;42ma\x1b[49mb"}},
      {"... and a reset where it has not",
       {"\x1b[0;1;37;42ma\x1b[0;1;37mb"},
       {"\x1b[0;1;37;42ma\x1b[0;1;37mb"},
       false},
      {"dim and invisible go off by a reset",
       {"\x1b[0;2;37ma\x1b[22mb\x1b[0;8mc\x1b[28md"},
       {"\x1b[0;2;37ma\x1b[0;37mb\x1b[0;8mc\x1b[md"}},
      {"the Linux console's primary font is chosen once and kept through resets",
       {"\x1b[0;10;7m\x0fX\x1b[m\x0f", "\x1b[0;10;7m\x0fY\x1b[m\x0f"},
       {"\x0f\x1b[0;7;10mX\x1b[m", "\x1b[7mY\x1b[m"}},
      {"more than 16 numbers go out as two controls",
       {"\x1b[0;1;2;3m\x1b[4;5;7;8;9m\x1b[11;38;2;1;2;3m\x1b[48;5;17mX"},
       {"\x1b[0;1;2;3;4;5;7;8;9;11;38;2;1;2;3m\x1b[48;5;17mX"}},
      {"the state carries over from one update to the next",
       {"\x1b(B\x1b[mx", "\x1b(B\x1b[my"},
       {"\x1b(B\x1b[mx", "y"}},
      {"shifts go out only when they change",
       {"\x0f\x1b[m\x0elq\x0f\x1b[m\x0eqk\x0f\x1b[m"},
       {"\x0e\x1b[mlqqk\x0f"}},
      {"an SGR it cannot read goes out as it came, and so does all until a reset",
       {"\x1b[0;37ma\x1b[4:3mb\x1b[37mc\x1b[0;37md"},
       {"\x1b[0;37ma\x1b[4:3mb\x1b[37mc\x1b[0;37md"}},
      {"a restored cursor brings back attributes it cannot know",
       {"\x1b[0;37m\x1b"
        "7a\x1b[0;32m\x1b"
        "8\x1b[0;32mb"},
       {"\x1b[0;37m\x1b"
        "7a\x1b[32m\x1b"
        "8\x1b[0;32mb"}},
      {"control strings pass as they are",
       {"\x1b[0;37m\x1b]2;a;1m\ax\x1b]4;1;rgb:ff/00/00\x1b\\y"},
       {"\x1b[0;37m\x1b]2;a;1m\ax\x1b]4;1;rgb:ff/00/00\x1b\\y"}},
      {"a control cut off at the end of an update goes out with the next",
       {"\x1b[0;37ma\x1b[4", "2mb\x1b[42mc"},
       {"\x1b[0;37ma\x1b[4", "2mb\x1b[42mc"}},
  };
  for (const FilterCase& test : cases) {
    AttributeFilter filter(test.defaultColours);
    for (std::size_t i = 0; i < test.updates.size(); ++i) {
      EXPECT_EQ(VisibleBytes(filter.Filter(test.updates[i])), VisibleBytes(test.sent[i]))
          << test.name << ", update " << i;
    }
  }
}

TEST(AttributeFilterTest, ReadsOnlyAttributeControls) {
  for (const char* understood :
       {"\x1b(B\x1b[m", "\x1b[m\x0f$<2>", "\x1b[0;10;1;7m\x0e", "\x1b[38;5;200m", "\x1b[39;49m"}) {
    EXPECT_TRUE(AttributeFilter::Understands(understood)) << VisibleBytes(understood);
  }
  for (const char* foreign : {"\x1b[?5h$<100/>\x1b[?5l", "\x1b[3:1m", "\x1b[1;2H", "\x1b&dB", "abc",
                              "\x1b[4", "\x1b[21m", "\x1b[>4;1m"}) {
    EXPECT_FALSE(AttributeFilter::Understands(foreign)) << VisibleBytes(foreign);
  }
  EXPECT_TRUE(AttributeFilter::SetsDefaultColours("\x1b[39;49m"));
  EXPECT_TRUE(AttributeFilter::SetsDefaultColours("\x1b[49;39m"));
  for (const char* other : {"\x1b[39m", "\x1b[0m", "\x1b[39;49m\x1b[m", "\x1b[39;49;1m"}) {
    EXPECT_FALSE(AttributeFilter::SetsDefaultColours(other)) << VisibleBytes(other);
  }
}

// The descriptions of the terminals a console meets suit the filter; one
// without attributes does not.
TEST(AttributeFilterTest, SuitsTheCommonTerminals) {
  for (const char* term :
       {"linux", "vt100", "vt102", "vt220", "xterm", "xterm-256color", "screen"}) {
    int error = 0;
    ASSERT_EQ(setupterm(term, -1, &error), OK) << term;
    bool defaultColours = false;
    EXPECT_TRUE(DescriptionSuitsFilter(defaultColours)) << term;
    EXPECT_EQ(defaultColours, tigetnum("colors") > 0) << term;
    del_curterm(cur_term);
  }
  int error = 0;
  ASSERT_EQ(setupterm("dumb", -1, &error), OK);
  bool defaultColours = false;
  EXPECT_FALSE(DescriptionSuitsFilter(defaultColours));
  del_curterm(cur_term);
}

// Random streams of the kind curses writes (and worse), cut into updates:
// after every update both terminals show the same, and the next character
// would get the same attributes and character set.
TEST(AttributeFilterTest, FilteredUpdatesLookTheSame) {
  constexpr int kRows = 8;
  constexpr int kCols = 24;
  std::mt19937 random(20261123);
  for (int run = 0; run < 400; ++run) {
    std::string choices(160, '\0');
    for (char& c : choices) {
      c = static_cast<char>(random());
    }
    const std::vector<std::string> pieces = TulkTest::ControlStream(choices, kRows, kCols);
    AttributeFilter filter(run % 2 == 0);
    TulkTest::VirtualTerminal original(kRows, kCols);
    TulkTest::VirtualTerminal filtered(kRows, kCols);
    std::string all;
    for (std::size_t at = 0; at < pieces.size();) {
      std::string update;
      for (std::size_t count = 1 + random() % 12; count > 0 && at < pieces.size(); --count) {
        update += pieces[at++];
      }
      const std::string sent = filter.Filter(update);
      all += update;
      original.Write(update);
      filtered.Write(sent);
      ASSERT_EQ(original.Difference(filtered), "")
          << "run " << run << ": " << VisibleBytes(all) << "\nlast update sent as "
          << VisibleBytes(sent);
    }
    original.Write("lqk");
    filtered.Write(filter.Filter("lqk"));
    ASSERT_EQ(original.Difference(filtered), "") << "run " << run << ": " << VisibleBytes(all);
  }
}

}  // namespace
}  // namespace Tulk
