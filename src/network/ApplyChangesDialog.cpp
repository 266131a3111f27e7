#include "network/ApplyChangesDialog.h"

#include "render/TextId.h"

namespace Tulk {

ApplyChangesDialog::ApplyChangesDialog(Frame* owner, bool ipv6Changed)
    : ConfirmDialog(owner, 70, 15, 9, ConfirmKeys::kYesNo) {
  SetTitle(Text(TextId::kApplyChangesTitle));
  SetText(Text(TextId::kApplyChangesText));
  SetQuestion(Text(ipv6Changed ? TextId::kApplyAndReboot : TextId::kApplyAndRestartNetwork));
  SetFooter(Footer::kYesNoCancel);
}

}  // namespace Tulk
