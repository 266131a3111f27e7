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
namespace {

bool Required(ShutdownReason reason) {
  return reason != ShutdownReason::kOperator;
}

}  // namespace

ShutdownDialog::ShutdownDialog(Frame* owner, ShutdownReason reason)
    : FormDialog(owner, Required(reason) ? 70 : 60, Required(reason) ? 11 : 19,
                 Required(reason) ? 5 : 13),
      reason_(reason) {
  terminate_ = &AddCheck(Text(TextId::kForceTerminateVms));
  switch (reason_) {
    case ShutdownReason::kOperator:
      SetTitle(Text(TextId::kShutdownTitle));
      SetText(Text(TextId::kShutdownText));
      SetFooter(Footer::kShutdownRestartCancel);
      break;
    case ShutdownReason::kIpv6Enabled:
      SetTitle(Text(TextId::kEnableIpv6RestartTitle));
      SetText(Text(TextId::kEnableIpv6RestartText));
      SetFooter(Footer::kRestartNowLater);
      break;
    case ShutdownReason::kIpv6Disabled:
      SetTitle(Text(TextId::kDisableIpv6RestartTitle));
      SetText(Text(TextId::kDisableIpv6RestartText));
      SetFooter(Footer::kRestartNowLater);
      break;
  }
}

bool ShutdownDialog::OnKey(int key) {
  if ((key == KEY_F(2) && !Required(reason_)) || key == KEY_F(11)) {
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
