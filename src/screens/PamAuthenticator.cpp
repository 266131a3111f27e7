#include "screens/PamAuthenticator.h"

#include <security/pam_appl.h>

#include <cstdlib>
#include <cstring>

#include "runtime/HostPath.h"
#include "screens/PamConversation.h"

namespace Tulk {
namespace {

bool Passed(int status) {
  return status == PAM_SUCCESS || status == PAM_NEW_AUTHTOK_REQD;
}

// A console confined to a root never reads the machine's PAM configuration
// (a simulated host must not check or change a real password): it reads the
// root's own, unless pam_wrapper is active and names the service folder.
bool UsesRootConfiguration() {
  if (!HostRootConfined()) {
    return false;
  }
  const char* wrapped = std::getenv("PAM_WRAPPER");
  return wrapped == nullptr || std::strcmp(wrapped, "1") != 0;
}

int Start(const std::string& service, const std::string& user, const PamConversation& conversation,
          pam_handle_t** handle) {
  if (UsesRootConfiguration()) {
    const std::string folder = HostPath("/etc/pam.d");
    return pam_start_confdir(service.c_str(), user.c_str(), conversation.Get(), folder.c_str(),
                             handle);
  }
  return pam_start(service.c_str(), user.c_str(), conversation.Get(), handle);
}

}  // namespace

PamAuthenticator::PamAuthenticator(std::string service) : service_(std::move(service)) {
}

int PamAuthenticator::Authenticate(const std::string& user, const std::string& password) const {
  PamConversation conversation(password);
  pam_handle_t* handle = nullptr;
  int status = Start(service_, user, conversation, &handle);
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
  int status = Start(service_, user, conversation, &handle);
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
