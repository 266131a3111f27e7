#include "screens/RestoreDialog.h"

#include <curses.h>
#include <syslog.h>

#include <cstdlib>

#include "host/CommandRunner.h"
#include "host/EventReporter.h"
#include "include/Keys.h"
#include "runtime/HostPath.h"
#include "runtime/KeyInput.h"
#include "runtime/SystemLog.h"
#include "screens/ShellQuote.h"
#include "toolkit/TextArea.h"

namespace Tulk {
namespace {

constexpr char kConfirmFooter[] =
    "{align:right}{color:black}<F11>{/color} {color:dark-grey}OK{/color}  "
    "{color:black}<Esc>{/color} {color:dark-grey}Cancel{/color}{/align}";
constexpr char kRestartFooter[] =
    "{align:right}{color:black}<Enter>{/color} {color:dark-grey}Restart Host{/color}{/align}";
constexpr char kResetScript[] = "/sbin/firmwareConfig.py";

[[noreturn]] void WaitForHostToGoDown() {
  for (;;) {
    if (PollInput(nullptr) == kPollTerminate) {
      std::exit(0);
    }
  }
}

}  // namespace

RestoreDialog::RestoreDialog(Frame* owner) : Dialog(owner, 60, 12, 7) {
  if (Content() != nullptr) {
    area_ = new TextArea(Content(), 0, 0, Content()->Width() - 6, Content()->Height());
  }
}

RestoreDialog::~RestoreDialog() = default;

int RestoreDialog::Run() {
  {
    DrawBatch batch;
    SetTitle(Text(179));
    SetText(Text(180));
    if (area_ != nullptr) {
      area_->SetText(Text(181));
    }
    SetFooter(kConfirmFooter);
  }
  for (;;) {
    const int key = WaitKey();
    if (key == kKeyEsc) {
      return 0;
    }
    if (key == KEY_F(11)) {
      break;
    }
  }

  Log(LOG_INFO, "Restoring factory defaults");
  PostEvent(TulkEvent::RestoreFactoryDefaults);
  {
    DrawBatch batch;
    SetTitle(Text(182));
    SetText(Text(183));
  }
  const std::string reset = ShellQuote(HostPath(kResetScript)) + " --reset-only > /dev/null 2>&1";
  if (RunShellCommand(reset) != 0) {
    return 0;
  }

  {
    DrawBatch batch;
    if (area_ != nullptr) {
      area_->SetText("");
    }
    SetFooter(kRestartFooter);
    SetText(Text(184));
  }
  while (WaitKey() != kKeyEnter) {
  }
  if (RunShellCommand("reboot -f") == -1) {
    return 0;
  }
  WaitForHostToGoDown();
}

}  // namespace Tulk
