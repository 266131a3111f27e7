#include "toolkit/InputField.h"

#include <curses.h>
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "include/Keys.h"
#include "render/MarkupLayout.h"

namespace {

using Tulk::InputField;

struct KeyCase {
  const char* name;
  InputField start;
  std::vector<int> keys;
  std::string value;
  std::size_t cursor;
  std::size_t scroll;
};

InputField Edited(std::string value, std::size_t cursor, std::size_t scroll = 0) {
  InputField state = InputField::WithValue(std::move(value));
  state.cursor = cursor;
  state.scroll = scroll;
  state.pristine = false;
  return state;
}

class KeyTable : public ::testing::TestWithParam<KeyCase> {};

std::string CaseName(const ::testing::TestParamInfo<KeyCase>& param) {
  return param.param.name;
}

TEST_P(KeyTable, EditsAsExpected) {
  const KeyCase& c = GetParam();
  InputField state = c.start;
  for (int key : c.keys) {
    state = InputField::HandleKey(state, key);
    EXPECT_FALSE(state.pristine) << "key " << key;
    ASSERT_LE(state.cursor, state.value.size());
  }
  EXPECT_EQ(state.value, c.value);
  EXPECT_EQ(state.cursor, c.cursor);
  EXPECT_EQ(state.scroll, c.scroll);
}

const KeyCase kKeys[] = {
    {"PrintableKeyReplacesPristineValue", InputField::WithValue("root"), {'x'}, "x", 1, 0},
    {"LeftThenKeyInsertsBeforeTheLast",
     InputField::WithValue("root"),
     {KEY_LEFT, 'x'},
     "rooxt",
     4,
     0},
    {"HomeKeepsTheValue", InputField::WithValue("root"), {KEY_HOME, 'x'}, "xroot", 1, 0},
    {"BackspaceOnPristineEmpties", InputField::WithValue("abc"), {KEY_BACKSPACE}, "", 0, 0},
    {"DeleteOnPristineEmpties", InputField::WithValue("abc"), {KEY_DC}, "", 0, 0},
    {"OtherKeyOnPristineEmpties", InputField::WithValue("abc"), {KEY_F(1)}, "", 0, 0},
    {"BackspaceAtZeroDoesNothing",
     InputField::WithValue("ab"),
     {KEY_HOME, KEY_BACKSPACE},
     "ab",
     0,
     0},
    {"CtrlHIsBackspace", InputField::WithValue("abc"), {KEY_END, Tulk::kKeyCtrlH}, "ab", 2, 0},
    {"DeleteRemovesAtTheCursor", InputField::WithValue("abc"), {KEY_HOME, KEY_DC}, "bc", 0, 0},
    {"DeleteAtTheEndDoesNothing", InputField::WithValue("abc"), {KEY_END, KEY_DC}, "abc", 3, 0},
    {"RightStopsAtTheEnd", InputField::WithValue("ab"), {KEY_RIGHT, KEY_RIGHT}, "ab", 2, 0},
    {"LeftStopsAtZero", InputField::WithValue("a"), {KEY_LEFT, KEY_LEFT}, "a", 0, 0},
    {"EndOnEmptyValue", InputField::WithValue(""), {KEY_END}, "", 0, 0},
    {"OtherKeyOnEditedValueDoesNothing", Edited("abc", 1), {KEY_F(1), KEY_UP, 200}, "abc", 1, 0},
    {"NonAsciiIsNotInserted", InputField::WithValue("abc"), {0xe9}, "", 0, 0},
    {"LeftAtTheFirstShownByteScrollsBack", Edited("abcdefgh", 4, 4), {KEY_LEFT}, "abcdefgh", 3, 3},
    {"BackspaceCrossingTheScrollJumpsToTheEnd",
     Edited("abcdefgh", 3, 3),
     {KEY_BACKSPACE},
     "abdefgh",
     7,
     0},
    {"BackspaceInsideTheShownPart", Edited("abcdefgh", 5, 3), {KEY_BACKSPACE}, "abcdfgh", 4, 3},
};
INSTANTIATE_TEST_SUITE_P(InputField, KeyTable, ::testing::ValuesIn(kKeys), CaseName);

TEST(InputRowTest, PristineFocusedValueShowsBlackOnWhiteAndTheRowFillsItsWidth) {
  InputField::Row row =
      InputField::FormatRow(InputField::WithValue("root"), "Name:", 40, 10, true, false);
  EXPECT_EQ(row.text, "Name:" + std::string(20, ' ') +
                          " [ {bgcolor:white}{color:black}root{/color}{/bgcolor}       ]");
  EXPECT_EQ(row.cursorColumn, 32);
  EXPECT_EQ(Tulk::LayOutMarkup(row.text, 40, {}).find('\n'), std::string::npos);
}

TEST(InputRowTest, EditedFocusedValueShowsWhiteOnBlackAndUnfocusedHasNoColours) {
  InputField edited = Edited("root", 4);
  EXPECT_NE(InputField::FormatRow(edited, "A:", 30, 8, true, false)
                .text.find("{bgcolor:black}{color:white}root{/color}{/bgcolor}"),
            std::string::npos);
  EXPECT_EQ(InputField::FormatRow(edited, "A:", 30, 8, false, false).text,
            "A:" + std::string(15, ' ') + " [ root     ]");
}

TEST(InputRowTest, MaskedFieldShowsOneAsteriskPerShownByte) {
  InputField::Row row = InputField::FormatRow(Edited("secret", 6), "P:", 30, 8, false, true);
  EXPECT_NE(row.text.find("[ ******   ]"), std::string::npos);
  EXPECT_EQ(row.text.find("secret"), std::string::npos);
}

TEST(InputRowTest, FieldScrollsToKeepTheCursorInside) {
  const std::string value = "abcdefghijklmno";
  InputField::Row end =
      InputField::FormatRow(InputField::WithValue(value), "", 30, 10, false, false);
  EXPECT_EQ(end.scroll, 5u);
  EXPECT_NE(end.text.find("[ fghijklmno ]"), std::string::npos);
  EXPECT_EQ(end.cursorColumn, 28);

  // Typing past the edge scrolls one byte per key.
  InputField typed = InputField::WithValue(value);
  typed.scroll = end.scroll;
  typed = InputField::HandleKey(InputField::HandleKey(typed, KEY_END), 'p');
  EXPECT_EQ(InputField::FormatRow(typed, "", 30, 10, false, false).scroll, 6u);

  // Home shows the start of the value again.
  InputField home = InputField::HandleKey(typed, KEY_HOME);
  home.scroll = 6;
  InputField::Row start = InputField::FormatRow(home, "", 30, 10, false, false);
  EXPECT_EQ(start.scroll, 0u);
  EXPECT_NE(start.text.find("[ abcdefghij ]"), std::string::npos);
  EXPECT_EQ(start.cursorColumn, 30 - 2 - 10);
}

TEST(InputRowTest, WidthMinusOneIsHalfTheRowMinusOne) {
  EXPECT_EQ(InputField::ResolveWidth(-1, 40), 19);
  InputField::Row row = InputField::FormatRow(Edited("ab", 2), "L", 40, -1, false, false);
  EXPECT_EQ(row.text, "L" + std::string(15, ' ') + " [ ab" + std::string(17, ' ') + " ]");
}

}  // namespace
