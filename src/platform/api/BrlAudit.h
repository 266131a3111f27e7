#pragma once
/// The host's audit log.

#include <cstddef>

extern "C" {

/// One attribute of an audit record.
struct BrlAuditPair {
  const char* key;
  const char* value;
};

/// Outcome values of an audit record.
enum BrlAuditResult {
  BRL_AUDIT_FAILURE = 0,
  BRL_AUDIT_SUCCESS = 1,
};

/// Writes one audit record: the event name ("tulk.login",
/// "account.changePassword", "product.issue"), the reporting component
/// ("tulk"), the user it concerns (may be null or empty), the outcome and
/// `pairCount` attributes (`pairs` may be null when the count is 0).
/// Returns 0 on success, non-zero when the record could not be written.
int BrlAudit_LogList(const char* eventName, const char* component, const char* user,
                     BrlAuditResult result, const BrlAuditPair* pairs, std::size_t pairCount);
}
