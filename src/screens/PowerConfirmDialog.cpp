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
  if (RunShellCommand(command_, kPowerCommandTimeoutSeconds) == -1) {
    return 0;
  }
  for (;;) {
    WaitKey();
  }
}

}  // namespace Tulk
