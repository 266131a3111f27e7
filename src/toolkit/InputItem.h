#pragma once
/// An editable field: a label on the left and a bracketed box on the
/// right, "Login Name:            [ root                          ]".
///
/// The field is `width` columns wide (-1: half the row width minus 1) and
/// scrolls when the value is longer. It is pristine after construction,
/// after SetValue() and whenever it gains or loses focus: the first editing
/// key then replaces the whole value (InputField.h lists the keys). While
/// it is the current row, a pristine value shows black on white (as if
/// selected whole) and an edited one white on black. Drawing moves the
/// terminal cursor to the field's cursor; the dialog decides whether the
/// cursor is shown (Window::ShowCursor).
///
/// A key filter (KeyFilter.h) says which keys the field takes; TakeKey()
/// applies a key only when the filter accepts it. A form passes every key to
/// its current field first: what the field refuses goes on to the form's
/// own navigation.

#include <string>

#include "toolkit/InputField.h"
#include "toolkit/Item.h"
#include "toolkit/KeyFilter.h"

namespace Tulk {

class InputItem : public Item {
 public:
  /// A field with `label` and `value`, `width` columns wide (-1: half the
  /// row minus 1); pristine, cursor at the end.
  InputItem(std::string label, std::string value, int width);

  /// Applies an editing key whatever the filter; the dialog redraws the
  /// list afterwards.
  void HandleKey(int key);
  /// Applies `key` when the filter accepts it; returns whether it did.
  bool TakeKey(int key);

  /// The keys the field takes (kAnyText at construction).
  void SetFilter(const KeyFilter& filter) { filter_ = filter; }
  const KeyFilter& Filter() const { return filter_; }
  /// The most bytes typing may put into the value (0: no limit).
  void SetMaxLength(std::size_t length) { field_.maxLength = length; }

  /// Assigns the value: pristine again, cursor at the end.
  void SetValue(std::string value);
  /// The value as edited.
  const std::string& Value() const { return field_.value; }
  /// The label left of the field (plain text).
  void SetLabel(std::string label) { label_ = std::move(label); }
  const std::string& Label() const { return label_; }
  /// Shows the value as asterisks (passwords).
  void SetMasked(bool masked) { masked_ = masked; }
  /// Whether the value shows as asterisks.
  bool Masked() const { return masked_; }
  /// The field width as given (-1: half the row minus 1).
  int Width() const { return width_; }
  /// The editing state: value, cursor, scroll offset, pristine.
  const InputField& Field() const { return field_; }

  /// Shows the row (InputField::FormatRow) and moves the terminal cursor
  /// into the field.
  void Draw(TextArea& area) override;

 protected:
  void FocusChanged() override;

 private:
  std::string label_;
  int width_;
  bool masked_ = false;
  KeyFilter filter_ = kAnyText;
  InputField field_;
};

}  // namespace Tulk
