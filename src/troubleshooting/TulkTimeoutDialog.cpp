#include "troubleshooting/TulkTimeoutDialog.h"

#include <syslog.h>

#include "host/HostTools.h"
#include "host/TimeoutOptions.h"
#include "include/Constants.h"
#include "render/TextId.h"
#include "runtime/KeyInput.h"
#include "runtime/SystemLog.h"
#include "toolkit/InputItem.h"
#include "troubleshooting/TimeoutField.h"

namespace Tulk {

TulkTimeoutDialog::TulkTimeoutDialog(Frame* owner)
    : FormDialog(owner, 70, 15, kTulkTimeoutHeaderHeight),
      storedSeconds_(ReadTimeoutOptions().tulkIdleSeconds) {
  SetTitle(Text(TextId::kTulkTimeoutTitle));
  SetText(Text(TextId::kTulkTimeoutText));
  SetFooter(Footer::kOkCancel);
  timeout_ = &AddTimeoutField(*this, Text(TextId::kTulkTimeoutLabel), storedSeconds_ / 60);
}

TulkTimeoutDialog::~TulkTimeoutDialog() = default;

bool TulkTimeoutDialog::Accept() {
  const TimeoutInput input = ReadTimeoutInput(timeout_->Value());
  if (input.kind == TimeoutInput::Kind::kTooLarge) {
    Notify(TextId::kInvalidTimeoutTitle, TextId::kInvalidTimeout);
  }
  const std::int64_t seconds = std::int64_t{input.minutes} * 60;
  if (input.kind != TimeoutInput::Kind::kValid || seconds == storedSeconds_) {
    return true;
  }
  SetAdvancedOption(kTulkTimeOutOption, seconds);
  ReloadIdleTimeout();
  if (input.minutes == 0) {
    Log(LOG_INFO, "Disabled Tulk timeout");
  } else {
    Log(LOG_INFO, "Modified Tulk timeout to %d minutes", static_cast<int>(input.minutes));
  }
  return true;
}

}  // namespace Tulk
