#pragma once
/// "Set the timeouts for Tavi Shell access (local and remote)": the
/// availability timeout (how long after the shell or SSH is enabled a user
/// may still log in) and the idle timeout of shell sessions, in minutes.
///
/// A form 70 x 21 (FormDialog) with two input fields, "Availability
/// timeout" and "Idle timeout", showing the options' seconds divided by 60
/// (rounded down; an unreadable option shows its read default, 0). Each
/// field takes digits and the editing keys only, at most five characters
/// (a sixth digit is not taken). Up and Down move between the fields;
/// Enter applies both; Esc returns 0 and changes nothing.
///
/// Enter, for each field in turn, independently of the other:
/// - empty: nothing changes, nothing is logged;
/// - above 1440: the message "Invalid timeout value" / "Timeout value must
///   be between 0 (disabled) and 1440 minutes"; the option keeps its value
///   (two messages may follow each other);
/// - equal to the minutes shown when the dialog opened: nothing;
/// - otherwise the minutes times 60 are written (SetAdvancedOption).
///   For the availability timeout each repair service whose status
///   reports it running is restarted, then "Modified Shell timeout to %d
///   minutes" or, for 0, "Disabled Shell timeout" is logged. For the idle
///   timeout "Modified shell interactive timeout to %d minutes" or
///   "Disabled shell interactive timeout"; nothing is restarted.
/// Run() then returns 1, also after a refused value.
///
/// Minutes are compared with the minutes shown, so a stored 90 seconds
/// (shown as 1) is left alone when the operator just presses Enter.
///
/// Decisions of this implementation:
/// - A failed write is not shown (the runner logs it); the restart and the
///   log line follow it all the same.

#include <cstdint>

#include "toolkit/FormDialog.h"

namespace Tulk {

class InputItem;

class ShellTimeoutDialog : public FormDialog {
 public:
  /// Reads the two options and lays the form out above `owner`.
  explicit ShellTimeoutDialog(Frame* owner);
  ~ShellTimeoutDialog() override;

 protected:
  bool Accept() override;

 private:
  void ApplyAvailability();
  void ApplyIdle();

  std::uint32_t availabilityMinutes_;
  std::uint32_t idleMinutes_;
  InputItem* availability_;
  InputItem* idle_;
};

}  // namespace Tulk
