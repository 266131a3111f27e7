#pragma once
/// "Set idle timeout for TULK access": how many idle minutes the console
/// waits before it logs the operator out.
///
/// A form 70 x 15 (FormDialog) with one input field, "TULK idle timeout",
/// showing the stored seconds divided by 60 (an unreadable option shows its
/// read default, 10 minutes). The field takes digits and the editing keys
/// only, at most five characters. Enter applies it; Esc returns 0 and
/// changes nothing; Up and Down do nothing.
///
/// Enter:
/// - an empty field changes nothing and logs nothing;
/// - 1441 or more: the message "Invalid timeout value" / "Timeout value
///   must be between 0 (disabled) and 1440 minutes", nothing changes;
/// - otherwise, when the minutes times 60 differ from the stored seconds:
///   writes them to "/UserVars/TulkTimeOut" (SetAdvancedOption), makes the
///   key loop read its idle timeout again at once (ReloadIdleTimeout), so
///   the new timeout applies to this session, and logs "Modified Tulk
///   timeout to %d minutes" or, for 0, "Disabled Tulk timeout".
/// Run() then returns 1, also after a refused value.
///
/// Seconds are compared with the stored seconds, so a stored 90 seconds
/// (shown as 1) is rewritten as 60 when the operator just presses Enter.

#include <cstdint>

#include "toolkit/FormDialog.h"

namespace Tulk {

class InputItem;

class TulkTimeoutDialog : public FormDialog {
 public:
  /// Reads the option and lays the form out above `owner`.
  explicit TulkTimeoutDialog(Frame* owner);
  ~TulkTimeoutDialog() override;

 protected:
  bool Accept() override;

 private:
  std::uint32_t storedSeconds_;
  InputItem* timeout_;
};

}  // namespace Tulk
