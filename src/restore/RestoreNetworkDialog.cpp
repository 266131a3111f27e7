#include "restore/RestoreNetworkDialog.h"

#include <syslog.h>

#include "host/EventReporter.h"
#include "render/TextId.h"
#include "restore/DoRestoreNetworkDialog.h"
#include "runtime/SystemLog.h"
#include "toolkit/Footer.h"
#include "toolkit/RunFrame.h"

namespace Tulk {

RestoreNetworkDialog::RestoreNetworkDialog(Frame* owner)
    : ConfirmDialog(owner, kWidth, kHeight, kHeaderHeight, ConfirmKeys::kF11) {
  SetTitle(Text(TextId::kRestoreNetworkConfirmTitle));
  SetText(Text(TextId::kRestoreNetworkConfirmText));
  SetFooter(Footer::kF11YesResetCancel);
  if (Content() != nullptr) {
    PlaceQuestion(kInset, 0, Content()->Width() - 2 * kInset, Content()->Height());
  }
  SetQuestion(Text(TextId::kRestoreNetworkQuestion));
}

int RestoreNetworkDialog::Run() {
  if (Ask() != Answer::kYes) {
    return 0;
  }
  {
    DoRestoreNetworkDialog restore(this);
    RunFrame(&restore);
  }
  Log(LOG_INFO, "Restoring factory network settings");
  PostEvent(TulkEvent::FactoryNetworkRestored);
  return 1;
}

}  // namespace Tulk
