#include "screens/SamePasswordConfirmDialog.h"

#include "render/TextId.h"

namespace Tulk {

SamePasswordConfirmDialog::SamePasswordConfirmDialog(Frame* owner)
    : ConfirmDialog(owner, 60, 9, 6, ConfirmKeys::kEnter) {
  SetTitle(Text(TextId::kPasswordWarningTitle));
  SetText(Text(TextId::kSamePassword));
  SetFooter(Footer::kConfirmCancel);
}

}  // namespace Tulk
