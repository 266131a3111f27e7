#include "screens/ShutdownDialog.h"

#include <curses.h>
#include <syslog.h>

#include <memory>

#include "host/EventReporter.h"
#include "render/TextId.h"
#include "runtime/SystemLog.h"
#include "screens/RebootConfirmDialog.h"
#include "screens/ShutdownConfirmDialog.h"
#include "toolkit/CheckItem.h"
#include "toolkit/RunFrame.h"

namespace Tulk {

ShutdownDialog::ShutdownDialog(Frame* owner) : FormDialog(owner, 60, 19, 13) {
  terminate_ = &AddCheck(Text(TextId::kForceTerminateVms));
  SetTitle(Text(TextId::kShutdownTitle));
  SetText(Text(TextId::kShutdownText));
  SetFooter(Footer::kShutdownRestartCancel);
}

bool ShutdownDialog::OnKey(int key) {
  if (key == KEY_F(2) || key == KEY_F(11)) {
    PowerAction(key == KEY_F(11));
    return true;
  }
  return false;
}

bool ShutdownDialog::Accept() {
  return false;
}

void ShutdownDialog::PowerAction(bool reboot) {
  const bool graceful = !terminate_->Checked();
  std::unique_ptr<PowerConfirmDialog> confirm;
  if (reboot) {
    Log(LOG_INFO, "Rebooting host");
    PostEvent(TulkEvent::RebootHost);
    confirm = std::make_unique<RebootConfirmDialog>(this, graceful);
  } else {
    Log(LOG_INFO, "Shutting down host");
    PostEvent(TulkEvent::ShutdownHost);
    confirm = std::make_unique<ShutdownConfirmDialog>(this, graceful);
  }
  RunFrame(confirm.get());
}

}  // namespace Tulk
