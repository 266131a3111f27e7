#pragma once
/// "Configure Management Network: Confirm": whether to apply the pending
/// changes when the operator leaves the management network window.
///
/// A question 70 x 15 with a header of 9 rows: the text about a brief
/// network outage (and a restart of the host when IPv6 was switched on or
/// off), the question "Apply changes and reboot host?" when the IPv6 flag
/// changed and "Apply changes and restart management network?" otherwise,
/// and the footer "<Y> Yes  <N> No ... <Esc> Cancel". y or Y answers yes,
/// n or N no, Esc cancels; other keys are ignored. Run() returns the
/// Answer as an int.

#include "toolkit/ConfirmDialog.h"

namespace Tulk {

class ApplyChangesDialog : public ConfirmDialog {
 public:
  /// The question above `owner`; `ipv6Changed` picks the question.
  ApplyChangesDialog(Frame* owner, bool ipv6Changed);
};

}  // namespace Tulk
