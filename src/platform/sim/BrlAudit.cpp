#include "platform/api/BrlAudit.h"

#include <unistd.h>

#include "platform/api/HostMgrException.h"
#include "platform/sim/SimHost.h"
#include "platform/sim/SimState.h"

// The simulated audit log appends one JSON object per record to
// "<root>/var/log/tulk-sim/audit.jsonl".

extern "C" {

int BrlAudit_LogList(const char* eventName, const char* component, const char* user,
                     BrlAuditResult result, const BrlAuditPair* pairs, std::size_t pairCount) {
  try {
    Sim::SimHost::Instance().CheckFault("BrlAudit_LogList");
  } catch (const HostMgr::Lib::HostMgrException&) {
    return 1;
  }
  if (eventName == nullptr || *eventName == '\0') {
    return 2;
  }
  Sim::json attributes = Sim::json::object();
  for (std::size_t i = 0; pairs != nullptr && i < pairCount; ++i) {
    if (pairs[i].key != nullptr) {
      attributes[pairs[i].key] = pairs[i].value != nullptr ? pairs[i].value : "";
    }
  }
  Sim::json record = {{"time", Sim::TimeStamp()},
                      {"pid", getpid()},
                      {"event", eventName},
                      {"component", component != nullptr ? component : ""},
                      {"user", user != nullptr ? user : ""},
                      {"result", result == BRL_AUDIT_SUCCESS ? "success" : "failure"},
                      {"attributes", std::move(attributes)}};
  return Sim::AppendRecord("audit.jsonl", record) ? 0 : 3;
}
}
