#include "screens/PamConversation.h"

#include <algorithm>
#include <cctype>
#include <cstdlib>
#include <cstring>

namespace Tulk {
namespace {

bool ContainsWord(std::string_view text, std::string_view word) {
  auto found = std::search(text.begin(), text.end(), word.begin(), word.end(), [](char a, char b) {
    return std::tolower(static_cast<unsigned char>(a)) ==
           std::tolower(static_cast<unsigned char>(b));
  });
  return found != text.end();
}

void FreeResponses(pam_response* responses, int count) {
  for (int i = 0; i < count; ++i) {
    if (responses[i].resp != nullptr) {
      std::memset(responses[i].resp, 0, std::strlen(responses[i].resp));
      std::free(responses[i].resp);
    }
  }
  std::free(responses);
}

}  // namespace

PamConversation::PamConversation(std::string password)
    : oldPassword_(std::move(password)), changing_(false), conv_{&Converse, this} {
}

PamConversation::PamConversation(std::string oldPassword, std::string newPassword)
    : oldPassword_(std::move(oldPassword)),
      newPassword_(std::move(newPassword)),
      changing_(true),
      conv_{&Converse, this} {
}

bool PamConversation::AsksForNewPassword(std::string_view prompt) {
  for (std::string_view word : {"new", "retype", "verify", "again"}) {
    if (ContainsWord(prompt, word)) {
      return true;
    }
  }
  return false;
}

const std::string& PamConversation::Answer(std::string_view prompt) const {
  return changing_ && AsksForNewPassword(prompt) ? newPassword_ : oldPassword_;
}

int PamConversation::Converse(int count, const pam_message** messages, pam_response** responses,
                              void* data) {
  if (count <= 0 || messages == nullptr || responses == nullptr || data == nullptr) {
    return PAM_CONV_ERR;
  }
  const auto* self = static_cast<const PamConversation*>(data);
  auto* answers = static_cast<pam_response*>(
      std::calloc(static_cast<std::size_t>(count), sizeof(pam_response)));
  if (answers == nullptr) {
    return PAM_BUF_ERR;
  }
  for (int i = 0; i < count; ++i) {
    const pam_message* message = messages[i];
    if (message->msg_style != PAM_PROMPT_ECHO_OFF && message->msg_style != PAM_PROMPT_ECHO_ON) {
      continue;
    }
    const char* prompt = message->msg != nullptr ? message->msg : "";
    answers[i].resp = strdup(self->Answer(prompt).c_str());
    if (answers[i].resp == nullptr) {
      FreeResponses(answers, count);
      return PAM_BUF_ERR;
    }
  }
  *responses = answers;
  return PAM_SUCCESS;
}

}  // namespace Tulk
