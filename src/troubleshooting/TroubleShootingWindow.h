#pragma once
/// "Troubleshooting Mode Options": the full-screen menu (MenuWindow) where
/// an operator switches the host's repair services on and off, sets the
/// timeouts and restarts the management agents. The System Customization
/// menu runs it on the stack:
///
///   TroubleShootingWindow window(this);
///   RunFrame(&window);  // 1: the operator left with Esc
///
/// The window believes two flags, `shell enabled` and `ssh enabled`, read
/// once at construction from the init scripts ("/bin/sh sh
/// /etc/init.d/TavShell status" and ".../SSH status": exit 0 is enabled,
/// anything else, a script that cannot run included, is disabled) and
/// afterwards flipped by every toggle, whether or not the commands behind
/// it succeeded: the menu always shows what the operator asked for.
///
/// The five entries, by position:
///
/// | Pos | Label                                  | Right title   | Enter                  |
/// |-----|----------------------------------------|---------------|------------------------|
/// | 0   | "Enable Tavi Shell" / "Disable Tavi Shell" | "Tavi Shell" | toggles the shell     |
/// | 1   | "Enable SSH" / "Disable SSH"           | "SSH Support" | toggles SSH            |
/// | 2   | "Modify Tavi Shell and SSH timeouts"   | the label     | ShellTimeoutDialog     |
/// | 3   | "Modify TULK idle timeout"             | the label     | TulkTimeoutDialog      |
/// | 4   | "Restart Management Agents"            | the label     | RestartAgentsDialog    |
///
/// Entry 2 is greyed and cannot be chosen while either service is enabled.
///
/// The right half is chosen by the cursor's absolute position in the list:
/// position 0 shows the state line in white, a blank line and "Change
/// current state of the Tavi Shell" in light grey; position 1 the same for
/// SSH, but with the blank line inside the white span; positions 2 to 4
/// their description in light grey. Positions 0 to 3 have the footer
/// "<Enter> Change ... <Esc> Exit", position 4 "<Enter> Restart ... <Esc>
/// Exit". Right after the window is shown and after each toggle, the
/// footers are the refresh pair instead (Footer::kMenuSelectSpaced and
/// Footer::kMenuChangeExit, with its blank after "<Esc>") until the cursor
/// moves.
///
/// A toggle (RepairServices.h runs the commands) flips the flag, logs
/// "User %s enabled Tavi Shell" / "User %s disabled Tavi Shell" (or "...
/// SSH") with the console user's name, relabels its entry, greys or frees
/// entry 2 and shows the window again. The dialogs of entries 2 to 4 run
/// above the window, which is redrawn as it was afterwards.
///
/// Decisions of this implementation:
/// - The cursor stays on the entry it was on when the window is shown
///   again after a toggle, so Enter twice on an entry switches the same
///   service off again.
/// - The console user's name is ConsoleUser() (host/HostTools.h): the
///   operator logged in at the console.

#include <cstddef>
#include <string>

#include "toolkit/MenuWindow.h"

namespace Tulk {

class TroubleShootingWindow : public MenuWindow {
 public:
  /// Reads the two services' states and builds the entries, above `owner`.
  explicit TroubleShootingWindow(Frame* owner);
  ~TroubleShootingWindow() override;

  /// The window's belief about the two services.
  bool ShellEnabled() const { return shellEnabled_; }
  bool SshEnabled() const { return sshEnabled_; }

 private:
  void BuildEntries();
  std::string Describe(std::size_t position) const;
  bool Open(std::size_t position);
  void ToggleShell();
  void ToggleSsh();
  void UpdateTimeoutsEntry();

  bool shellEnabled_;
  bool sshEnabled_;
};

}  // namespace Tulk
