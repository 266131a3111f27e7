#pragma once
/// The editing state of an input field and its pure operations: a key
/// changes the state, and the state gives the row text that an InputItem
/// shows. No terminal is involved, so both are tested and fuzzed directly.
///
/// Editing keys (curses key codes):
///
/// | Key               | Effect                                                                   |
/// |-------------------|--------------------------------------------------------------------------|
/// | Home              | cursor to 0                                                              |
/// | Left              | cursor back by one (at the first shown byte the field scrolls back by 1) |
/// | Right             | cursor forward by one, not past the end                                  |
/// | End               | cursor to the end                                                        |
/// | Delete            | pristine: empties the value; else removes the byte at the cursor         |
/// | Backspace, Ctrl-H | pristine: empties the value; else removes the byte before the cursor (*) |
/// | a printable key   | pristine: empties the value first; then inserts the key at the cursor    |
/// | any other key     | pristine: empties the value; nothing else                                |
///
/// (*) When the cursor then lies before the first shown byte, the field
/// scrolls back to the start and the cursor jumps to the end of the value.
///
/// Every key ends the pristine state: moving onto a field and typing
/// replaces its value, while Left, Right, Home or End first keep it.
/// Printable means the bytes 0x20 to 0x7E, whatever the locale. The value
/// has no length limit unless `maxLength` sets one (a printable key is then
/// not inserted into a full value); the field scrolls.

#include <cstddef>
#include <string>
#include <string_view>

namespace Tulk {

struct InputField {
  std::string value;
  /// Byte index of the cursor in the value (0 to its length).
  std::size_t cursor = 0;
  /// Index of the first shown byte.
  std::size_t scroll = 0;
  /// The next editing key replaces the whole value.
  bool pristine = true;
  /// The most bytes the value takes from typing (0: no limit).
  std::size_t maxLength = 0;

  /// A fresh field: pristine, cursor at the end, no scroll.
  static InputField WithValue(std::string value);

  /// The state after `key`.
  static InputField HandleKey(InputField state, int key);

  /// The field width in use: `width`, or half the row width minus 1 when
  /// `width` is -1.
  static int ResolveWidth(int width, int rowWidth);

  /// What a row shows for the field.
  struct Row {
    /// The row's markup: the label, blanks, " [ ", the shown part of the
    /// value (coloured when focused: black on white while pristine, white
    /// on black once edited), blanks to the field width, " ]".
    std::string text;
    /// Column of the terminal cursor in the row.
    int cursorColumn = 0;
    /// The scroll offset after keeping the cursor inside the field.
    std::size_t scroll = 0;
  };

  /// The row for a field `fieldWidth` columns wide (-1: half the row) in a
  /// row `rowWidth` columns wide. The scroll offset follows the cursor: it
  /// moves right when the cursor passes the field's right edge and, beyond
  /// the field's own rules, left to the cursor when the cursor lies before
  /// it (after Home), so that the cursor is always inside the field.
  /// Masked fields show one "*" per shown byte.
  static Row FormatRow(const InputField& state, std::string_view label, int rowWidth,
                       int fieldWidth, bool focused, bool masked);
};

}  // namespace Tulk
