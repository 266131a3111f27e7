#pragma once
/// Console logins and password changes through PAM.
///
/// Every call runs one PAM transaction for the service "tulk" (a real host
/// installs dist/pam.d/tulk as /etc/pam.d/tulk), with PAM_SILENT on every
/// call, and ends it with pam_end() and the last status. The passwords
/// reach the modules through PamConversation (screens/PamConversation.h),
/// which answers the modules' prompts from the texts given here.
///
/// The PAM configuration is host state like any other: when the console is
/// confined to a root (TULK_ROOT, runtime/HostPath.h), every transaction
/// reads the root's "/etc/pam.d" (pam_start_confdir, Linux-PAM 1.4 or
/// later), so that a test or demo root brings its own users and modules
/// and a simulated console can never check or change a password of the
/// machine it runs on. A root without a configuration for the service
/// refuses every login. On a real host PAM's own configuration is used.
///
/// Results are PAM status codes (security/pam_appl.h): PAM_SUCCESS (0),
/// PAM_NEW_AUTHTOK_REQD (12, the password has expired), PAM_PERM_DENIED
/// (6), or any other failure.
///
/// Decisions of this implementation:
/// - No PAM session is opened (no pam_open_session/pam_close_session around
///   a logged-in session), and the shipped service file has no session
///   line. The console never changes its identity or starts a user's
///   programs, so session modules would have nothing to set up, and some
///   (pam_systemd) would move the long-lived console out of its service
///   into a user session. The session is recorded by the console's own log
///   lines and audit records ("tulk.login", "tulk.logout").
/// - Failed attempts are slowed down by the service's modules (pam_faildelay
///   in dist/pam.d/tulk), not here: no PAM_FAIL_DELAY callback is set, so
///   PAM waits inside pam_authenticate and the failure is shown afterwards;
///   keys typed meanwhile wait in the terminal.

#include <string>

namespace Tulk {

class PamAuthenticator {
 public:
  /// The console's PAM service.
  static constexpr char kService[] = "tulk";

  /// Transactions for `service` (the console always uses "tulk").
  explicit PamAuthenticator(std::string service = kService);

  /// Checks `user` and `password` (or a smart-card login id and PIN):
  /// pam_authenticate, and only when that succeeds pam_acct_mgmt. Returns
  /// the status of the last call made, so an expired password (12) is
  /// reported by the account check after a correct password. Also the
  /// check of the old password before a change.
  int Authenticate(const std::string& user, const std::string& password) const;

  /// Changes the password of `user` from `oldPassword` to `newPassword`:
  /// pam_authenticate and pam_acct_mgmt, where PAM_SUCCESS and
  /// PAM_NEW_AUTHTOK_REQD both pass; then pam_chauthtok and pam_setcred
  /// with PAM_REFRESH_CRED. Returns PAM_SUCCESS only when pam_chauthtok
  /// and pam_setcred both succeeded; otherwise the status of the step that
  /// failed.
  int ChangePassword(const std::string& user, const std::string& oldPassword,
                     const std::string& newPassword) const;

  /// The PAM service name.
  const std::string& Service() const { return service_; }

 private:
  std::string service_;
};

}  // namespace Tulk
