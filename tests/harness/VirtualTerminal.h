#pragma once
/// A terminal emulator (libvterm) that the screen tests read cells from.

#include <string>
#include <string_view>

struct VTerm;
struct VTermScreen;

namespace TulkTest {

/// One character cell as the terminal shows it.
struct Cell {
  /// The cell's character as UTF-8 (a blank for an empty cell).
  std::string text;
  /// Palette index of the foreground and background, -1 for the terminal's
  /// default colour.
  int fg = -1;
  int bg = -1;
  bool bold = false;
  bool reverse = false;
  bool underline = false;
};

struct CursorState {
  int row = 0;
  int col = 0;
  bool visible = true;
};

class VirtualTerminal {
 public:
  VirtualTerminal(int rows, int cols);
  ~VirtualTerminal();
  VirtualTerminal(const VirtualTerminal&) = delete;
  VirtualTerminal& operator=(const VirtualTerminal&) = delete;

  /// Feeds bytes the program wrote.
  void Write(std::string_view bytes);
  /// Changes the size.
  void Resize(int rows, int cols);

  int Rows() const { return rows_; }
  int Cols() const { return cols_; }
  Cell At(int row, int col) const;
  /// The text of a row, `Cols()` cells long.
  std::string Row(int row) const;
  CursorState Cursor() const;

  /// Bytes the terminal answers with (replies to queries), taken out.
  std::string TakeReplies();

  /// Empty when `other` shows the same cells (characters, colours and
  /// every attribute libvterm keeps), has the cursor in the same place and
  /// would give a character written next the same attributes; otherwise
  /// the first difference, described. The attribute filter's tests compare
  /// what curses wrote with what the filter made of it this way.
  std::string Difference(const VirtualTerminal& other) const;

 private:
  friend struct VirtualTerminalCallbacks;

  VTerm* vt_;
  VTermScreen* screen_;
  int rows_;
  int cols_;
  bool cursorVisible_ = true;
  std::string replies_;
};

}  // namespace TulkTest
