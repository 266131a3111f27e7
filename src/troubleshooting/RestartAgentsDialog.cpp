#include "troubleshooting/RestartAgentsDialog.h"

#include <syslog.h>

#include "host/EventReporter.h"
#include "host/ManagementAgents.h"
#include "render/TextId.h"
#include "runtime/SystemLog.h"
#include "toolkit/CheckItem.h"
#include "toolkit/TextArea.h"

namespace Tulk {
namespace {

constexpr int kHeaderHeight = 9;
// The progress text inside the client area.
constexpr int kProgressColumn = 1;
constexpr int kProgressRow = 2;
constexpr int kProgressRows = 3;
// The check box, one row below the progress text.
constexpr int kCheckRow = kProgressRow + kProgressRows + 1;

}  // namespace

RestartAgentsDialog::RestartAgentsDialog(Frame* owner)
    : ConfirmDialog(owner, 71, 20, kHeaderHeight, ConfirmKeys::kF11) {
  SetTitle(Text(TextId::kRestartAgentsConfirmTitle));
  SetText(Text(TextId::kRestartAgentsWarning));
  SetFooter(Footer::kF11OkCancel);
  if (Content() != nullptr) {
    const int width = Content()->Width();
    PlaceQuestion(kProgressColumn, kProgressRow, width - 2 * kProgressColumn, kProgressRows);
    AddCheck(Text(TextId::kCollectTroubleshootingInfo), 0, kCheckRow, width);
  }
  SetQuestion(Text(TextId::kRestartAgentsQuestion));
}

RestartAgentsDialog::~RestartAgentsDialog() = default;

void RestartAgentsDialog::ShowProgress(const std::string& done, const char* running) {
  if (Question() == nullptr) {
    return;
  }
  if (running == nullptr) {
    Question()->SetText(done);
  } else {
    // Finished steps in dark grey, the one running in black.
    Question()->SetText(done + "{/color}{color:black}" + running + "{/color}");
  }
}

int RestartAgentsDialog::Run() {
  if (Ask() != Answer::kYes) {
    return 0;
  }
  SetFooter("");
  Log(LOG_INFO, "Restarting host agents");
  PostEvent(TulkEvent::RestartingHostAgents);

  const std::string done = std::string(" ") + Text(TextId::kDone);
  std::string progress = "{color:dark-grey}";
  if (Check() != nullptr && Check()->Checked() && StartLiveCoreCapture()) {
    progress += Text(TextId::kCollectingLiveCore) + done + "\n";
    ShowProgress(progress);
  }

  ShowProgress(progress, Text(TextId::kStoppingAgents));
  StopManagementAgents();
  progress += Text(TextId::kStoppingAgents) + done + "\n";

  ShowProgress(progress, Text(TextId::kStartingAgents));
  StartManagementAgents();
  progress += Text(TextId::kStartingAgents) + done + "{/color}";
  ShowProgress(progress);

  SetFooter(Footer::kOk);
  return WaitForEnter();
}

}  // namespace Tulk
