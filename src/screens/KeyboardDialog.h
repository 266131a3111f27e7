#pragma once
/// "Configure Keyboard": chooses the host's keyboard layout.
///
/// A dialog 60 x 19 with a header of 7 rows: title 15 ("Configure
/// Keyboard"), header text 257, and in the body a list of radio buttons,
/// one per layout the host offers (ReadKeyboardLayouts(), in the host's
/// order), 8 rows high with a scroll bar
/// when there are more. The configured layout is selected and current at
/// the start.
///
/// Keys: Up/Down move; Space selects the current layout; Enter selects
/// the current layout, sets it as the host's layout when it differs from
/// the configured one (logging "Keyboard layout changed to %s" at
/// informational priority) and returns 1; Esc returns 0 and changes
/// nothing.
///
/// Host failures (HostMgr::Lib::HostMgrException) are logged at error
/// priority, "Getting keyboard layouts failed: %s" or "Setting keyboard
/// layout failed: %s", and shown as a message dialog "Operation Failed"
/// (276) with "Please check the syslog for more information." (280); the
/// dialog then returns 0. The login dialog and the System Customization
/// menu both run it.

#include <string>
#include <vector>

#include "toolkit/FormDialog.h"
#include "toolkit/RadioGroup.h"

namespace Tulk {

class KeyboardDialog : public FormDialog {
 public:
  /// Reads the host's layouts and the configured one and lays the dialog
  /// out above `owner`.
  explicit KeyboardDialog(Frame* owner);
  ~KeyboardDialog() override;

  /// 1 when a layout was chosen with Enter, 0 on Esc or a host failure.
  int Run() override;

  const std::vector<std::string>& Layouts() const { return layouts_; }
  const std::string& Configured() const { return configured_; }

 protected:
  bool Accept() override;

 private:
  void Fail(const std::string& logLine);

  std::vector<std::string> layouts_;
  std::string configured_;
  std::string readError_;
  RadioGroup group_;
};

}  // namespace Tulk
