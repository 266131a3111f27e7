#include "screens/RestoreDialog.h"

#include <curses.h>
#include <syslog.h>

#include <cstdlib>

#include "host/CommandRunner.h"
#include "host/EventReporter.h"
#include "render/TextId.h"
#include "runtime/HostPath.h"
#include "runtime/KeyInput.h"
#include "runtime/SystemLog.h"
#include "screens/ShellQuote.h"

namespace Tulk {
namespace {

constexpr char kResetScript[] = "/sbin/firmwareConfig.py";

[[noreturn]] void WaitForHostToGoDown() {
  for (;;) {
    const int result = PollInput(nullptr);
    if (result == kPollTerminate || result == kPollHangUp) {
      std::exit(0);
    }
  }
}

}  // namespace

RestoreDialog::RestoreDialog(Frame* owner) : ConfirmDialog(owner, 60, 12, 7, ConfirmKeys::kF11) {
  if (Content() != nullptr) {
    PlaceQuestion(0, 0, Content()->Width() - 6, Content()->Height());
  }
  SetTitle(Text(TextId::kResetConfirmTitle));
  SetText(Text(TextId::kResetConfirmText));
  SetQuestion(Text(TextId::kResetQuestion));
  SetFooter(Footer::kF11OkCancel);
}

int RestoreDialog::Run() {
  if (Ask() != Answer::kYes) {
    return 0;
  }

  Log(LOG_INFO, "Restoring factory defaults");
  PostEvent(TulkEvent::RestoreFactoryDefaults);
  {
    DrawBatch batch;
    SetTitle(Text(TextId::kResetTitle));
    SetText(Text(TextId::kResetWait));
  }
  const std::string reset = ShellQuote(HostPath(kResetScript)) + " --reset-only > /dev/null 2>&1";
  if (RunShellCommand(reset, kResetTimeoutSeconds) != 0) {
    return 0;
  }

  {
    DrawBatch batch;
    SetQuestion("");
    SetFooter(Footer::kRestartHost);
    SetText(Text(TextId::kResetDone));
  }
  WaitForEnter();
  if (RunShellCommand("reboot -f", kPowerCommandTimeoutSeconds) == -1) {
    return 0;
  }
  WaitForHostToGoDown();
}

}  // namespace Tulk
