#pragma once
/// The details view of a list entry (InfoType.h): a dialog 70 x 15 with
/// the entry's details title, a one-line message (the entry's name line),
/// the detail text in the client area and a footer. Only Enter closes it;
/// its result is 1.
///
/// The header is 5 rows high (title and one message line); the detail text
/// fills the client area, 66 x 6, in its colours (dark grey on yellow).

#include <string>

#include "toolkit/Dialog.h"

namespace Tulk {

class TextArea;

class InfoDialog : public Dialog {
 public:
  static constexpr int kWidth = 70;
  static constexpr int kHeight = 15;
  static constexpr int kHeaderHeight = 5;

  /// The details dialog above `owner`: `title`, the one-line `message`,
  /// the `details` text and the `footer` (markup each).
  InfoDialog(Frame* owner, const std::string& details, const std::string& title,
             const std::string& message, const std::string& footer);

  /// Waits for Enter; returns 1.
  int Run() override;

  /// The text area of the details (null if the dialog did not fit).
  TextArea* Details() const { return details_; }

 private:
  TextArea* details_ = nullptr;
};

}  // namespace Tulk
