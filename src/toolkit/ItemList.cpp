#include "toolkit/ItemList.h"

#include "include/ColorNumbers.h"
#include "toolkit/Item.h"
#include "toolkit/ScrollBar.h"
#include "toolkit/TextArea.h"

namespace Tulk {

ItemList::ItemList(Window* parent, int column, int row, int width, int height)
    : Window(parent, column, row, width, height),
      content_(new Window(this, 0, 0, Width() - 1, Height())),
      scrollBar_(new ScrollBar(this, Width() - 1, 0, Height())) {
  for (int r = 0; r < content_->Height(); ++r) {
    auto* line = new Window(content_, 0, r, content_->Width(), 1);
    rows_.push_back(new TextArea(line, 1, 0, content_->Width() - 2, 1));
  }
}

bool ItemList::Selectable(int index) const {
  const Item* item = items_[static_cast<std::size_t>(index)];
  return item->Focusable() && item->Enabled();
}

int ItemList::CountFocusableBefore(int index) const {
  int count = 0;
  for (int i = 0; i < index; ++i) {
    count += items_[static_cast<std::size_t>(i)]->Focusable() ? 1 : 0;
  }
  return count;
}

void ItemList::MakeCurrent(int index) {
  const int rows = Rows();
  if (rows == 0) {
    return;
  }
  if (index < top_) {
    top_ = index;
  } else if (index >= top_ + rows) {
    top_ = index - rows + 1;
  }
  cursorRow_ = index - top_;
  ordinal_ = CountFocusableBefore(index);
}

void ItemList::SetItems(std::vector<Item*> items) {
  items_ = std::move(items);
  top_ = 0;
  ordinal_ = 0;
  if (items_.empty()) {
    return;
  }
  cursorRow_ = -1;
  for (int i = 0; i < static_cast<int>(items_.size()); ++i) {
    if (Selectable(i)) {
      MakeCurrent(i);
      return;
    }
  }
}

bool ItemList::SelectByOrdinal(int ordinal) {
  int seen = 0;
  for (int i = 0; i < static_cast<int>(items_.size()); ++i) {
    if (!items_[static_cast<std::size_t>(i)]->Focusable()) {
      continue;
    }
    if (seen++ == ordinal) {
      MakeCurrent(i);
      return Rows() > 0;
    }
  }
  return false;
}

bool ItemList::SelectItem(const Item* item) {
  for (int i = 0; i < static_cast<int>(items_.size()); ++i) {
    if (items_[static_cast<std::size_t>(i)] == item && item->Focusable()) {
      MakeCurrent(i);
      return Rows() > 0;
    }
  }
  return false;
}

bool ItemList::MoveUp() {
  for (int i = CurrentIndex() - 1; i >= 0; --i) {
    if (Selectable(i)) {
      MakeCurrent(i);
      Draw();
      return true;
    }
  }
  return false;
}

bool ItemList::MoveDown() {
  const int count = static_cast<int>(items_.size());
  for (int i = CurrentIndex() + 1; i < count; ++i) {
    if (Selectable(i)) {
      MakeCurrent(i);
      Draw();
      return true;
    }
  }
  return false;
}

Item* ItemList::Current() const {
  int index = CurrentIndex();
  return index < 0 ? nullptr : items_[static_cast<std::size_t>(index)];
}

int ItemList::CurrentIndex() const {
  if (cursorRow_ < 0) {
    return -1;
  }
  int index = top_ + cursorRow_;
  return index < static_cast<int>(items_.size()) ? index : -1;
}

TextArea* ItemList::RowArea(int row) const {
  return row >= 0 && row < Rows() ? rows_[static_cast<std::size_t>(row)] : nullptr;
}

void ItemList::Draw() {
  DrawBatch batch;
  if (content_->Curses() != nullptr) {
    werase(content_->Curses());
  }
  const int rows = Rows();
  const int count = static_cast<int>(items_.size());
  const int current = CurrentIndex();
  for (int r = 0; r < rows; ++r) {
    TextArea* area = rows_[static_cast<std::size_t>(r)];
    int index = top_ + r;
    if (index >= count) {
      area->SetColors(-1, -1);
      area->SetText("");
      continue;
    }
    Item* item = items_[static_cast<std::size_t>(index)];
    item->SetFocused(index == current);
    if (index != current) {
      area->SetColors(item->Background(), item->Foreground());
      item->Draw(*area);
    }
  }
  if (count > rows) {
    scrollBar_->Show(top_, count, rows);
  } else {
    scrollBar_->Hide();
  }
  content_->Update();
  if (current >= 0) {
    TextArea* area = rows_[static_cast<std::size_t>(cursorRow_)];
    area->SetColors(kBlack, kWhite);
    items_[static_cast<std::size_t>(current)]->Draw(*area);
  }
  Update();
}

void ItemList::Redraw(bool active) {
  DrawBatch batch;
  Window::Redraw(active);
  if (active) {
    Draw();
  }
}

}  // namespace Tulk
