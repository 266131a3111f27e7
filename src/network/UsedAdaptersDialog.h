#pragma once
/// "Network Adapters: Warning": the operator selected an adapter that is
/// already an uplink of another switch.
///
/// A question 60 x 11 with a header of 6 rows: the text "One or more of the
/// selected adapters are already used for other connections.", the
/// question "Remove these adapters from their current connections?" and
/// the footer "<Enter> OK  <Esc> Cancel". Enter answers yes (the adapters
/// are taken off their switches when the changes are applied), Esc no;
/// other keys are ignored.

#include "toolkit/ConfirmDialog.h"

namespace Tulk {

class UsedAdaptersDialog : public ConfirmDialog {
 public:
  /// The question above `owner`.
  explicit UsedAdaptersDialog(Frame* owner);
};

}  // namespace Tulk
