// What the console sends its terminal: the line-drawing set where the
// terminal has one, and one update per key, never a picture that the same
// key paints over.

#include <signal.h>

#include <string>

#include "ScreenTestSupport.h"
#include "include/ColorNumbers.h"

namespace {

using namespace TulkTest;

constexpr char kWelcomeFooter[] = "Customize System/View Logs";

int Occurrences(const std::string& text, const std::string& part) {
  int count = 0;
  for (auto at = text.find(part); at != std::string::npos; at = text.find(part, at + 1)) {
    ++count;
  }
  return count;
}

// Ends the console as a terminating signal does, so that pam_wrapper
// removes its state folder.
void Close(TestConsole& console) {
  console.Signal(SIGTERM);
  EXPECT_EQ(console.WaitExit(), 0);
}

std::string Repeated(const std::string& text, int times) {
  std::string out;
  for (int i = 0; i < times; ++i) {
    out += text;
  }
  return out;
}

// Horizontal lines go out in the terminal's line-drawing set; a login then
// sends the menu without the welcome screen between.
TEST(ScreenUpdateScreenTest, LineDrawingSetAndLoginWithoutTheWelcomeScreenBetween) {
  struct Case {
    const char* term;
    const char* enterSet;
  };
  for (const Case& c : {Case{"vt102", "\x0e"}, Case{"xterm-256color", "\x1b(0"}}) {
    Options options = ConsoleOptions();
    options.term = c.term;
    options.keepOutput = true;
    TestConsole console(options);
    ASSERT_TRUE(Settled(console, kWelcomeFooter)) << c.term;
    const std::string& sent = console.Output();
    EXPECT_NE(sent.find(c.enterSet), std::string::npos) << c.term;
    EXPECT_NE(sent.find("l" + Repeated("q", 78)), std::string::npos) << c.term;
    EXPECT_EQ(sent.find("\u2500"), std::string::npos) << c.term << ": a line went out as UTF-8";
    // The terminal shows the box all the same.
    EXPECT_EQ(console.Row(0), "\u250c" + Repeated("\u2500", 78) + "\u2510") << c.term;
    EXPECT_EQ(console.Row(24), "\u2514" + Repeated("\u2500", 78) + "\u2518") << c.term;
    EXPECT_EQ(console.At(1, 0).text, "\u2502") << c.term;
    EXPECT_EQ(console.At(1, 79).text, "\u2502") << c.term;

    // A login sends the menu without the welcome screen between.
    console.Key("F2");
    ASSERT_TRUE(Settled(console, "Authentication Required"));
    console.Key("Down");
    console.Type(kRootPassword);
    ASSERT_TRUE(console.WaitReady());
    const std::size_t before = console.Output().size();
    console.Key("Enter");
    ASSERT_TRUE(Settled(console, "System Customization"));
    // Drawing the welcome screen active again between the dialog and the
    // menu would send its footer once more.
    EXPECT_EQ(console.Output().find(kWelcomeFooter, before), std::string::npos) << c.term;
    Close(console);
  }
}

TEST(ScreenUpdateScreenTest, KeyThatEndsTheDimmedStateSendsTheScreenOnce) {
  Options options = ConsoleOptions();
  options.keepOutput = true;
  options.timeScale = 20;  // the screen dims after three seconds
  TestConsole console(options);
  ASSERT_TRUE(Settled(console, kWelcomeFooter));
  const int row = 20;  // on the lower panel
  // Dimmed, and waiting for a key again (a readiness record after the one
  // that came before the dimming).
  const auto awake = console.ReadyAt();
  ASSERT_TRUE(console.WaitUntil(
      [&] { return console.At(row, 40).bg == Tulk::kBlack && console.ReadyAt() > awake; },
      "the dimmed screen"));
  const std::size_t before = console.Output().size();
  console.Type("x");
  ASSERT_TRUE(console.WaitReady());
  ASSERT_EQ(console.At(row, 40).bg, Tulk::kYellow) << console.Dump();
  // Both the key read's repaint and the welcome screen's own one are asked
  // for; they go out as one.
  EXPECT_EQ(Occurrences(console.Output().substr(before), kWelcomeFooter), 1);
  Close(console);
}

}  // namespace
