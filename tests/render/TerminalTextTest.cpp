// Host text made safe for the terminal: what is kept, blanked and dropped.

#include <gtest/gtest.h>

#include <string>

#include "render/TerminalText.h"

namespace {

TEST(TerminalText, KeepsTextBlanksControlsAndInvalidBytesDropsBidiControls) {
  const struct {
    const char* what;
    std::string in;
    std::string out;
  } cases[] = {
      {"ASCII and UTF-8 text", "tavi-01 \xc3\xa9t\xc3\xa9 \xe2\x94\x82 \xf0\x9f\x98\x80",
       "tavi-01 \xc3\xa9t\xc3\xa9 \xe2\x94\x82 \xf0\x9f\x98\x80"},
      {"C0 controls and DEL", "a\x1b]52;c;x\x07z\x7f", "a ]52;c;x z "},
      {"C1 control (CSI)",
       "c\xc2\x9b"
       "2J",
       "c 2J"},
      {"first character after C1", "\xc2\xa0", "\xc2\xa0"},
      {"bidi override, marks, isolates",
       "d\xe2\x80\xae"
       "e\xe2\x80\x8f"
       "f\xe2\x81\xa6"
       "g\xd8\x9c",
       "defg"},
      {"lone continuation and lead bytes", "x\x80y\xc3", "x y "},
      {"overlong encoding of '/'", "\xc0\xaf", "  "},
      {"encoded surrogate", "\xed\xa0\x80", "   "},
      {"beyond U+10FFFF", "\xf4\x90\x80\x80", "    "},
  };
  for (const auto& test : cases) {
    SCOPED_TRACE(test.what);
    EXPECT_EQ(Tulk::TerminalSafe(test.in), test.out);
    EXPECT_EQ(Tulk::IsTerminalSafe(test.in), test.in == test.out);
  }
}

}  // namespace
