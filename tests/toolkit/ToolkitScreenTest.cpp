// The toolkit on a real terminal: the test-only demo program runs the
// console's start-up and key loop and opens one scene; the screen is read
// through the terminal emulator.

#include <gtest/gtest.h>

#include <string>

#include "TestConsole.h"
#include "ToolkitScene.h"
#include "include/ColorNumbers.h"

namespace {

using namespace std::chrono_literals;
using namespace Tulk;
using ToolkitTest::Scene;
using TulkTest::Options;
using TulkTest::TestConsole;

// `count` cells of a row from `col` on (Row() is UTF-8, so line-drawing
// characters make its byte offsets differ from columns).
std::string Cells(const TestConsole& console, int row, int col, int count) {
  std::string text;
  for (int c = col; c < col + count; ++c) {
    text += console.At(row, c).text;
  }
  return text;
}

::testing::AssertionResult HasColors(const TestConsole& console, int row, int col, int bg, int fg) {
  TulkTest::Cell cell = console.At(row, col);
  if (cell.bg == bg && cell.fg == fg) {
    return ::testing::AssertionSuccess();
  }
  return ::testing::AssertionFailure() << "cell " << row << "," << col << " is " << cell.bg << "/"
                                       << cell.fg << ", expected " << bg << "/" << fg << "\n"
                                       << console.Dump();
}

// Where a dialog's parts sit and their colours: WindowTest, on curses' own
// screen. Here: the terminal shows them, the key loop runs the dialog, and
// its owner is dimmed while it runs and restored after.
TEST(ToolkitScreen, LowDialogShowsItsPartsDimsItsOwnerAndEndsByEscOrEnter) {
  TestConsole console(Scene("dialog"));
  for (const char* key : {"Esc", "Enter"}) {
    ASSERT_TRUE(console.WaitForText("Demo Dialog"));
    ASSERT_TRUE(console.WaitReady());
    EXPECT_EQ(Cells(console, 9, 13, 11), "Demo Dialog");
    EXPECT_EQ(Cells(console, 11, 13, 23), "Header text of the demo");
    EXPECT_EQ(Cells(console, 15, 44, 25), "<Enter> OK  <Esc> Cancel ");
    EXPECT_TRUE(HasColors(console, 11, 13, kDarkGrey, kLightGrey));  // header text
    EXPECT_TRUE(HasColors(console, 1, 2, kBlack, kDarkGrey));
    EXPECT_TRUE(HasColors(console, 0, 0, kBlack, kDarkGrey));
    console.Key(key);
    ASSERT_TRUE(console.WaitForText(key == std::string("Esc") ? "result: 0" : "result: 1"));
    ASSERT_TRUE(console.WaitReady());
    EXPECT_TRUE(HasColors(console, 1, 2, kBlack, kWhite));
    EXPECT_TRUE(HasColors(console, 0, 0, kBlack, kWhite));
    EXPECT_FALSE(console.Contains("Demo Dialog"));
    console.Type("o");
  }
}

// A message dialog ignores Esc and closes with Enter; keys typed while it
// closes are discarded.
TEST(ToolkitScreen, MessageDialogClosesOnlyWithEnterAndDiscardsKeysTypedMeanwhile) {
  TestConsole console(Scene("message"));
  ASSERT_TRUE(console.WaitForText("The new password and the confirmed password do not"));
  console.Key("Esc");
  console.Type("n");
  ASSERT_TRUE(console.WaitReady());
  EXPECT_TRUE(console.Contains("Configure Password: Error"));
  EXPECT_FALSE(console.Contains("result:"));
  console.Send("\rxy");
  ASSERT_TRUE(console.WaitReady());
  EXPECT_TRUE(console.Contains("result: 1")) << console.Dump();
  EXPECT_FALSE(console.Contains("key:")) << console.Dump();
  console.Type("z");
  EXPECT_TRUE(console.WaitForText("key: z"));
}

TEST(ToolkitScreen, MonochromeDimsInStandoutAndShowsAnActiveBodyPlain) {
  Options options = Scene("dialog");
  options.term = "vt102";
  TestConsole console(options);
  ASSERT_TRUE(console.WaitForText("Demo Dialog"));
  ASSERT_TRUE(console.WaitReady());
  EXPECT_TRUE(console.At(1, 2).reverse) << console.Dump();  // the dimmed owner
  EXPECT_TRUE(console.At(20, 40).reverse);
  EXPECT_TRUE(console.At(9, 13).reverse);    // header: dark grey
  EXPECT_FALSE(console.At(14, 40).reverse);  // body: yellow
  EXPECT_FALSE(console.At(15, 44).reverse);  // footer text on the body
}

TEST(ToolkitScreen, IdleDialogDimsAndTheWakingKeyRestoresIt) {
  Options options = Scene("dialog");
  options.timeScale = 120;  // the minute passes in half a second
  TestConsole console(options);
  ASSERT_TRUE(console.WaitForText("Demo Dialog"));
  // Header and body dim together.
  ASSERT_TRUE(console.WaitUntil(
      [&] {
        return HasColors(console, 9, 13, kBlack, kDarkGrey) &&
               HasColors(console, 14, 40, kBlack, kDarkGrey);
      },
      "the dimmed dialog"));
  console.Type("x");
  ASSERT_TRUE(console.WaitReady());
  EXPECT_TRUE(HasColors(console, 9, 13, kDarkGrey, kWhite));
  EXPECT_TRUE(HasColors(console, 14, 40, kYellow, kWhite));
  EXPECT_TRUE(HasColors(console, 1, 2, kBlack, kDarkGrey));  // the owner stays dimmed
}

TEST(ToolkitScreen, IdleTimeoutPassesThroughTheOpenFrames) {
  Options options = Scene("input");
  options.timeScale = 600;  // the default ten minutes pass in one second
  TestConsole console(options);
  ASSERT_TRUE(console.WaitForText("Login Name:"));
  ASSERT_TRUE(console.WaitUntil(
      [&] {
        return console.Contains("timed out, current window cleared") &&
               !console.Contains("Login Name:") && !console.Cursor().visible;
      },
      "the cleared window without the input field and its cursor"));
  console.Type("k");
  EXPECT_TRUE(console.WaitForText("key: k"));
}

TEST(ToolkitScreen, RootWindowShowsItsPartsMovesOverDisabledEntriesAndRunsActions) {
  TestConsole console(Scene("menu"));
  ASSERT_TRUE(console.WaitReady());
  ASSERT_TRUE(console.WaitForLog("COLS=80, LINES=25"));
  // The frame, the left title and footer: WindowTest. Here what the menu
  // puts in them.
  EXPECT_EQ(Cells(console, 1, 42, 18), "Configure Password");
  EXPECT_TRUE(HasColors(console, 1, 42, kDarkGrey, kWhite));      // right title
  EXPECT_TRUE(HasColors(console, 6, 42, kDarkGrey, kLightGrey));  // description
  EXPECT_TRUE(HasColors(console, 4, 42, kDarkGrey, kWhite));      // its white word
  EXPECT_EQ(Cells(console, 22, 2, 16), "<Up/Down> Select");
  EXPECT_TRUE(HasColors(console, 22, 41, kDarkGrey, kWhite));  // right footer's "<Esc>"
  // The version line is centred on the status line.
  const std::string version = "Demo Hypervisor 8.0.1 (HyKernel 8.0.1 Build 1234)";
  EXPECT_EQ(Cells(console, 24, 40 - static_cast<int>(version.size()) / 2,
                  static_cast<int>(version.size())),
            version);
  EXPECT_TRUE(HasColors(console, 24, 40, kBlack, kLightGrey));
  // The current entry is white on black, a disabled one dark grey.
  EXPECT_TRUE(HasColors(console, 4, 3, kBlack, kWhite));
  EXPECT_TRUE(HasColors(console, 5, 3, kYellow, kBlack));
  EXPECT_TRUE(HasColors(console, 7, 3, kYellow, kDarkGrey));

  // Moves pass over disabled entries with few bytes a key.
  std::size_t before = console.BytesReceived();
  console.Key("Down");
  ASSERT_TRUE(console.WaitReady());
  EXPECT_TRUE(console.Contains("Description of Configure Lockdown")) << console.Dump();
  EXPECT_LT(console.BytesReceived() - before, 600u);
  // The next Down passes the separator and the disabled entry.
  console.Key("Down");
  ASSERT_TRUE(console.WaitReady());
  ASSERT_TRUE(console.Contains("Description of View System Logs")) << console.Dump();
  EXPECT_TRUE(HasColors(console, 8, 3, kBlack, kWhite));
  console.Key("Down");
  ASSERT_TRUE(console.WaitReady());
  EXPECT_TRUE(console.Contains("Description of View System Logs"));
  // Enter runs the entry's action; as it asks to show the menu again, the
  // menu starts from the first entry.
  console.Key("Enter");
  ASSERT_TRUE(console.WaitForText("Opened View System Logs"));
  console.Key("Enter");
  ASSERT_TRUE(console.WaitReady());
  EXPECT_FALSE(console.Contains("Opened View System Logs"));
  EXPECT_TRUE(console.Contains("Description of Configure Password"));
  console.Key("Esc");
  EXPECT_TRUE(console.WaitForText("result: 1"));
  // A normal end: every window freed (the sanitizer build checks for leaks).
  console.Type("q");
  EXPECT_EQ(console.WaitExit(), 0);
}

TEST(ToolkitScreen, InputFieldEditsWithTheCursorInItAndMasksThePassword) {
  TestConsole console(Scene("input"));
  ASSERT_TRUE(console.WaitForText("Login Name:"));
  ASSERT_TRUE(console.WaitReady());
  // The current field: pristine, black on white, the cursor after "root".
  // The list's first row is at screen row 13; its text area starts at
  // column 13 and is 53 wide, so the 30-column field's value starts at 34.
  const int fieldRow = 13;
  const int root = 34;
  ASSERT_EQ(Cells(console, fieldRow, 13, 11), "Login Name:") << console.Dump();
  ASSERT_EQ(Cells(console, fieldRow, root, 4), "root") << console.Dump();
  EXPECT_TRUE(HasColors(console, fieldRow, root, kWhite, kBlack));
  EXPECT_TRUE(console.Cursor().visible);
  EXPECT_EQ(console.Cursor().row, fieldRow);
  EXPECT_EQ(console.Cursor().col, root + 4);

  console.Key("End");
  ASSERT_TRUE(console.WaitReady());
  EXPECT_TRUE(HasColors(console, fieldRow, root, kBlack, kWhite));
  std::size_t before = console.BytesReceived();
  console.Type("s");
  ASSERT_TRUE(console.WaitReady());
  EXPECT_TRUE(console.Contains("roots")) << console.Dump();
  EXPECT_LT(console.BytesReceived() - before, 40u);
  EXPECT_EQ(console.Cursor().col, root + 5);

  console.Key("Down");
  console.Type("pw");
  ASSERT_TRUE(console.WaitForText("[ **"));
  EXPECT_FALSE(console.Contains("pw"));
  console.Key("Enter");
  EXPECT_TRUE(console.WaitForText("result: 1 values: roots/pw"));
  EXPECT_FALSE(console.Cursor().visible);
}

TEST(ToolkitScreen, CarouselStepsAndOpensTheDetailsOfItsEntry) {
  TestConsole console(Scene("carousel"));
  ASSERT_TRUE(console.WaitForText("Portgroup Name"));
  ASSERT_TRUE(console.WaitForText("< Management Network"));
  console.Key("Right");
  ASSERT_TRUE(console.WaitForText("< VM Network"));
  console.Type("d");
  ASSERT_TRUE(console.WaitForText("Portgroup Details"));
  EXPECT_TRUE(console.WaitForText("Portgroup Name: VM Network"));
  EXPECT_TRUE(console.WaitForText("VLAN ID: 20"));
  console.Key("Enter");
  ASSERT_TRUE(console.WaitForTextGone("Portgroup Details"));
  EXPECT_TRUE(console.WaitForText("< VM Network"));
  console.Key("Enter");
  EXPECT_TRUE(console.WaitForText("result: 1"));
  console.Type("q");
  EXPECT_EQ(console.WaitExit(), 0);
}

}  // namespace
