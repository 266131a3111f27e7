#pragma once
/// Records of the host's audit log for logins, logouts, password changes
/// and the console's start. Best effort: nothing here throws.

#include <string>
#include <utility>
#include <vector>

namespace Tulk {

/// The component every console record names.
inline constexpr char kAuditComponent[] = "tulk";

/// Event names of the console's records.
inline constexpr char kAuditLogin[] = "tulk.login";
inline constexpr char kAuditLogout[] = "tulk.logout";
inline constexpr char kAuditChangePassword[] = "account.changePassword";
inline constexpr char kAuditProductIssue[] = "product.issue";

/// Attributes of a record, such as {"reason", "Invalid login"}.
using AuditAttributes = std::vector<std::pair<std::string, std::string>>;

/// Writes one record through BrlAudit_LogList: `eventName` for component
/// "tulk", about `user` (empty for none), with the outcome and attributes in
/// order. A record the host refuses logs "Unable to write audit record %s
/// (error %d)" at warning level. Returns true when it was written.
bool WriteAuditRecord(const std::string& eventName, const std::string& user, bool success,
                      const AuditAttributes& attributes = {});

/// The start-up record "product.issue": no user, success, with the
/// attributes "product", "version" and "build" of the console's product
/// identity (ProductState_GetName, _GetVersion, _GetBuildNumberString).
bool WriteProductIssueRecord();

}  // namespace Tulk
