// The management agents' stop and start and the live-core capture against
// the simulated host tools.

#include <gtest/gtest.h>

#include <algorithm>
#include <chrono>
#include <filesystem>
#include <string>
#include <thread>
#include <vector>

#include "HostTestRoot.h"
#include "host/ManagementAgents.h"
#include "platform/sim/DemoHost.h"

namespace {

using Lines = std::vector<std::string>;
using namespace std::chrono_literals;

Lines ToolRuns() {
  Lines runs;
  for (const nlohmann::json& record : HostTest::Records("commands.jsonl")) {
    std::string line;
    for (const nlohmann::json& word : record["argv"]) {
      line += (line.empty() ? "" : " ") + word.get<std::string>();
    }
    runs.push_back(line);
  }
  return runs;
}

// Waits (at most 10 s) for the capture thread's last log line.
std::string CaptureOutcome() {
  const Lines outcomes = {"<14>Mgmtd core dump completed",
                          "<11>hykbacktrace failed, probably mgmtd was down"};
  for (int i = 0; i < 1000; ++i) {
    const Lines lines = HostTest::LogLines();
    for (std::size_t at = 0; at < lines.size(); ++at) {
      if (lines[at] != "<14>Executing hykbacktrace -c against mgmtd" || at + 1 >= lines.size()) {
        continue;
      }
      return lines[at + 1];
    }
    std::this_thread::sleep_for(10ms);
  }
  return "(no outcome)";
}

std::vector<std::filesystem::path> CoreFiles() {
  std::vector<std::filesystem::path> cores;
  for (const auto& entry : std::filesystem::directory_iterator(HostTest::Root() / "var/log")) {
    if (entry.path().extension() == ".core") {
      cores.push_back(entry.path());
    }
  }
  return cores;
}

class ManagementAgentsTest : public ::testing::Test {
 protected:
  void SetUp() override {
    HostTest::ClearLog();
    HostTest::ClearRecords();
    for (const auto& core : CoreFiles()) {
      std::filesystem::remove(core);
    }
    state_ = Sim::DemoHostState();
  }
  nlohmann::json state_;
};

TEST_F(ManagementAgentsTest, StopAndStartRunTheServicesScript) {
  HostTest::WriteHostState(state_);
  Tulk::StopManagementAgents();
  EXPECT_EQ(HostTest::ReadHostState()["services"]["mgmtd"]["running"], false);
  EXPECT_EQ(HostTest::ReadHostState()["services"]["hlma"]["running"], false);
  Tulk::StartManagementAgents();
  EXPECT_EQ(HostTest::ReadHostState()["services"]["mgmtd"]["running"], true);
  EXPECT_EQ(ToolRuns(), (Lines{"services.sh stop", "services.sh start"}));
  EXPECT_EQ(HostTest::LogLines(), Lines{});
}

TEST_F(ManagementAgentsTest, StopAndStartNeverThrow) {
  state_["faults"]["HykCtl::Util::HykCtl_Exec"] = "Cannot run services.sh";
  HostTest::WriteHostState(state_);
  Tulk::StopManagementAgents();
  Tulk::StartManagementAgents();
  EXPECT_EQ(HostTest::LogLines(),
            (Lines{"<11>Cannot run services.sh", "<11>Cannot run services.sh"}));
}

TEST_F(ManagementAgentsTest, CaptureLogsOneOfThreeOutcomes) {
  struct Case {
    const char* name;
    bool mgmtdRunning;
    const char* fault;
    std::string outcome;
    std::size_t cores;
  };
  const Case cases[] = {
      {"running", true, nullptr, "<14>Mgmtd core dump completed", 1},
      {"down", false, nullptr, "<11>hykbacktrace failed, probably mgmtd was down", 0},
      {"library failure", true, "Cannot run hykbacktrace", "<11>Cannot run hykbacktrace", 0},
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(c.name);
    SetUp();
    state_["services"]["mgmtd"]["running"] = c.mgmtdRunning;
    if (c.fault != nullptr) {
      state_["faults"]["HykCtl::Util::HykCtl_Exec"] = c.fault;
    }
    HostTest::WriteHostState(state_);
    ASSERT_TRUE(Tulk::StartLiveCoreCapture());
    EXPECT_EQ(CaptureOutcome(), c.outcome);
    const auto cores = CoreFiles();
    ASSERT_EQ(cores.size(), c.cores);
    if (!cores.empty()) {
      EXPECT_EQ(cores[0].filename().string().rfind("mgmtd-restart", 0), 0U) << cores[0];
      EXPECT_EQ(ToolRuns(), Lines{"hykbacktrace -w -n mgmtd -o mgmtd-restart% -d /var/log/"});
    }
  }
}

}  // namespace
