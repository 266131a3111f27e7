#include "screens/PowerConfirmDialog.h"

#include "host/CommandRunner.h"
#include "host/HostTools.h"

namespace Tulk {

PowerConfirmDialog::PowerConfirmDialog(Frame* owner, bool graceful, std::uint32_t titleId,
                                       std::uint32_t messageId, std::string command)
    : Dialog(owner, 70, 10, 6),
      graceful_(graceful),
      titleId_(titleId),
      messageId_(messageId),
      command_(std::move(command)) {
  SetTitle(Text(titleId_));
  SetText(Text(messageId_));
}

int PowerConfirmDialog::Run() {
  SetTitle(Text(titleId_));
  SetText(Text(messageId_));
  PowerOffVirtualMachines(graceful_);
  if (RunShellCommand(command_) == -1) {
    return 0;
  }
  for (;;) {
    WaitKey();
  }
}

ShutdownConfirmDialog::ShutdownConfirmDialog(Frame* owner, bool graceful)
    : PowerConfirmDialog(owner, graceful, 173, 174, "poweroff") {
}

RebootConfirmDialog::RebootConfirmDialog(Frame* owner, bool graceful)
    : PowerConfirmDialog(owner, graceful, 177, 178, "reboot") {
}

}  // namespace Tulk
