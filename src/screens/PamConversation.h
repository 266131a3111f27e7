#pragma once
/// The PAM conversation of the console: answers the modules' prompts with
/// the passwords the operator typed into a dialog.
///
/// Answering by prompt: a prompt that mentions a new password or its
/// verification ("New password: ", "Retype new password: ", "Verify New
/// Password :") receives the new password; every other prompt ("Password:
/// ", "Old password: ", "Current password: ", "PIN: ") receives the old
/// one, which for a login is the password or PIN itself. The words are
/// matched without regard to case: "new", "retype", "verify", "again".
/// Informational and error messages of the modules get an empty answer and
/// are not shown (the console calls PAM with PAM_SILENT and reports the
/// outcome itself).

#include <security/pam_appl.h>

#include <string>
#include <string_view>

namespace Tulk {

class PamConversation {
 public:
  /// Answers every password prompt with `password`.
  explicit PamConversation(std::string password);
  /// Answers prompts for the new password (and its verification) with
  /// `newPassword`, all others with `oldPassword`.
  PamConversation(std::string oldPassword, std::string newPassword);

  /// The structure to hand to pam_start(); it points at this object, which
  /// must outlive the transaction.
  const pam_conv* Get() const { return &conv_; }

  /// Whether `prompt` asks for the new password.
  static bool AsksForNewPassword(std::string_view prompt);

  /// The answer to one prompt.
  const std::string& Answer(std::string_view prompt) const;

 private:
  static int Converse(int count, const pam_message** messages, pam_response** responses,
                      void* data);

  std::string oldPassword_;
  std::string newPassword_;
  bool changing_;
  pam_conv conv_;
};

}  // namespace Tulk
