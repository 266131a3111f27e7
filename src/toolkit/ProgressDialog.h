#pragma once
/// A report of work done step by step: a text area in the client area to
/// which each step and its outcome are appended, a footer swapped when the
/// work is over, and Enter as the only way out.
///
///   ProgressDialog progress(this, 60, 12, 7);
///   progress.SetTitle(Text(TextId::kRestoreNetworkTitle));
///   progress.Append(Text(TextId::kAutoConfiguringNetwork));
///   progress.Append(" ");
///   progress.AppendOutcome(RunStep());  // "Done." or "Failed."
///   progress.Finish(Footer::kProgressOk);  // waits for Enter
///
/// Each append reaches the terminal before the dialog goes on, so the step
/// being worked on is on the screen while its command runs.

#include <string_view>

#include "toolkit/Dialog.h"

namespace Tulk {

class ProgressDialog : public Dialog {
 public:
  /// A report `width` x `height` with a header `headerHeight` rows high; the
  /// text area fills the client area.
  ProgressDialog(Frame* owner, int width, int height, int headerHeight);

  /// Moves the text area to `column`, `row` of the client area, `width` x
  /// `height`.
  void PlaceText(int column, int row, int width, int height);

  /// Replaces the whole report text (markup).
  void Show(std::string_view text);
  /// Appends `text` to the report.
  void Append(std::string_view text);
  /// Appends "Done." when `ok`, else "Failed." (the catalogue's texts).
  void AppendOutcome(bool ok);
  /// The report text so far.
  const std::string& Report() const;

  /// Sets `footer` and waits for Enter (every other key, Esc too, is
  /// ignored); returns 1.
  int Finish(std::string_view footer);

  /// The report's text area (null when the dialog has no client area).
  TextArea* Area() const { return area_; }

 private:
  TextArea* area_ = nullptr;
};

}  // namespace Tulk
