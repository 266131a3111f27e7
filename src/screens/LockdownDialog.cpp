#include "screens/LockdownDialog.h"

#include "host/HostTools.h"
#include "render/TextId.h"
#include "toolkit/CheckItem.h"
#include "toolkit/MessageDialog.h"
#include "toolkit/RunFrame.h"

namespace Tulk {

LockdownDialog::LockdownDialog(Frame* owner)
    : FormDialog(owner, 60, 11, 6), wasEnabled_(OskCmdGetFlag("osksvc/auth/lockdown_is_enabled")) {
  box_ = &AddCheck(Text(TextId::kEnableLockdown), wasEnabled_);
  SetTitle(Text(TextId::kLockdownTitle));
  SetText(Text(TextId::kLockdownText));
  SetFooter(Footer::kToggleOkCancel);
}

bool LockdownDialog::Accept() {
  if (box_->Checked() != wasEnabled_) {
    const char* command =
        box_->Checked() ? "osksvc/auth/lockdown_enter" : "osksvc/auth/lockdown_exit";
    if (RunOskCommand(command) != 0) {
      MessageDialog message(this, TextId::kOperationFailed, Text(TextId::kCheckSyslog));
      RunFrame(&message);
    }
  }
  return true;
}

}  // namespace Tulk
