#pragma once
/// A group of radio buttons of which exactly one is marked, and the items
/// that follow each button: an item that depends on a button is enabled
/// exactly while that button is marked (the static-address inputs follow the
/// "static" button).
///
///   RadioGroup mode;
///   mode.Add(&dhcp);
///   mode.Add(&fixed);
///   mode.SetDependents(&fixed, {&address, &mask, &gateway});
///   mode.Select(&fixed);  // marks it alone, enables the three inputs
///
/// The group neither owns nor draws its items: the form (FormDialog.h) calls
/// Select() on Space and redraws.

#include <cstddef>
#include <vector>

namespace Tulk {

class Item;
class RadioItem;

class RadioGroup {
 public:
  /// Adds `radio` (unmarked unless it is the first) with the items that
  /// follow it. The first button added is marked until Select() says
  /// otherwise.
  void Add(RadioItem* radio, std::vector<Item*> dependents = {});

  /// Gives `radio` the items that follow it (replacing any given before)
  /// and applies the enabling rule: for a form whose dependent inputs are
  /// added after their button. Ignored when the button is not in the group.
  void SetDependents(const Item* radio, std::vector<Item*> dependents);

  /// Marks `radio` alone and applies the enabling rule. Ignored when the
  /// button is not in the group.
  void Select(const Item* radio);
  /// Marks the button at `index` (in the order added).
  void SelectIndex(std::size_t index);

  /// The marked button's index in the order added.
  std::size_t SelectedIndex() const { return selected_; }
  /// Whether `item` is one of the group's buttons.
  bool Contains(const Item* item) const;

  /// Enables every dependent item whose button is marked and disables the
  /// others (also done by Select()).
  void ApplyRule();

 private:
  struct Member {
    RadioItem* radio;
    std::vector<Item*> dependents;
  };
  std::vector<Member> members_;
  std::size_t selected_ = 0;
};

}  // namespace Tulk
