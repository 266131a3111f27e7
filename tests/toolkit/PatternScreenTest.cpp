// The shared screen patterns on a real terminal: the form's key routing and
// validation, the confirmation keys, a progress step finished by a worker
// thread, and the table-driven menu. Checks read the screen once the
// console has handled what was sent and waits for a key (WaitReady).

#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <chrono>
#include <string>
#include <thread>

#include "TestConsole.h"
#include "ToolkitScene.h"
#include "include/ColorNumbers.h"

namespace {

using namespace std::chrono_literals;
using namespace Tulk;
using ToolkitTest::Scene;
using TulkTest::Options;
using TulkTest::TestConsole;

// Writes `text` into the FIFO once the worker has opened it for reading (a
// bounded wait: a worker that never reads fails the test, not the run).
::testing::AssertionResult FeedWorker(const std::string& fifo, const std::string& text) {
  const auto deadline = std::chrono::steady_clock::now() + 5s;
  for (;;) {
    const int fd = open(fifo.c_str(), O_WRONLY | O_NONBLOCK | O_CLOEXEC);
    if (fd >= 0) {
      const bool written = write(fd, text.data(), text.size()) == static_cast<ssize_t>(text.size());
      close(fd);
      return written ? ::testing::AssertionSuccess() : ::testing::AssertionFailure() << "write";
    }
    if (errno != ENXIO || std::chrono::steady_clock::now() > deadline) {
      return ::testing::AssertionFailure() << "no reader on " << fifo;
    }
    std::this_thread::sleep_for(10ms);
  }
}

int RowOf(const TestConsole& console, const std::string& text) {
  for (int row = 0; row < 25; ++row) {
    if (console.Row(row).find(text) != std::string::npos) {
      return row;
    }
  }
  return -1;
}

TEST(PatternScreen, FormRoutesKeysThroughTheFieldFilterAndRejectsIntoTheField) {
  TestConsole console(Scene("form"));
  ASSERT_TRUE(console.WaitForText("( ) This VLAN:"));
  ASSERT_TRUE(console.WaitReady());
  const int vlanRow = RowOf(console, "VLAN ID (1-4094");
  ASSERT_GT(vlanRow, 0);
  // The field follows the second radio button: disabled (dark grey) and
  // passed over by Down while "No VLAN" is marked.
  EXPECT_EQ(console.At(vlanRow, 13).fg, kDarkGrey) << console.Dump();
  EXPECT_FALSE(console.Cursor().visible);
  console.Key("Down");
  console.Key("Space");
  ASSERT_TRUE(console.WaitForText("(o) This VLAN:"));
  EXPECT_TRUE(console.Contains("( ) No VLAN"));
  console.Key("Down");
  // Letters, blanks and a fifth digit never reach the digits-only field.
  console.Type("4a0 9x55");
  ASSERT_TRUE(console.WaitReady());
  ASSERT_TRUE(console.Contains("[ 4095 ")) << console.Dump();
  EXPECT_TRUE(console.Cursor().visible);
  EXPECT_EQ(console.Cursor().row, vlanRow);
  console.Key("Backspace", 4);
  console.Type("5000");
  ASSERT_TRUE(console.WaitForText("[ 5000"));
  console.Key("Enter");
  ASSERT_TRUE(console.WaitForText("Please reenter a valid VLAN ID (1-4095)."));
  console.Key("Esc");  // a message closes with Enter only
  ASSERT_TRUE(console.WaitReady());
  ASSERT_TRUE(console.Contains("Please reenter"));
  console.Key("Enter");
  ASSERT_TRUE(console.WaitReady());
  // Back in the form with the value kept and the cursor in the offending
  // field.
  EXPECT_FALSE(console.Contains("Please reenter"));
  EXPECT_TRUE(console.Contains("[ 5000"));
  EXPECT_TRUE(console.Cursor().visible);
  EXPECT_EQ(console.Cursor().row, vlanRow);
  console.Key("Backspace", 4);
  console.Type("42");
  ASSERT_TRUE(console.WaitForText("[ 42 "));
  console.Key("Enter");
  EXPECT_TRUE(console.WaitForText("result: 1 values: vlan 42"));
  EXPECT_FALSE(console.Cursor().visible);
}

TEST(PatternScreen, F11QuestionIgnoresEnterAndFlipsItsCheckBoxWithSpace) {
  TestConsole console(Scene("confirm"));
  ASSERT_TRUE(console.WaitForText("[ ] Collect extra information"));
  console.Key("Enter");
  console.Type("y");
  ASSERT_TRUE(console.WaitReady());
  EXPECT_TRUE(console.Contains("Go ahead?"));
  console.Key("Space");
  ASSERT_TRUE(console.WaitForText("[X] Collect extra information"));
  console.Key("F11");
  EXPECT_TRUE(console.WaitForText("result: 1 checked"));
}

TEST(PatternScreen, YesNoQuestionAnswersWithTheLettersOnly) {
  TestConsole console(Scene("yesno"));
  for (const auto& [key, result] :
       {std::pair{"n", "result: 2"}, std::pair{"Y", "result: 1"}, std::pair{"Esc", "result: 0"}}) {
    ASSERT_TRUE(console.WaitForText("Go ahead?"));
    console.Key("Enter");
    console.Type("x");
    ASSERT_TRUE(console.WaitReady());
    ASSERT_TRUE(console.Contains("Go ahead?"));
    if (std::string(key) == "Esc") {
      console.Key("Esc");
    } else {
      console.Type(key);
    }
    EXPECT_TRUE(console.WaitForText(result)) << key;
    console.Type("o");
  }
}

// The progress scene with the FIFO its worker reads, started and showing
// its step.
struct ProgressScene {
  ProgressScene() : console(Stopped()), fifo((console.Root() / "tmp" / "worker").string()) {
    EXPECT_EQ(mkfifo(fifo.c_str(), 0600), 0);
    console.Start();
    EXPECT_TRUE(console.WaitForText("Waiting for the worker."));
  }
  static Options Stopped() {
    Options options = Scene("progress");
    options.start = false;
    return options;
  }
  TestConsole console;
  std::string fifo;
};

// The worker's result alone wakes the report, which closes on Enter only;
// opened again, Esc ends the wait for the worker at once.
TEST(PatternScreen, WorkerResultWakesTheReportAndEscEndsTheWait) {
  ProgressScene scene;
  TestConsole& console = scene.console;
  const std::string& fifo = scene.fifo;
  ASSERT_TRUE(FeedWorker(fifo, "0\n"));
  ASSERT_TRUE(console.WaitForText("Waiting for the worker. Done."));
  ASSERT_TRUE(console.WaitForText("<Enter> OK"));
  console.Key("Esc");
  ASSERT_TRUE(console.WaitReady());
  ASSERT_FALSE(console.Contains("result:"));
  console.Key("Enter");
  EXPECT_TRUE(console.WaitForText("result: 1"));

  console.Type("o");
  ASSERT_TRUE(console.WaitForText("Waiting for the worker."));
  console.Key("Esc");
  EXPECT_TRUE(console.WaitForText("result: 0"));
  EXPECT_TRUE(FeedWorker(fifo, "1\n"));  // the worker ends after the dialog has gone
  console.Type("q");
  EXPECT_EQ(console.WaitExit(), 0);
}

}  // namespace
