#include "toolkit/FormDialog.h"

#include <curses.h>

#include <algorithm>

#include "include/Keys.h"
#include "toolkit/CheckItem.h"
#include "toolkit/InputItem.h"
#include "toolkit/ItemList.h"
#include "toolkit/LabelItem.h"
#include "toolkit/MessageDialog.h"
#include "toolkit/RadioGroup.h"
#include "toolkit/RadioItem.h"
#include "toolkit/RunFrame.h"
#include "toolkit/TextArea.h"

namespace Tulk {
namespace {

std::vector<Item*> Pointers(const std::vector<std::unique_ptr<Item>>& items) {
  std::vector<Item*> pointers;
  pointers.reserve(items.size());
  for (const auto& item : items) {
    pointers.push_back(item.get());
  }
  return pointers;
}

}  // namespace

FormDialog::FormDialog(Frame* owner, int width, int height, int headerHeight)
    : Dialog(owner, width, height, headerHeight) {
  Window* area = Content() != nullptr ? Content() : Body();
  list_ = new ItemList(area, 0, 0, area->Width(), Content() != nullptr ? area->Height() : 0);
}

FormDialog::~FormDialog() = default;

void FormDialog::PlaceList(int column, int row, int width, int height) {
  Window* area = Content() != nullptr ? Content() : Body();
  const Item* current = list_->Current();
  delete list_;
  list_ = new ItemList(area, column, row, width, height);
  list_->SetItems(Pointers(items_));
  if (current != nullptr) {
    list_->SelectItem(current);
  }
}

Item& FormDialog::AddItem(std::unique_ptr<Item> item) {
  items_.push_back(std::move(item));
  const Item* current = list_->Current();
  list_->SetItems(Pointers(items_));
  if (current != nullptr) {
    list_->SelectItem(current);
  }
  return *items_.back();
}

InputItem& FormDialog::AddInput(std::string label, std::string value, int width,
                                const KeyFilter& filter, std::size_t maxLength) {
  auto item = std::make_unique<InputItem>(std::move(label), std::move(value), width);
  item->SetFilter(filter);
  item->SetMaxLength(maxLength);
  return static_cast<InputItem&>(AddItem(std::move(item)));
}

CheckItem& FormDialog::AddCheck(std::string caption, bool checked, int indent) {
  return static_cast<CheckItem&>(
      AddItem(std::make_unique<CheckItem>(std::move(caption), checked, indent)));
}

RadioItem& FormDialog::AddRadio(RadioGroup& group, std::string caption,
                                std::vector<Item*> dependents) {
  auto& radio = static_cast<RadioItem&>(AddItem(std::make_unique<RadioItem>(std::move(caption))));
  group.Add(&radio, std::move(dependents));
  if (std::find(groups_.begin(), groups_.end(), &group) == groups_.end()) {
    groups_.push_back(&group);
  }
  return radio;
}

LabelItem& FormDialog::AddLabel(std::string text, bool focusable) {
  return static_cast<LabelItem&>(AddItem(std::make_unique<LabelItem>(std::move(text), focusable)));
}

Item* FormDialog::Current() const {
  return list_->Current();
}

void FormDialog::Focus(const Item& item) {
  list_->SelectItem(&item);
  Redisplay();
}

void FormDialog::UpdateCursor() {
  const Item* current = Current();
  const bool onInput = dynamic_cast<const InputItem*>(current) != nullptr;
  ShowCursor(current != nullptr && (onInput || cursorAlways_));
  if (current != nullptr && !onInput && cursorAlways_) {
    if (TextArea* row = list_->RowArea(list_->CursorRow()); row != nullptr) {
      row->MoveCursor(0, 0);
    }
  }
}

void FormDialog::Redisplay() {
  DrawBatch batch;
  list_->Draw();
  UpdateCursor();
}

bool FormDialog::IsLast(const Item* item) const {
  for (auto it = items_.rbegin(); it != items_.rend(); ++it) {
    if ((*it)->Focusable() && (*it)->Enabled()) {
      return it->get() == item;
    }
  }
  return true;
}

void FormDialog::Move(bool down) {
  DrawBatch batch;
  if (down ? list_->MoveDown() : list_->MoveUp()) {
    UpdateCursor();
  }
}

void FormDialog::Mark(Item& item) {
  for (RadioGroup* group : groups_) {
    if (group->Contains(&item)) {
      group->Select(&item);
      Marked(item);
      Redisplay();
      return;
    }
  }
  if (auto* check = dynamic_cast<CheckItem*>(&item); check != nullptr) {
    check->Toggle();
    Marked(item);
    Redisplay();
  }
}

bool FormDialog::OnKey(int /*key*/) {
  return false;
}

void FormDialog::Edited(InputItem& /*field*/) {
}

void FormDialog::Marked(Item& /*item*/) {
}

bool FormDialog::Accept() {
  return true;
}

void FormDialog::Notify(std::uint32_t titleId, std::uint32_t textId) {
  MessageDialog message(this, titleId, Text(textId));
  RunFrame(&message);
}

bool FormDialog::Reject(const Item& field, std::uint32_t titleId, std::uint32_t textId) {
  Notify(titleId, textId);
  Focus(field);
  return false;
}

int FormDialog::Run() {
  {
    DrawBatch batch;
    Prepare();
    Redisplay();
  }
  for (;;) {
    const int key = WaitKey();
    if (key == kKeyEsc) {
      Cancelled();
      ShowCursor(false);
      return 0;
    }
    Item* current = Current();
    if (auto* field = dynamic_cast<InputItem*>(current); field != nullptr && field->TakeKey(key)) {
      DrawBatch batch;
      Edited(*field);
      Redisplay();
      continue;
    }
    if (OnKey(key)) {
      continue;
    }
    if (key == KEY_DOWN || key == KEY_UP) {
      Move(key == KEY_DOWN);
    } else if (key == kKeyTab && tabMoves_) {
      if (IsLast(current)) {
        const auto first = std::find_if(items_.begin(), items_.end(), [](const auto& item) {
          return item->Focusable() && item->Enabled();
        });
        if (first != items_.end()) {
          Focus(**first);
        }
      } else {
        Move(true);
      }
    } else if (key == kKeySpace && current != nullptr) {
      Mark(*current);
    } else if (key == kKeyEnter) {
      if (enterAdvances_ && !IsLast(current)) {
        Move(true);
      } else if (Accept()) {
        ShowCursor(false);
        return acceptResult_;
      }
    }
  }
}

}  // namespace Tulk
