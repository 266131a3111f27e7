#include "toolkit/InputItem.h"

#include "toolkit/TextArea.h"

namespace Tulk {

InputItem::InputItem(std::string label, std::string value, int width)
    : label_(std::move(label)), width_(width), field_(InputField::WithValue(std::move(value))) {
}

void InputItem::HandleKey(int key) {
  field_ = InputField::HandleKey(std::move(field_), key);
}

bool InputItem::TakeKey(int key) {
  if (!filter_.Accepts(key)) {
    return false;
  }
  HandleKey(key);
  return true;
}

void InputItem::SetValue(std::string value) {
  field_.value = std::move(value);
  field_.cursor = field_.value.size();
  field_.pristine = true;
}

void InputItem::FocusChanged() {
  field_.pristine = true;
}

void InputItem::Draw(TextArea& area) {
  InputField::Row row =
      InputField::FormatRow(field_, label_, area.Width(), width_, Focused(), masked_);
  field_.scroll = row.scroll;
  area.SetText(row.text);
  area.MoveCursor(row.cursorColumn, 0);
}

}  // namespace Tulk
