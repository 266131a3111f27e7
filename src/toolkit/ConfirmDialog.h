#pragma once
/// A question the operator answers with keys, in the three forms the
/// console uses:
///
/// | Keys          | Yes                    | No          | Cancel | Ignored           |
/// |---------------|------------------------|-------------|--------|-------------------|
/// | kF11          | F11                    | -           | Esc    | every other key, Enter too |
/// | kYesNo        | y, Y                   | n, N        | Esc    | every other key   |
/// | kEnter        | Enter                  | -           | Esc    | every other key   |
///
/// Disruptive actions (restoring the network, restarting the management
/// agents, resetting the configuration) are confirmed with F11, never Enter.
///
/// The question stands in a text area in the client area (PlaceQuestion()
/// moves it); an optional check box below it (AddCheck()) is flipped with
/// Space while the question waits. Dialogs that go on to do the work in the
/// same box derive from this class, call Ask() in their Run() and then use
/// Question() for their progress text:
///
///   ConfirmDialog confirm(this, 60, 12, 7, ConfirmKeys::kF11);
///   confirm.SetTitle(Text(TextId::kResetConfirmTitle));
///   confirm.SetQuestion(Text(TextId::kResetQuestion));
///   confirm.SetFooter(Footer::kF11OkCancel);
///   if (RunFrame(&confirm) == 1) { ... }

#include <memory>
#include <string>
#include <string_view>

#include "toolkit/Dialog.h"

namespace Tulk {

class CheckItem;
class ItemList;

/// Which keys answer a ConfirmDialog.
enum class ConfirmKeys { kF11, kYesNo, kEnter };

/// The answer: Run() returns it as an int (kCancel 0, kYes 1, kNo 2).
enum class Answer { kCancel = 0, kYes = 1, kNo = 2 };

class ConfirmDialog : public Dialog {
 public:
  /// A question `width` x `height` with a header `headerHeight` rows high,
  /// answered with `keys`. The question's text area fills the client area.
  ConfirmDialog(Frame* owner, int width, int height, int headerHeight, ConfirmKeys keys);
  ~ConfirmDialog() override;

  /// Ask(), as an int.
  int Run() override;

  /// Waits for the answer (the table above); Space flips the check box.
  Answer Ask();

  /// Puts the question's text area at `column`, `row` of the client area,
  /// `width` x `height`.
  void PlaceQuestion(int column, int row, int width, int height);
  /// The question (markup).
  void SetQuestion(std::string_view text);
  /// Adds the check box `caption` (unchecked) at `column`, `row` of the
  /// client area, `width` columns wide.
  CheckItem& AddCheck(std::string caption, int column, int row, int width);

  /// The question's text area (null when the dialog has no client area).
  TextArea* Question() const { return question_; }
  /// The check box (null without one).
  CheckItem* Check() const { return check_.get(); }

 private:
  ConfirmKeys keys_;
  TextArea* question_ = nullptr;
  std::unique_ptr<CheckItem> check_;
  ItemList* checkList_ = nullptr;
};

}  // namespace Tulk
