#include "troubleshooting/ShellTimeoutDialog.h"

#include <syslog.h>

#include <string>

#include "host/HostTools.h"
#include "host/RepairServices.h"
#include "host/TimeoutOptions.h"
#include "include/Constants.h"
#include "render/TextId.h"
#include "runtime/SystemLog.h"
#include "toolkit/InputItem.h"
#include "troubleshooting/TimeoutField.h"

namespace Tulk {

ShellTimeoutDialog::ShellTimeoutDialog(Frame* owner)
    : FormDialog(owner, 70, 21, kShellTimeoutHeaderHeight) {
  const TimeoutOptions options = ReadTimeoutOptions();
  availabilityMinutes_ = options.shellAvailabilitySeconds / 60;
  idleMinutes_ = options.shellIdleSeconds / 60;
  SetTitle(Text(TextId::kShellTimeoutsTitle));
  SetText(Text(TextId::kShellTimeoutsText));
  SetFooter(Footer::kOkCancel);
  availability_ =
      &AddTimeoutField(*this, Text(TextId::kAvailabilityTimeoutLabel), availabilityMinutes_);
  idle_ = &AddTimeoutField(*this, Text(TextId::kIdleTimeoutLabel), idleMinutes_);
}

ShellTimeoutDialog::~ShellTimeoutDialog() = default;

bool ShellTimeoutDialog::Accept() {
  ApplyAvailability();
  ApplyIdle();
  return true;
}

void ShellTimeoutDialog::ApplyAvailability() {
  const TimeoutInput input = ReadTimeoutInput(availability_->Value());
  if (input.kind == TimeoutInput::Kind::kTooLarge) {
    Notify(TextId::kInvalidTimeoutTitle, TextId::kInvalidTimeout);
  }
  if (input.kind != TimeoutInput::Kind::kValid || input.minutes == availabilityMinutes_) {
    return;
  }
  SetAdvancedOption(kShellTimeOutOption, std::int64_t{input.minutes} * 60);
  RestartRunningRepairServices();
  if (input.minutes == 0) {
    Log(LOG_INFO, "Disabled Shell timeout");
  } else {
    Log(LOG_INFO, "Modified Shell timeout to %d minutes", static_cast<int>(input.minutes));
  }
}

void ShellTimeoutDialog::ApplyIdle() {
  const TimeoutInput input = ReadTimeoutInput(idle_->Value());
  if (input.kind == TimeoutInput::Kind::kTooLarge) {
    Notify(TextId::kInvalidTimeoutTitle, TextId::kInvalidTimeout);
  }
  if (input.kind != TimeoutInput::Kind::kValid || input.minutes == idleMinutes_) {
    return;
  }
  SetAdvancedOption(kShellInteractiveTimeOutOption, std::int64_t{input.minutes} * 60);
  if (input.minutes == 0) {
    Log(LOG_INFO, "Disabled shell interactive timeout");
  } else {
    Log(LOG_INFO, "Modified shell interactive timeout to %d minutes",
        static_cast<int>(input.minutes));
  }
}

}  // namespace Tulk
