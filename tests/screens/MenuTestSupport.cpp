#include "MenuTestSupport.h"

#include <cstdio>

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
  if (auto menu = Settled(console, "System Customization"); !menu) {
    return menu;
  }
  for (int step = 0; step < 20; ++step) {
    if (RightTitle(console, cols) == title) {
      return ::testing::AssertionSuccess();
    }
    console.Key("Down");
    if (auto ready = console.WaitReady(); !ready) {
      return ready;
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
