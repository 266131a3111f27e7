#include "network/UsedAdaptersDialog.h"

#include "render/TextId.h"

namespace Tulk {

UsedAdaptersDialog::UsedAdaptersDialog(Frame* owner)
    : ConfirmDialog(owner, 60, 11, 6, ConfirmKeys::kEnter) {
  SetTitle(Text(TextId::kUsedAdaptersTitle));
  SetText(Text(TextId::kUsedAdaptersText));
  SetQuestion(Text(TextId::kUsedAdaptersQuestion));
  SetFooter(Footer::kOkCancel);
}

}  // namespace Tulk
