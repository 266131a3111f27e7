#include "toolkit/MenuWindow.h"

#include <curses.h>

#include "include/ColorNumbers.h"
#include "include/Keys.h"
#include "runtime/KeyInput.h"
#include "toolkit/Footer.h"
#include "toolkit/ItemList.h"
#include "toolkit/LabelItem.h"
#include "toolkit/TextArea.h"

namespace Tulk {
namespace {

std::string Greyed(const std::string& label) {
  return "{color:dark-grey}" + label + "{/color}";
}

}  // namespace

MenuWindow::MenuWindow(Frame* owner) : RootWindow(owner), menuFooter_(Footer::kMenuSelect) {
}

MenuWindow::~MenuWindow() = default;

void MenuWindow::SetRefreshFooters(std::string left, std::string right) {
  refreshLeft_ = std::move(left);
  refreshRight_ = std::move(right);
  refreshFooters_ = true;
}

void MenuWindow::SetEntries(std::vector<MenuEntry> entries) {
  entries_ = std::move(entries);
  items_.clear();
  std::vector<Item*> items;
  for (std::size_t i = 0; i < entries_.size(); ++i) {
    items_.push_back(std::make_unique<LabelItem>());
    Relabel(i);
    items.push_back(items_.back().get());
  }
  // The list must never point at the items just replaced.
  Menu().SetItems(std::move(items));
}

void MenuWindow::Relabel(std::size_t position) {
  const MenuEntry& entry = entries_[position];
  LabelItem& item = *items_[position];
  item.SetText(entry.enabled ? entry.label : Greyed(entry.label));
  item.SetEnabled(entry.enabled);
  if (entry.label.empty()) {
    item.SetForeground(kBlack);  // a spacer: no colour shows, none is sent
  }
}

void MenuWindow::SetEnabled(std::size_t position, bool enabled) {
  if (position < entries_.size()) {
    entries_[position].enabled = enabled;
    Relabel(position);
  }
}

void MenuWindow::SetEnabledById(std::uint32_t id, bool enabled) {
  for (std::size_t i = 0; i < entries_.size(); ++i) {
    if (entries_[i].id == id) {
      SetEnabled(i, enabled);
    }
  }
}

void MenuWindow::SetLabel(std::size_t position, std::string label) {
  if (position < entries_.size()) {
    entries_[position].label = std::move(label);
    Relabel(position);
  }
}

bool MenuWindow::SelectPosition(std::size_t position) {
  if (position >= entries_.size() || !entries_[position].enabled) {
    return false;
  }
  return Menu().SelectItem(items_[position].get());
}

bool MenuWindow::SelectId(std::uint32_t id) {
  for (std::size_t i = 0; i < entries_.size(); ++i) {
    if (entries_[i].id == id && entries_[i].enabled) {
      return SelectPosition(i);
    }
  }
  return false;
}

std::optional<std::size_t> MenuWindow::SelectedPosition() const {
  const int index = Menu().CurrentIndex();
  if (index < 0 || static_cast<std::size_t>(index) >= entries_.size()) {
    return std::nullopt;
  }
  return static_cast<std::size_t>(index);
}

const MenuEntry* MenuWindow::Selected() const {
  const std::optional<std::size_t> position = SelectedPosition();
  return position ? &entries_[*position] : nullptr;
}

std::uint32_t MenuWindow::SelectedId(std::uint32_t none) const {
  const MenuEntry* entry = Selected();
  return entry != nullptr ? entry->id : none;
}

void MenuWindow::DrawMenu() {
  Menu().Draw();
}

void MenuWindow::ShowRight(bool ownFooter) {
  DrawBatch batch;
  const MenuEntry* entry = Selected();
  SetRightTitle(entry == nullptr ? "" : entry->title.empty() ? entry->label : entry->title);
  Description().SetText(entry != nullptr && entry->describe ? entry->describe() : "");
  if (ownFooter) {
    SetRightFooter(entry != nullptr ? entry->footer : "");
  } else {
    SetRightFooter(refreshRight_);
  }
}

void MenuWindow::ShowDescription() {
  ShowRight(true);
}

void MenuWindow::Populate() {
  DrawBatch batch;
  const std::optional<std::size_t> kept = SelectedPosition();
  SetLeftTitle(menuTitle_);
  Menu().SetItems(Menu().Items());
  if (keepSelection_ && kept) {
    SelectPosition(*kept);
  }
  Menu().Draw();
  ShowRight(!refreshFooters_);
  SetLeftFooter(refreshFooters_ ? refreshLeft_ : menuFooter_);
}

bool MenuWindow::Move(bool down) {
  DrawBatch batch;
  BeforeMove();
  if (!(down ? Menu().MoveDown() : Menu().MoveUp())) {
    return false;
  }
  ShowDescription();
  return true;
}

bool MenuWindow::OnKey(int /*key*/) {
  return false;
}

int MenuWindow::Run() {
  Show();
  for (;;) {
    const int key = WaitForKey(this, true);
    if (key == KEY_DOWN || key == KEY_UP) {
      Move(key == KEY_DOWN);
    } else if (key == kKeyEsc) {
      if (Leave()) {
        return 1;
      }
    } else if (key == kKeyEnter) {
      const MenuEntry* entry = Selected();
      if (entry != nullptr && entry->enabled && entry->action) {
        // A copy: the action may replace the entries.
        const std::function<bool()> action = entry->action;
        if (action()) {
          Show();
        }
      }
    } else {
      OnKey(key);
    }
  }
}

}  // namespace Tulk
