#include "restore/DoRestoreNetworkDialog.h"

#include <syslog.h>

#include "host/FactoryNetworkRestore.h"
#include "render/TextId.h"
#include "restore/RunningVMsWarningDialog.h"
#include "runtime/SystemLog.h"
#include "toolkit/Footer.h"
#include "toolkit/RunFrame.h"

namespace Tulk {

DoRestoreNetworkDialog::DoRestoreNetworkDialog(Frame* owner)
    : ProgressDialog(owner, kWidth, kHeight, kHeaderHeight) {
  SetTitle(Text(TextId::kRestoreNetworkTitle));
  SetText(Text(TextId::kRestoreNetworkWait));
}

int DoRestoreNetworkDialog::Run() {
  int powerOff = 0;
  if (HasRunningVirtualMachines()) {
    {
      RunningVMsWarningDialog warning(this);
      if (RunFrame(&warning) == 0) {
        return 0;
      }
    }
    Show(Text(TextId::kPoweringOffVms));
    Append(" ");
    powerOff = PowerOffAllVirtualMachines();
    if (powerOff == 0) {
      AppendOutcome(true);
      Append("\n");
    }
  }
  HostOutcome step = DisableNetworkDumper();
  if (step.ok && powerOff != 0) {
    AppendOutcome(false);
    Log(LOG_ERR, "Powering off VMs failed");
    return Finish(Footer::kProgressOk);
  }
  if (step.ok) {
    Append(Text(TextId::kAutoConfiguringNetwork));
    Append(" ");
    step = ClearNetworkConfiguration();
  }
  if (step.ok) {
    step = AutoConfigureNetwork();
  }
  AppendOutcome(step.ok);
  if (!step.ok) {
    Log(LOG_ERR, "auto-configuring network failed");
  }
  return Finish(Footer::kProgressOk);
}

}  // namespace Tulk
