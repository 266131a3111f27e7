#include "screens/ShutdownDialog.h"

#include <curses.h>
#include <syslog.h>

#include <memory>

#include "host/EventReporter.h"
#include "include/Keys.h"
#include "render/TextId.h"
#include "runtime/SystemLog.h"
#include "screens/PowerConfirmDialog.h"
#include "toolkit/ItemList.h"
#include "toolkit/RunFrame.h"

namespace Tulk {
namespace {

constexpr std::uint32_t kTitle = 170;
constexpr std::uint32_t kMessage = 171;
constexpr std::uint32_t kTerminateCaption = 172;
constexpr char kFooter[] =
    "{color:black}<F2>{/color} {color:dark-grey}Shut Down{/color}  {color:black}<F11>{/color} "
    "{color:dark-grey}Restart{/color}{align:right}{color:black}<Esc>{/color} "
    "{color:dark-grey}Cancel{/color}{/align}";

bool Required(ShutdownReason reason) {
  return reason != ShutdownReason::kOperator;
}

}  // namespace

ShutdownDialog::ShutdownDialog(Frame* owner, ShutdownReason reason)
    : Dialog(owner, Required(reason) ? 70 : 60, Required(reason) ? 11 : 19,
             Required(reason) ? 5 : 13),
      reason_(reason),
      terminate_(Text(kTerminateCaption), false, 0) {
  list_ = new ItemList(Content(), 0, 0, Content()->Width(), Content()->Height());
  list_->SetItems({&terminate_});
  switch (reason_) {
    case ShutdownReason::kOperator:
      SetTitle(Text(kTitle));
      SetText(Text(kMessage));
      SetFooter(kFooter);
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

int ShutdownDialog::Run() {
  list_->Draw();
  for (;;) {
    const int key = WaitKey();
    if (key == kKeySpace) {
      terminate_.Toggle();
      list_->Draw();
    } else if (key == KEY_F(2) && !Required(reason_)) {
      PowerAction(false);
    } else if (key == KEY_F(11)) {
      PowerAction(true);
    } else if (key == kKeyEsc) {
      return 0;
    }
  }
}

void ShutdownDialog::PowerAction(bool reboot) {
  const bool graceful = !terminate_.Checked();
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
