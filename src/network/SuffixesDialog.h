#pragma once
/// "Custom DNS Suffixes": the search suffixes as the operator types them.
///
/// A form 70 x 13 with a header of 8 rows: title "Custom DNS Suffixes",
/// the text about appending suffixes to short names, one input
/// "Suffixes:" and the footer "<Enter> OK  <Esc> Cancel". The input takes
/// letters, digits, blank, ".", ",", "-" and the editing keys; the cursor
/// shows while the dialog is open. Enter keeps the text exactly as typed
/// (it is split into names only when the changes are applied); Esc leaves
/// the pending text alone.

#include <string>

#include "toolkit/FormDialog.h"

namespace Tulk {

class SuffixesDialog : public FormDialog {
 public:
  /// The dialog above `owner` showing the pending text `suffixes`.
  SuffixesDialog(Frame* owner, const std::string& suffixes);

  /// The text as typed (after Enter).
  const std::string& Suffixes() const;

 private:
  InputItem* input_;
};

}  // namespace Tulk
