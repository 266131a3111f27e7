#include "network/RestartNetworkDialog.h"

#include <optional>

#include "host/ManagementRestart.h"
#include "network/DoRestartNetworkDialog.h"
#include "render/TextId.h"
#include "toolkit/Footer.h"
#include "toolkit/MessageDialog.h"
#include "toolkit/RunFrame.h"

namespace Tulk {

RestartNetworkDialog::RestartNetworkDialog(Frame* owner)
    : ConfirmDialog(owner, kWidth, kHeight, kHeaderHeight, ConfirmKeys::kF11) {
  SetTitle(Text(TextId::kRestartNetworkConfirmTitle));
  SetText(Text(TextId::kRestartNetworkConfirmText));
  SetQuestion(Text(TextId::kRestartNetworkQuestion));
  SetFooter(Footer::kF11OkCancel);
}

int RestartNetworkDialog::Run() {
  if (Ask() != Answer::kYes) {
    return 0;
  }
  const std::optional<ManagementIpState> state = ReadManagementIpState();
  if (!state) {
    MessageDialog message(this, TextId::kRestartNetworkErrorTitle,
                          Text(TextId::kNoManagementInterface));
    RunFrame(&message);
    return 0;
  }
  DoRestartNetworkDialog restart(this, *state);
  return RunFrame(&restart);
}

}  // namespace Tulk
