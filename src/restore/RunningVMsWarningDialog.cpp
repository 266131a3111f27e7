#include "restore/RunningVMsWarningDialog.h"

#include "render/TextId.h"
#include "toolkit/Footer.h"

namespace Tulk {

RunningVMsWarningDialog::RunningVMsWarningDialog(Frame* owner)
    : ConfirmDialog(owner, kWidth, kHeight, kHeaderHeight, ConfirmKeys::kEnter) {
  SetTitle(Text(TextId::kRunningVmsTitle));
  SetText(Text(TextId::kRunningVmsText));
  SetFooter(Footer::kConfirmCancel);
}

}  // namespace Tulk
