#include "restore/SafeModeNetworkDialog.h"

#include <syslog.h>

#include "host/StandardSwitchMove.h"
#include "render/TextId.h"
#include "runtime/SystemLog.h"
#include "toolkit/Footer.h"

namespace Tulk {

SafeModeNetworkDialog::SafeModeNetworkDialog(Frame* owner)
    : ConfirmDialog(owner, kWidth, kHeight, kHeaderHeight, ConfirmKeys::kF11) {
  SetTitle(Text(TextId::kSafeModeTitle));
  SetText(Text(TextId::kSafeModeText));
  SetQuestion(Text(TextId::kSafeModeQuestion));
  SetFooter(Footer::kF11OkCancel);
}

int SafeModeNetworkDialog::Run() {
  if (Ask() != Answer::kYes) {
    return 0;
  }
  MoveManagementToNewStandardSwitch();
  Log(LOG_INFO, "Enabling safe mode networking by moving all uplinks to a new management vSwitch");
  return 1;
}

}  // namespace Tulk
