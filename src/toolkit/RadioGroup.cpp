#include "toolkit/RadioGroup.h"

#include "toolkit/RadioItem.h"

namespace Tulk {

void RadioGroup::Add(RadioItem* radio, std::vector<Item*> dependents) {
  members_.push_back(Member{radio, std::move(dependents)});
  SelectIndex(selected_);
}

void RadioGroup::SetDependents(const Item* radio, std::vector<Item*> dependents) {
  for (Member& member : members_) {
    if (member.radio == radio) {
      member.dependents = std::move(dependents);
      ApplyRule();
      return;
    }
  }
}

void RadioGroup::Select(const Item* radio) {
  for (std::size_t i = 0; i < members_.size(); ++i) {
    if (members_[i].radio == radio) {
      SelectIndex(i);
      return;
    }
  }
}

void RadioGroup::SelectIndex(std::size_t index) {
  if (index >= members_.size()) {
    return;
  }
  selected_ = index;
  for (std::size_t i = 0; i < members_.size(); ++i) {
    members_[i].radio->SetSelected(i == index);
  }
  ApplyRule();
}

bool RadioGroup::Contains(const Item* item) const {
  for (const Member& member : members_) {
    if (member.radio == item) {
      return true;
    }
  }
  return false;
}

void RadioGroup::ApplyRule() {
  for (std::size_t i = 0; i < members_.size(); ++i) {
    for (Item* dependent : members_[i].dependents) {
      dependent->SetEnabled(i == selected_);
    }
  }
}

}  // namespace Tulk
