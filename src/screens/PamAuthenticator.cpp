#include "screens/PamAuthenticator.h"

#include <security/pam_appl.h>

#include "screens/PamConversation.h"

namespace Tulk {
namespace {

bool Passed(int status) {
  return status == PAM_SUCCESS || status == PAM_NEW_AUTHTOK_REQD;
}

}  // namespace

PamAuthenticator::PamAuthenticator(std::string service) : service_(std::move(service)) {
}

int PamAuthenticator::Authenticate(const std::string& user, const std::string& password) const {
  PamConversation conversation(password);
  pam_handle_t* handle = nullptr;
  int status = pam_start(service_.c_str(), user.c_str(), conversation.Get(), &handle);
  if (status != PAM_SUCCESS) {
    return status;
  }
  status = pam_authenticate(handle, PAM_SILENT);
  if (status == PAM_SUCCESS) {
    status = pam_acct_mgmt(handle, PAM_SILENT);
  }
  pam_end(handle, status);
  return status;
}

int PamAuthenticator::ChangePassword(const std::string& user, const std::string& oldPassword,
                                     const std::string& newPassword) const {
  PamConversation conversation(oldPassword, newPassword);
  pam_handle_t* handle = nullptr;
  int status = pam_start(service_.c_str(), user.c_str(), conversation.Get(), &handle);
  if (status != PAM_SUCCESS) {
    return status;
  }
  status = pam_authenticate(handle, PAM_SILENT);
  if (Passed(status)) {
    status = pam_acct_mgmt(handle, PAM_SILENT);
  }
  if (Passed(status)) {
    status = pam_chauthtok(handle, PAM_SILENT);
  }
  if (status == PAM_SUCCESS) {
    status = pam_setcred(handle, PAM_SILENT | PAM_REFRESH_CRED);
  }
  pam_end(handle, status);
  return status;
}

}  // namespace Tulk
