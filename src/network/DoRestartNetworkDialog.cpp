#include "network/DoRestartNetworkDialog.h"

#include <syslog.h>

#include <utility>

#include "host/EventReporter.h"
#include "network/RestartReport.h"
#include "render/TextId.h"
#include "runtime/SystemLog.h"
#include "toolkit/Footer.h"

namespace Tulk {

DoRestartNetworkDialog::DoRestartNetworkDialog(Frame* owner, ManagementIpState state)
    : ProgressDialog(owner, kWidth, kHeight, kHeaderHeight), state_(std::move(state)) {
  SetTitle(Text(TextId::kRestartNetworkTitle));
  SetText(Text(TextId::kRestartNetworkWait));
}

int DoRestartNetworkDialog::Run() {
  const std::string& name = state_.interfaceName;
  Log(LOG_INFO, "Restarting %s", name.c_str());
  PostEvent(TulkEvent::NetworkRestart, {name});

  Append(Text(TextId::kStoppingManagementNetwork));
  Append(" ");
  Append(Text(TextId::kDone));
  Append("\n");
  Append(Text(TextId::kStartingManagementNetwork));
  Append(" ");
  const bool restarted = RestartManagementInterface(name);
  Append(RestartAddressReport(state_, Text(TextId::kIpAddressIs)));
  AppendOutcome(restarted);
  return Finish(Footer::kProgressOk);
}

}  // namespace Tulk
