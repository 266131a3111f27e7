#include "MenuTestSupport.h"

#include <cstdio>
#include <thread>

namespace MenuTest {

TulkTest::Options DriverOptions(const nlohmann::json& host, const std::string& scene) {
  TulkTest::Options options;
  options.program = TULK_TEST_MENU_DRIVER;
  options.hostState = host.dump();
  options.env["TULK_MENU_SCENE"] = scene;
  return options;
}

std::string RightTitle(const TulkTest::TestConsole& console, int cols) {
  std::string text;
  for (int col = cols / 2 + 2; col < cols - 1; ++col) {
    text += console.At(1, col).text;
  }
  return text.substr(0, text.find_last_not_of(' ') + 1);
}

::testing::AssertionResult SelectEntry(TulkTest::TestConsole& console, const std::string& title,
                                       int cols) {
  Settled(console, "System Customization");
  for (int step = 0; step < 20; ++step) {
    // Read the title only once the move has been drawn completely: a title
    // read half-way through an update matches neither entry.
    console.WaitQuiet(std::chrono::milliseconds(60));
    const std::string shown = RightTitle(console, cols);
    if (shown == title) {
      console.WaitQuiet();
      return ::testing::AssertionSuccess();
    }
    console.Key("Down");
    if (!WaitUntil(
            console, [&] { return RightTitle(console, cols) != shown; }, "a move",
            std::chrono::milliseconds(2000))) {
      break;
    }
  }
  return ::testing::AssertionFailure() << "no entry " << title << "\n" << console.Dump();
}

std::string Capture(const std::string& commandLine) {
  std::string output;
  FILE* pipe = popen(commandLine.c_str(), "r");
  if (pipe == nullptr) {
    return output;
  }
  char buffer[256];
  while (std::fgets(buffer, sizeof buffer, pipe) != nullptr) {
    output += buffer;
  }
  pclose(pipe);
  return output;
}

}  // namespace MenuTest
