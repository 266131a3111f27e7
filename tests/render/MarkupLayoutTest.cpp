#include "render/MarkupLayout.h"

#include <gtest/gtest.h>

#include <map>
#include <string>

namespace {

struct LayoutCase {
  const char* name;
  const char* text;
  int width;
  const char* expected;
};

// Variables for the table: "v" and "host" have values, "empty" is a
// variable without a value, anything else is no variable.
bool TestVariables(std::string_view name, std::string& value) {
  static const std::map<std::string, std::string, std::less<>> kValues = {
      {"v", "cd ef"}, {"host", "esx01"}, {"long", "abcdef"}, {"empty", ""}, {"lines", "a\nb"}};
  auto found = kValues.find(name);
  if (found == kValues.end()) {
    return false;
  }
  value = found->second;
  return true;
}

class LayoutTable : public ::testing::TestWithParam<LayoutCase> {};

std::string CaseName(const ::testing::TestParamInfo<LayoutCase>& param) {
  return param.param.name;
}

TEST_P(LayoutTable, LaysOutAsExpected) {
  const LayoutCase& c = GetParam();
  EXPECT_EQ(Tulk::LayOutMarkup(c.text, c.width, TestVariables), c.expected)
      << "text: \"" << c.text << "\" width " << c.width;
}

const LayoutCase kWrapping[] = {
    {"EmptyText", "", 10, ""},
    {"FitsOnOneLine", "hello world", 11, "hello world"},
    {"WrapsAtTheLastBlank", "hello world", 8, "hello\nworld"},
    {"MovesEachWordWhole", "aa bbb cc", 5, "aa\nbbb\ncc"},
    {"BlankMeetingAFullLineBecomesTheBreak", "abcd efgh", 4, "abcd\nefgh"},
    {"LongWordIsBrokenHard", "abcdefghij", 4, "abcd\nefgh\nij"},
    {"NewlineStartsAFreshLine", "abc\nabcd", 4, "abc\nabcd"},
    {"TagsTakeNoRoom", "{foo}abcd", 4, "{foo}abcd"},
    {"TagsInsideAMovedWordMoveWithIt", "aa {color:white}bbb{/color}", 5,
     "aa\n{color:white}bbb{/color}"},
    {"TagsBeforeABreakingBlankStay", "aa {color:white}bb{/color} cc", 5,
     "aa {color:white}bb{/color}\ncc"},
    {"UnclosedBraceHidesTheRest", "abc{color:white def", 20, "abc"},
    {"ClosingBraceAloneIsText", "a}b", 5, "a}b"},
    {"ZeroWidthPutsEveryByteOnItsOwnLine", "ab", 0, "\na\nb"},
};
INSTANTIATE_TEST_SUITE_P(Wrapping, LayoutTable, ::testing::ValuesIn(kWrapping), CaseName);

const LayoutCase kAlignment[] = {
    {"RightEndsAtTheEdge", "{align:right}OK{/align}", 10, "        OK"},
    {"RightAfterText", "ab{align:right}OK{/align}", 10, "ab      OK"},
    {"RightKeepsColourTagsInsideTheSegment", "{align:right}{color:black}<Enter>{/color} OK{/align}",
     20, "          {color:black}<Enter>{/color} OK"},
    {"CenterUsesHalfTheRoom", "{align:center}abcd{/align}", 10, "   abcd"},
    {"CenterLeavesOnlyThatHalfForTheRest", "{align:center}abcd{/align}efg", 9, "  abcdef\ng"},
    {"PaddingCutsAtN", "{align:padding:10}abcdefghijklmn{/align}|", 40, "abcdefghij|"},
    {"PaddingFillsToN", "{align:padding:10}abcd{/align}|", 40, "abcd      |"},
    {"PaddingFillsOnlyTheRoomLeft", "{align:padding:10}ab{/align}c", 5, "ab   \nc"},
    {"PaddingWithoutDigitsIsZero", "{align:padding:abc}xyz{/align}|", 10, "|"},
    {"PaddingReadsLeadingDigits", "{align:padding:3x}abcdef{/align}|", 10, "abc|"},
    {"PaddedColumnsLikeAHeading",
     "  {align:padding:8}Name{/align}{align:padding:19}MAC Address{/align}|", 80,
     "  Name    MAC Address        |"},
    {"LeftIsWrittenAsItStands", "{align:left}ab{/align}cd", 10, "abcd"},
    {"NestedAlignIsIgnored", "{align:right}ab{align:right}cd{/align}ef{/align}", 10,
     "      abcd\nef"},
    {"AlignWithoutValueIsAnUnknownTag", "{align}ab", 10, "{align}ab"},
    {"CloseWithoutOpenChangesNothing", "ab{/align}cd", 10, "abcd"},
    {"RightOnALaterLine", "x\n{align:right}y{/align}", 4, "x\n   y"},
    {"WrappedRightSegmentAlignsItsLastLine", "{align:right}aaa bbb{/align}", 5, "aaa\n  bbb"},
};
INSTANTIATE_TEST_SUITE_P(Alignment, LayoutTable, ::testing::ValuesIn(kAlignment), CaseName);

const LayoutCase kTags[] = {
    {"UnknownColourNameIsKept", "{color:black>}x{/color}", 10, "{color:black>}x{/color}"},
    {"ColourWithoutValueIsKept", "{color}x", 10, "{color}x"},
    {"VariableIsReplaced", "Host: {host}.", 20, "Host: esx01."},
    {"VariableWithColonIsNoVariable", "{host:x}", 20, "{host:x}"},
    {"UnknownVariableIsKept", "{nope}", 20, "{nope}"},
    {"EmptyVariableTakesNoRoom", "a{empty}b", 20, "ab"},
    {"VariableIsBrokenHardNotWordWrapped", "ab {v}", 5, "ab cd\n ef"},
    {"VariableEndsAtAFullPaddingField", "{align:padding:4}{long}{/align}|", 20, "abcd|"},
    {"NewlineInAVariableBreaksTheLine", "{lines}c", 20, "a\nbc"},
};
INSTANTIATE_TEST_SUITE_P(Tags, LayoutTable, ::testing::ValuesIn(kTags), CaseName);

TEST(LayoutTest, WithoutVariableLookupNoTagIsAVariable) {
  EXPECT_EQ(Tulk::LayOutMarkup("{host}x", 10, {}), "{host}x");
}

}  // namespace
