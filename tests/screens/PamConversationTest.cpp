#include "screens/PamConversation.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <string>
#include <vector>

namespace Tulk {
namespace {

struct PromptCase {
  const char* prompt;
  bool asksForNew;
};

class PromptTest : public ::testing::TestWithParam<PromptCase> {};

TEST_P(PromptTest, AnswersNewOrOldPasswordByPrompt) {
  PamConversation change("old-secret", "new-secret");
  PamConversation login("the-pin");
  EXPECT_EQ(change.Answer(GetParam().prompt), GetParam().asksForNew ? "new-secret" : "old-secret");
  EXPECT_EQ(login.Answer(GetParam().prompt), "the-pin");
}

INSTANTIATE_TEST_SUITE_P(
    ModulePrompts, PromptTest,
    ::testing::Values(PromptCase{"Password: ", false}, PromptCase{"Old password: ", false},
                      PromptCase{"Current password: ", false}, PromptCase{"PIN: ", false},
                      PromptCase{"New password: ", true}, PromptCase{"Verify New Password :", true},
                      PromptCase{"Retype new password: ", true},
                      PromptCase{"Enter it again: ", true},
                      PromptCase{"NEW UNIX PASSWORD:", true}));

// Calls the conversation the way a module does, through the pam_conv the
// console hands to pam_start.
std::vector<std::string> Converse(const PamConversation& conversation,
                                  const std::vector<pam_message>& messages, int* status) {
  std::vector<const pam_message*> pointers;
  for (const pam_message& message : messages) {
    pointers.push_back(&message);
  }
  pam_response* responses = nullptr;
  const pam_conv* conv = conversation.Get();
  *status =
      conv->conv(static_cast<int>(pointers.size()), pointers.data(), &responses, conv->appdata_ptr);
  std::vector<std::string> answers;
  if (*status != PAM_SUCCESS) {
    return answers;
  }
  for (std::size_t i = 0; i < messages.size(); ++i) {
    answers.push_back(responses[i].resp != nullptr ? responses[i].resp : "<none>");
    std::free(responses[i].resp);
  }
  std::free(responses);
  return answers;
}

TEST(PamConversationTest, AnswersEveryPromptOfOneCallAndSkipsMessages) {
  PamConversation conversation("old", "new");
  int status = -1;
  std::vector<std::string> answers = Converse(conversation,
                                              {{PAM_TEXT_INFO, "Changing password"},
                                               {PAM_PROMPT_ECHO_OFF, "Old password: "},
                                               {PAM_ERROR_MSG, "Passwords do not match"},
                                               {PAM_PROMPT_ECHO_OFF, "New password: "},
                                               {PAM_PROMPT_ECHO_ON, "Verify New Password :"}},
                                              &status);
  ASSERT_EQ(status, PAM_SUCCESS);
  EXPECT_EQ(answers, (std::vector<std::string>{"<none>", "old", "<none>", "new", "new"}));
}

}  // namespace
}  // namespace Tulk
