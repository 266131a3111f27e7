#pragma once
/// An item that holds a list of entries (InfoType subclasses such as
/// HykNicInfo or PortGroupInfo) and shows one of them, the current entry,
/// as its row; the operator steps through them and opens the current
/// entry's details.
///
/// Keys (the dialog passes them with HandleKey() while the item is the
/// current row; footers advertise "<Left/Right>" and "<D>"):
///
/// | Key    | Effect                                                                          |
/// |--------|---------------------------------------------------------------------------------|
/// | Left   | the previous entry; from the first, the last                                    |
/// | Right  | the next entry; from the last, the first                                        |
/// | D or d | opens the details dialog (DialogT, normally InfoDialog) for the current entry,  |
/// |        | above the owner frame                                                           |
///
/// The label is the entry's row (InfoType::Row(), the columns of
/// InfoType::Heading()) between "< " and " >" when there is more than one
/// entry to step to, and between blanks otherwise, so that it lines up
/// under the heading's two leading blanks. Without entries the label is
/// empty and the keys do nothing.

#include <curses.h>

#include <cstddef>
#include <utility>
#include <vector>

#include "toolkit/Frame.h"
#include "toolkit/LabelItem.h"
#include "toolkit/RunFrame.h"

namespace Tulk {

template <class InfoT, class DialogT>
class CarouselRadioItem : public LabelItem {
 public:
  explicit CarouselRadioItem(std::vector<InfoT> entries = {}) { SetEntries(std::move(entries)); }

  /// Replaces the entries; the first becomes current.
  void SetEntries(std::vector<InfoT> entries) {
    entries_ = std::move(entries);
    current_ = 0;
    Relabel();
  }
  /// The entries, in the order they are stepped through.
  const std::vector<InfoT>& Entries() const { return entries_; }

  /// Makes entry `index` current (ignored when out of range).
  void Select(std::size_t index) {
    if (index < entries_.size()) {
      current_ = index;
      Relabel();
    }
  }
  /// Index of the current entry (0 without entries).
  std::size_t CurrentIndex() const { return current_; }
  /// The current entry, or null without entries.
  const InfoT* Current() const { return entries_.empty() ? nullptr : &entries_[current_]; }

  /// Applies a key (table above); returns true when the key was one of
  /// the item's. The dialog redraws its list afterwards.
  bool HandleKey(int key, Frame* owner) {
    if (entries_.empty()) {
      return key == KEY_LEFT || key == KEY_RIGHT || key == 'd' || key == 'D';
    }
    switch (key) {
      case KEY_LEFT:
        current_ = current_ == 0 ? entries_.size() - 1 : current_ - 1;
        Relabel();
        return true;
      case KEY_RIGHT:
        current_ = current_ + 1 == entries_.size() ? 0 : current_ + 1;
        Relabel();
        return true;
      case 'd':
      case 'D':
        ShowDetails(owner);
        return true;
      default:
        return false;
    }
  }

  /// Runs the details dialog of the current entry above `owner`.
  void ShowDetails(Frame* owner) {
    const InfoT* entry = Current();
    if (entry == nullptr) {
      return;
    }
    DialogT dialog(owner, entry->DetailsText(), entry->DetailsTitle(), entry->NameLine(),
                   entry->DetailsFooter());
    RunFrame(&dialog);
  }

 private:
  void Relabel() {
    if (entries_.empty()) {
      SetText({});
      return;
    }
    const bool steps = entries_.size() > 1;
    SetText((steps ? "< " : "  ") + entries_[current_].Row() + (steps ? " >" : "  "));
  }

  std::vector<InfoT> entries_;
  std::size_t current_ = 0;
};

}  // namespace Tulk
