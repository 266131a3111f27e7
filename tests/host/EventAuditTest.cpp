// Events and audit records as they land in the simulated host's files.

#include <gtest/gtest.h>

#include <nlohmann/json.hpp>
#include <string>
#include <vector>

#include "HostTestRoot.h"
#include "host/AuditLog.h"
#include "host/EventReporter.h"
#include "host/HostStartup.h"
#include "platform/sim/DemoHost.h"
#include "render/HostValues.h"

namespace {

using HostTest::Logged;
using nlohmann::json;

std::vector<json> Records(const char* file) {
  std::vector<json> records;
  std::string text = HostTest::ReadFile(HostTest::Root() / "var/log/tulk-sim" / file);
  std::size_t start = 0;
  for (std::size_t end; (end = text.find('\n', start)) != std::string::npos; start = end + 1) {
    records.push_back(json::parse(text.substr(start, end - start)));
  }
  return records;
}

class EventAuditTest : public ::testing::Test {
 protected:
  void SetUp() override {
    HostTest::ClearLog();
    std::filesystem::remove_all(HostTest::Root() / "var/log/tulk-sim");
    state_ = Sim::DemoHostState();
    HostTest::WriteHostState(state_.dump());
  }
  void TearDown() override {
    if (Tulk::EventReportingOpen()) {
      Tulk::CloseEventReporting();
    }
  }

  void Fault(const std::string& operation, const std::string& message) {
    state_["faults"][operation] = message;
    HostTest::WriteHostState(state_.dump());
  }

  json state_;
};

TEST_F(EventAuditTest, PostedEventOpensSendsAndCloses) {
  ASSERT_TRUE(Tulk::PostEvent(Tulk::TulkEvent::NetworkRestart, {"hyk0"}));
  EXPECT_FALSE(Tulk::EventReportingOpen());
  std::vector<json> events = Records("events.jsonl");
  ASSERT_EQ(events.size(), 1u);
  EXPECT_EQ(events[0]["id"], "qob.user.tulk.network.restart");
  EXPECT_EQ(events[0]["text"], "Restarting hyk0");
  EXPECT_EQ(HostTest::LogLines(), std::vector<std::string>{"<14>Initializing qobuser library"});
}

TEST_F(EventAuditTest, FacilityOpenedAtStartUpStaysOpen) {
  ASSERT_TRUE(Tulk::InitEventReporting());
  EXPECT_TRUE(Tulk::PostEvent(Tulk::TulkEvent::ShutdownHost));
  EXPECT_TRUE(Tulk::PostEvent(Tulk::TulkEvent::RebootHost));
  EXPECT_TRUE(Tulk::EventReportingOpen());
  EXPECT_EQ(Records("events.jsonl").size(), 2u);
  EXPECT_EQ(HostTest::LogLines().size(), 1u) << "opened once";
}

TEST_F(EventAuditTest, FacilityThatCannotOpenLosesOnlyTheEvent) {
  Fault("QobUserLib_Init", "7");
  EXPECT_FALSE(Tulk::PostEvent(Tulk::TulkEvent::LoginAccessDenied, {"root"}));
  EXPECT_TRUE(Logged("<11>Unable to initialize qobuser library from TULK. Error code: 7"));
  EXPECT_TRUE(Records("events.jsonl").empty());
}

TEST_F(EventAuditTest, AuditRecordsCarryUserOutcomeAndAttributes) {
  EXPECT_TRUE(
      Tulk::WriteAuditRecord(Tulk::kAuditLogin, "root", false, {{"reason", "Password expired"}}));
  EXPECT_TRUE(Tulk::WriteAuditRecord(Tulk::kAuditLogin, "root", true));
  std::vector<json> records = Records("audit.jsonl");
  ASSERT_EQ(records.size(), 2u);
  EXPECT_EQ(records[0]["event"], "tulk.login");
  EXPECT_EQ(records[0]["component"], "tulk");
  EXPECT_EQ(records[0]["user"], "root");
  EXPECT_EQ(records[0]["result"], "failure");
  EXPECT_EQ(records[0]["attributes"], (json{{"reason", "Password expired"}}));
  EXPECT_EQ(records[1]["result"], "success");
  EXPECT_EQ(records[1]["attributes"], json::object());

  Fault("BrlAudit_LogList", "disk full");
  EXPECT_FALSE(Tulk::WriteAuditRecord(Tulk::kAuditChangePassword, "root", true));
  EXPECT_TRUE(Logged("<12>Unable to write audit record account.changePassword (error 1)"));
}

TEST_F(EventAuditTest, StartUpRegistersValuesOpensEventsAndAuditsTheProduct) {
  Tulk::StartHostServices();
  EXPECT_TRUE(Tulk::EventReportingOpen());
  ASSERT_NE(Tulk::FindValueProvider("hostname"), nullptr);
  EXPECT_TRUE(static_cast<bool>(Tulk::GetVersionLineSource()));
  std::vector<json> records = Records("audit.jsonl");
  ASSERT_EQ(records.size(), 1u);
  EXPECT_EQ(records[0]["event"], "product.issue");
  EXPECT_EQ(records[0]["user"], "");
  EXPECT_EQ(records[0]["attributes"]["product"], "Brimlo Tavi");
  EXPECT_EQ(records[0]["attributes"]["version"], "8.1.0");
}

}  // namespace
