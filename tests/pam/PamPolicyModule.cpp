// Test-only PAM module: PAM results that the matrix module cannot give.
//
// Stacked before the matrix module in the test service files, with the
// option policy=<file>. Each line of the file is "user:outcome":
//   expired          account check answers PAM_NEW_AUTHTOK_REQD until the
//                    user's password has been changed (the line is removed)
//   denied           account check answers PAM_PERM_DENIED
//   chauthtok-fails  password change answers PAM_AUTHTOK_ERR
// Users without a line pass through (PAM_SUCCESS, PAM_IGNORE for chauthtok).

#include <security/pam_modules.h>

#include <cstring>
#include <fstream>
#include <string>
#include <vector>

namespace {

std::string PolicyPath(int argc, const char** argv) {
  for (int i = 0; i < argc; ++i) {
    if (std::strncmp(argv[i], "policy=", 7) == 0) {
      return argv[i] + 7;
    }
  }
  return {};
}

std::vector<std::string> ReadLines(const std::string& path) {
  std::vector<std::string> lines;
  std::ifstream in(path);
  std::string line;
  while (std::getline(in, line)) {
    lines.push_back(line);
  }
  return lines;
}

bool HasOutcome(const std::string& path, const char* user, const std::string& outcome) {
  std::string wanted = std::string(user) + ":" + outcome;
  for (const std::string& line : ReadLines(path)) {
    if (line == wanted) {
      return true;
    }
  }
  return false;
}

void RemoveOutcome(const std::string& path, const char* user, const std::string& outcome) {
  std::string unwanted = std::string(user) + ":" + outcome;
  std::vector<std::string> lines = ReadLines(path);
  std::ofstream out(path, std::ios::trunc);
  for (const std::string& line : lines) {
    if (line != unwanted) {
      out << line << "\n";
    }
  }
}

const char* User(pam_handle_t* handle) {
  const char* user = nullptr;
  if (pam_get_user(handle, &user, nullptr) != PAM_SUCCESS || user == nullptr) {
    return nullptr;
  }
  return user;
}

}  // namespace

extern "C" {

PAM_EXTERN int pam_sm_authenticate(pam_handle_t*, int, int, const char**) {
  return PAM_IGNORE;
}

PAM_EXTERN int pam_sm_setcred(pam_handle_t*, int, int, const char**) {
  return PAM_IGNORE;
}

PAM_EXTERN int pam_sm_acct_mgmt(pam_handle_t* handle, int, int argc, const char** argv) {
  const char* user = User(handle);
  std::string path = PolicyPath(argc, argv);
  if (user == nullptr || path.empty()) {
    return PAM_SUCCESS;
  }
  if (HasOutcome(path, user, "denied")) {
    return PAM_PERM_DENIED;
  }
  if (HasOutcome(path, user, "expired")) {
    return PAM_NEW_AUTHTOK_REQD;
  }
  return PAM_SUCCESS;
}

PAM_EXTERN int pam_sm_chauthtok(pam_handle_t* handle, int flags, int argc, const char** argv) {
  const char* user = User(handle);
  std::string path = PolicyPath(argc, argv);
  if (user == nullptr || path.empty()) {
    return PAM_IGNORE;
  }
  if (HasOutcome(path, user, "chauthtok-fails")) {
    return PAM_AUTHTOK_ERR;
  }
  if ((flags & PAM_UPDATE_AUTHTOK) != 0) {
    RemoveOutcome(path, user, "expired");
  }
  return PAM_IGNORE;
}

PAM_EXTERN int pam_sm_open_session(pam_handle_t*, int, int, const char**) {
  return PAM_IGNORE;
}

PAM_EXTERN int pam_sm_close_session(pam_handle_t*, int, int, const char**) {
  return PAM_IGNORE;
}

}  // extern "C"
