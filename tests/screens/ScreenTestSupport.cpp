#include "ScreenTestSupport.h"

#include <fstream>
#include <iterator>

#include "platform/sim/DemoHost.h"

namespace TulkTest {

nlohmann::json DemoHostState() {
  return Sim::DemoHostState();
}

std::vector<nlohmann::json> SimRecords(const std::filesystem::path& root, const std::string& file) {
  std::vector<nlohmann::json> records;
  std::ifstream in(root / "var/log/tulk-sim" / file);
  std::string line;
  while (std::getline(in, line)) {
    if (!line.empty()) {
      records.push_back(nlohmann::json::parse(line, nullptr, false));
    }
  }
  return records;
}

nlohmann::json ReadHostState(const std::filesystem::path& stateFile) {
  std::ifstream in(stateFile);
  return nlohmann::json::parse(in, nullptr, false);
}

void WriteRootFile(const std::filesystem::path& root, const std::string& path,
                   const std::string& text) {
  std::filesystem::path file = root / std::filesystem::path(path).relative_path();
  std::filesystem::create_directories(file.parent_path());
  std::ofstream(file) << text;
}

::testing::AssertionResult WaitUntil(TestConsole& console, const std::function<bool()>& condition,
                                     const std::string& what, std::chrono::milliseconds timeout) {
  return console.WaitUntil(condition, what, timeout);
}

std::string ReadText(const std::filesystem::path& path) {
  std::ifstream in(path);
  return std::string(std::istreambuf_iterator<char>(in), {});
}

void ReplaceHostState(const TestConsole& console, const nlohmann::json& host) {
  const std::filesystem::path fresh = console.HostStatePath().string() + ".new";
  std::ofstream(fresh) << host.dump();
  std::filesystem::rename(fresh, console.HostStatePath());
}

::testing::AssertionResult Settled(TestConsole& console, const std::string& text) {
  if (auto shown = console.WaitForText(text); !shown) {
    return shown;
  }
  if (auto ready = console.WaitReady(); !ready) {
    return ready;
  }
  if (!console.Contains(text)) {
    return ::testing::AssertionFailure() << "\"" << text << "\" was shown, then replaced\n"
                                         << console.Dump();
  }
  return ::testing::AssertionSuccess();
}

::testing::AssertionResult Gone(TestConsole& console, const std::string& text) {
  if (auto gone = console.WaitForTextGone(text); !gone) {
    return gone;
  }
  if (auto ready = console.WaitReady(); !ready) {
    return ready;
  }
  if (console.Contains(text)) {
    return ::testing::AssertionFailure() << "\"" << text << "\" went, then came back\n"
                                         << console.Dump();
  }
  return ::testing::AssertionSuccess();
}

}  // namespace TulkTest
