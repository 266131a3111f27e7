// Events and audit records as they land in the simulated host's files.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "HostTestRoot.h"
#include "host/AuditLog.h"
#include "host/EventReporter.h"
#include "host/HostStartup.h"
#include "render/HostValues.h"

namespace {

using HostTest::Logged;
using HostTest::Records;
using nlohmann::json;

class EventAuditTest : public HostTest::HostStateTest {
 protected:
  void TearDown() override {
    if (Tulk::EventReportingOpen()) {
      Tulk::CloseEventReporting();
    }
  }
  void Fault(const std::string& operation, const std::string& message) {
    state_["faults"][operation] = message;
    Apply();
  }
};

TEST_F(EventAuditTest, EventOpensTheFacilityOnlyWhenItIsClosed) {
  ASSERT_TRUE(Tulk::PostEvent(Tulk::TulkEvent::NetworkRestart, {"hyk0"}));
  EXPECT_FALSE(Tulk::EventReportingOpen());
  ASSERT_TRUE(Tulk::InitEventReporting());  // as at start-up
  EXPECT_TRUE(Tulk::PostEvent(Tulk::TulkEvent::LoginAuthenticationFailed, {"root"}));
  EXPECT_TRUE(Tulk::EventReportingOpen());

  std::vector<json> events = Records("events.jsonl");
  ASSERT_EQ(events.size(), 2u);
  EXPECT_EQ(events[0]["message"], "@&!*@*@(qob.user.tulk.network.restart)Restarting %s");
  EXPECT_EQ(events[0]["text"], "Restarting hyk0");
  EXPECT_EQ(events[1]["id"], "qob.user.tulk.login.failed");
  EXPECT_EQ(events[1]["text"], "Authentication of user root failed");
  EXPECT_EQ(HostTest::LogLines(), std::vector<std::string>(2, "<14>Initializing qobuser library"));
}

TEST_F(EventAuditTest, FacilityThatCannotOpenLosesOnlyTheEvent) {
  Fault("QobUserLib_Init", "7");
  EXPECT_FALSE(Tulk::PostEvent(Tulk::TulkEvent::ShutdownHost));
  EXPECT_TRUE(Logged("<11>Unable to initialize qobuser library from TULK. Error code: 7"));
  EXPECT_TRUE(Records("events.jsonl").empty());
}

TEST_F(EventAuditTest, AuditRecordsCarryUserOutcomeAndAttributes) {
  EXPECT_TRUE(
      Tulk::WriteAuditRecord(Tulk::kAuditLogin, "root", false, {{"reason", "Password expired"}}));
  EXPECT_TRUE(Tulk::WriteAuditRecord(Tulk::kAuditLogin, "root", true));
  std::vector<json> records = Records("audit.jsonl");
  ASSERT_EQ(records.size(), 2u);
  EXPECT_EQ(records[0]["component"], "tulk");
  EXPECT_EQ(records[0]["user"], "root");
  EXPECT_EQ(records[0]["result"], "failure");
  EXPECT_EQ(records[0]["attributes"], (json{{"reason", "Password expired"}}));
  EXPECT_EQ(records[1]["result"], "success");

  Fault("BrlAudit_LogList", "disk full");
  EXPECT_FALSE(Tulk::WriteAuditRecord(Tulk::kAuditChangePassword, "root", true));
  EXPECT_TRUE(Logged("<12>Unable to write audit record account.changePassword (error 1)"));
}

TEST_F(EventAuditTest, StartUpRegistersValuesOpensEventsAndAuditsTheProduct) {
  Tulk::StartHostServices();
  EXPECT_TRUE(Tulk::EventReportingOpen());
  EXPECT_NE(Tulk::FindValueProvider("hostname"), nullptr);
  EXPECT_TRUE(static_cast<bool>(Tulk::GetVersionLineSource()));
  std::vector<json> records = Records("audit.jsonl");
  ASSERT_EQ(records.size(), 1u);
  EXPECT_EQ(records[0]["event"], "product.issue");
  EXPECT_EQ(records[0]["user"], "");
  EXPECT_EQ(records[0]["attributes"]["version"], "8.1.0");
}

}  // namespace
