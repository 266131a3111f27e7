#pragma once
/// A full-screen menu window: a menu on the left half, the description of
/// the selected entry on the right half, and a status line at the bottom.
///
/// Geometry (COLS x LINES the screen, integer division, H = COLS / 2):
///
/// | Part              | Parent     | Column, row | Size              | Colours           |
/// |-------------------|------------|-------------|-------------------|-------------------|
/// | frame             | screen     | 0, 0        | COLS x LINES      | black, white      |
/// | main area         | frame      | 0, 0        | COLS x (LINES-1)  | light grey, white |
/// | status line       | frame      | 0, LINES-1  | COLS x 1          | black, light grey |
/// | left pane         | main area  | 0, 0        | H x (LINES-1)     | yellow, white     |
/// | right pane        | main area  | H, 0        | H x (LINES-1)     | dark grey, white  |
/// | left title text   | left pane  | 3, 1        | (H-6) x 1         | text black        |
/// | right title text  | right pane | 2, 1        | (H-6) x 1         | text white        |
/// | menu (ItemList)   | left pane  | 2, 4        | (H-2) x (LINES-7) |                   |
/// | description text  | right pane | 2, 4        | (H-4) x (LINES-7) | text light grey   |
/// | left footer text  | left pane  | 2, LINES-3  | (H-3) x 1         | text black        |
/// | right footer text | right pane | 1, LINES-3  | (H-3) x 1         | text white        |
///
/// The main area is boxed, with a line across on row 2.
///
/// The menu and the description end on the row above the footers: were
/// they one row taller, every draw of the menu or of a new description
/// would erase the footer line they share.
///
/// A subclass fills the window in Populate() and runs its key loop in
/// Run(), starting with Show(). Host state that a menu shows is read by the
/// subclass (the toolkit does not reach the host).

#include <string_view>

#include "toolkit/Frame.h"

namespace Tulk {

class ItemList;
class TextArea;

class RootWindow : public Frame {
 public:
  /// Builds the window above `owner` and logs "COLS=%d, LINES=%d".
  explicit RootWindow(Frame* owner);

  /// Sets the left title, the footers and the menu entries, selects the
  /// first entry and shows its description.
  virtual void Populate() = 0;

  /// Draws the window active, writes the version line (catalogue text 2)
  /// centred on the status line, calls Populate() and refreshes.
  void Show();

  /// Fill the titles above the two halves and the footers below them
  /// (markup).
  void SetLeftTitle(std::string_view text);
  void SetRightTitle(std::string_view text);
  void SetLeftFooter(std::string_view text);
  void SetRightFooter(std::string_view text);

  /// The menu on the left half.
  ItemList& Menu() const { return *menu_; }
  /// The description of the selected entry on the right half.
  TextArea& Description() const { return *description_; }
  /// The parts of the window (see the table above).
  Window* MainArea() const { return mainArea_; }
  Window* StatusLine() const { return statusLine_; }
  Window* LeftPane() const { return leftPane_; }
  Window* RightPane() const { return rightPane_; }

 private:
  Window* statusLine_;
  Window* mainArea_;
  Window* rightPane_;
  Window* leftPane_;
  TextArea* rightTitle_;
  TextArea* leftTitle_;
  TextArea* leftFooter_;
  TextArea* rightFooter_;
  ItemList* menu_;
  TextArea* description_;
};

}  // namespace Tulk
