#pragma once
/// A dialog whose body is a column of items — input fields, check boxes,
/// radio buttons, labels — with one shared key routing and one accept hook.
///
/// Key routing, in this order:
/// 1. Esc: Cancelled(), the cursor is hidden, Run() returns 0.
/// 2. The current item gets the key first: an input field takes it when its
///    key filter accepts it (KeyFilter.h), then Edited() is called.
/// 3. The dialog's own keys: OnKey() (F3 in the login, D in the adapter
///    list, ...); returning true ends the key's handling.
/// 4. The form's navigation: Down and Up move to the next or previous
///    enabled item; Tab, when enabled with SetTabMoves(), moves on and wraps
///    from the last item to the first.
/// 5. Space on a radio button marks it (its RadioGroup keeps it alone and
///    applies its enabling rule); on a check box it flips the box. Marked()
///    is called after either.
/// 6. Enter: with SetEnterAdvances(), Enter on any item but the last moves
///    on like Down; otherwise Accept() is called, and when it returns true
///    the cursor is hidden and Run() returns 1.
/// Other keys are ignored.
///
/// Validation: Accept() checks the values in its own stated order and, at
/// the first failure, returns Reject(field, title, text): the message dialog
/// (MessageDialog.h) is shown, the offending field becomes current with the
/// cursor in it, and the form stays open. A form that reports a refused
/// value and closes all the same (the timeout dialogs) calls Notify() and
/// returns true.
///
/// The terminal cursor: by default shown while an input field is current and
/// hidden on every other item; SetCursorAlways() keeps it shown on every
/// item (on a label it stands at the start of its row).
///
///   class VlanDialog : public FormDialog {
///    public:
///     explicit VlanDialog(Frame* owner) : FormDialog(owner, 70, 13, 7) {
///       SetTitle(Text(TextId::kVlanOptional));
///       SetText(Text(TextId::kVlanText));
///       SetFooter(Footer::kOkCancel);
///       vlan_ = &AddInput(Text(TextId::kVlanLabel), "", 5, kDigits);
///     }
///    protected:
///     bool Accept() override {
///       if (!Valid(vlan_->Value())) return Reject(*vlan_, TextId::kInvalidVlanTitle,
///                                                 TextId::kInvalidVlan);
///       return true;
///     }
///    private:
///     InputItem* vlan_;
///   };
///
/// The items belong to the form. The list fills the client area unless
/// PlaceList() puts it elsewhere.

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include "toolkit/Dialog.h"
#include "toolkit/KeyFilter.h"

namespace Tulk {

class CheckItem;
class InputItem;
class Item;
class ItemList;
class LabelItem;
class RadioGroup;
class RadioItem;

class FormDialog : public Dialog {
 public:
  /// A form `width` x `height` with a header `headerHeight` rows high; its
  /// list fills the client area.
  FormDialog(Frame* owner, int width, int height, int headerHeight);
  ~FormDialog() override;

  /// The key loop described above: 1 when accepted, 0 on Esc.
  int Run() override;

  /// Adds an input field: `label`, `value`, `width` columns (-1: half the
  /// row), taking the keys of `filter`, at most `maxLength` bytes typed
  /// (0: no limit).
  InputItem& AddInput(std::string label, std::string value, int width,
                      const KeyFilter& filter = kAnyText, std::size_t maxLength = 0);
  /// Adds a check box.
  CheckItem& AddCheck(std::string caption, bool checked = false, int indent = 0);
  /// Adds a radio button to `group` (which the dialog keeps alive as long as
  /// the form), with the items that follow it (see RadioGroup).
  RadioItem& AddRadio(RadioGroup& group, std::string caption, std::vector<Item*> dependents = {});
  /// Adds a label row; `focusable` false makes a plain text row.
  LabelItem& AddLabel(std::string text, bool focusable = false);
  /// Adds an item of the dialog's own kind.
  Item& AddItem(std::unique_ptr<Item> item);

  /// Puts the list at `column`, `row` of the client area, `width` x
  /// `height`.
  void PlaceList(int column, int row, int width, int height);

  /// Tab moves to the next item, from the last to the first.
  void SetTabMoves(bool on) { tabMoves_ = on; }
  /// Enter on any item but the last moves to the next one.
  void SetEnterAdvances(bool on) { enterAdvances_ = on; }
  /// Keep the terminal cursor shown on every item.
  void SetCursorAlways(bool on) { cursorAlways_ = on; }

  /// The list and its current item (null when none).
  ItemList& List() const { return *list_; }
  Item* Current() const;
  /// Makes `item` current and draws the list.
  void Focus(const Item& item);
  /// Draws the list and puts the cursor where it belongs.
  void Redisplay();

 protected:
  /// Called at the start of Run(), before the first draw: titles, values.
  virtual void Prepare() {}
  /// The dialog's own keys, after the current field refused the key;
  /// returns true when the key was handled.
  virtual bool OnKey(int key);
  /// After a key changed input field `field`.
  virtual void Edited(InputItem& field);
  /// After Space marked a radio button or flipped a check box.
  virtual void Marked(Item& item);
  /// Enter: validate and act; true closes the form with 1.
  virtual bool Accept();
  /// Esc, before the form closes with 0.
  virtual void Cancelled() {}

  /// Shows the message dialog titled with catalogue text `titleId` with text
  /// `textId`, then makes `field` current. Returns false, for Accept().
  bool Reject(const Item& field, std::uint32_t titleId, std::uint32_t textId);
  /// What Run() returns when Accept() closes the form (1 unless set): a
  /// form that closes after reporting a host failure may return 0.
  void SetAcceptResult(int result) { acceptResult_ = result; }
  /// Shows the message dialog titled with catalogue text `titleId` with text
  /// `textId` and waits until it is closed; the form's current item stays.
  /// For forms that report a refused value and still go on (Accept() then
  /// returns true).
  void Notify(std::uint32_t titleId, std::uint32_t textId);

 private:
  void Move(bool down);
  void Mark(Item& item);
  void UpdateCursor();
  bool IsLast(const Item* item) const;

  ItemList* list_;
  std::vector<std::unique_ptr<Item>> items_;
  std::vector<RadioGroup*> groups_;
  bool tabMoves_ = false;
  bool enterAdvances_ = false;
  bool cursorAlways_ = false;
  int acceptResult_ = 1;
};

}  // namespace Tulk
