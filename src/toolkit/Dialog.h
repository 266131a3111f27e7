#pragma once
/// A modal dialog: a box centred on the screen with a title strip (the
/// header: title and a message text), a body and a footer line of key
/// legends.
///
/// Geometry for a dialog w columns wide, h rows high with a header of
/// hh rows (body height bh = h - hh):
///
/// | Part        | Parent | Column, row              | Size                | Colours        |
/// |-------------|--------|--------------------------|---------------------|----------------|
/// | frame       | screen | (COLS-w)/2, (LINES-h)/2  | w x h, boxed        | black, white   |
/// | header      | frame  | 0, 0                     | w x hh              | dark grey, white |
/// | body        | frame  | 0, hh                    | w x bh              | yellow, white  |
/// | content     | body   | 2, 1                     | (w-4) x (bh-4)      | yellow, dark grey |
/// | title text  | header | 3, 1                     | (w-6) x 1           | text white     |
/// | header text | header | 3, 3                     | (w-6) x (hh-4)      | text light grey |
/// | footer text | body   | 2, bh-2                  | (w-4) x 1           | text black     |
///
/// The content window (the client area, where a dialog puts its items or
/// text) exists only when bh - 4 is at least 1; the text areas only when
/// their height is at least 1.
///
/// A dialog class lays itself out in its constructor and overrides Run().
/// Most dialogs are built on the shared patterns instead of a key loop of
/// their own: FormDialog (items, validation), ConfirmDialog (F11, Y/N/Esc
/// or Enter/Esc), ProgressDialog (steps with "Done."/"Failed."),
/// MessageDialog; footers come from Footer.h.

#include <string_view>

#include "toolkit/Footer.h"
#include "toolkit/Frame.h"

namespace Tulk {

class TextArea;
class WorkerResult;

class Dialog : public Frame {
 public:
  /// A dialog `width` x `height` with a header `headerHeight` rows high,
  /// centred on the screen, run above `owner`.
  Dialog(Frame* owner, int width, int height, int headerHeight);

  /// Drawing active first refreshes the owner, so that the dialog shows
  /// above the freshly drawn owner.
  void Redraw(bool active) override;

  /// The plain key loop: Enter returns 1, Esc returns 0, other keys are
  /// ignored. Dialogs with items or other keys override it.
  int Run() override;

  /// Fill the title, the header's message text and the footer (markup).
  void SetTitle(std::string_view text);
  void SetText(std::string_view text);
  void SetFooter(std::string_view text);

  /// The title strip (dark grey).
  Window* Header() const { return header_; }
  /// The body below the header (yellow).
  Window* Body() const { return body_; }
  /// The client area; null when the body is too low for one.
  Window* Content() const { return content_; }
  /// The text areas of the title, the header's message and the footer;
  /// each may be null when its height would be below 1.
  TextArea* TitleArea() const { return title_; }
  TextArea* HeaderText() const { return text_; }
  TextArea* FooterArea() const { return footer_; }

 protected:
  /// The next key for this dialog, with the idle timeout on.
  int WaitKey();
  /// WaitKey(), or kKeyResultReady (runtime/KeyInput.h) as soon as
  /// `result` is set by its worker.
  int WaitKeyOrResult(const WorkerResult& result);
  /// Waits until Enter is pressed (every other key, Esc too, is ignored);
  /// returns 1. How reports and messages close.
  int WaitForEnter();

 private:
  Window* header_;
  Window* body_;
  Window* content_ = nullptr;
  TextArea* title_ = nullptr;
  TextArea* text_ = nullptr;
  TextArea* footer_ = nullptr;
};

}  // namespace Tulk
