#include "host/AuditLog.h"

#include <syslog.h>

#include "platform/api/BrlAudit.h"
#include "platform/api/ProductState.h"
#include "runtime/SystemLog.h"

namespace Tulk {
namespace {

std::string Text(const char* value) {
  return value != nullptr ? value : "";
}

}  // namespace

bool WriteAuditRecord(const std::string& eventName, const std::string& user, bool success,
                      const AuditAttributes& attributes) {
  std::vector<BrlAuditPair> pairs;
  pairs.reserve(attributes.size());
  for (const auto& [key, value] : attributes) {
    pairs.push_back({key.c_str(), value.c_str()});
  }
  int rc =
      BrlAudit_LogList(eventName.c_str(), kAuditComponent, user.empty() ? nullptr : user.c_str(),
                       success ? BRL_AUDIT_SUCCESS : BRL_AUDIT_FAILURE,
                       pairs.empty() ? nullptr : pairs.data(), pairs.size());
  if (rc != 0) {
    Log(LOG_WARNING, "Unable to write audit record %s (error %d)", eventName.c_str(), rc);
    return false;
  }
  return true;
}

bool WriteProductIssueRecord() {
  return WriteAuditRecord(kAuditProductIssue, "", true,
                          {{"product", Text(ProductState_GetName())},
                           {"version", Text(ProductState_GetVersion())},
                           {"build", Text(ProductState_GetBuildNumberString())}});
}

}  // namespace Tulk
