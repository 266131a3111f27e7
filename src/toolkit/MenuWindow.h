#pragma once
/// A full-screen menu (RootWindow) driven by a table of entries: each entry
/// has an identifier, a label, whether it can be chosen, its description and
/// footer for the right half, and what Enter does.
///
/// A disabled entry shows its label greyed, "{color:dark-grey}" label
/// "{/color}", and Up and Down pass over it. Entries are selected by
/// position or by identifier (greying and enabling by identifier act on
/// every entry with it).
///
/// Keys of Run(): Down and Up move and show the new entry's description;
/// Enter runs the selected entry's action and, when the action asks for it,
/// shows the window again (Show(): Populate()); Esc returns 1 unless
/// Leave() keeps the window open; every other key goes to OnKey().
///
///   class ToolsWindow : public MenuWindow {
///    public:
///     explicit ToolsWindow(Frame* owner) : MenuWindow(owner) {
///       SetMenuTitle(Text(TextId::kTroubleshootingTitle));
///       SetEntries({{TextId::kRestartAgents, Text(TextId::kRestartAgents), true,
///                    "", [this] { return std::string(Text(TextId::kRestartAgentsDescription)); },
///                    Footer::MenuAction("Restart", "Exit"),
///                    [this] { RunDialog<RestartAgentsDialog>(); return false; }}});
///     }
///   };
///
/// Populate() (called by Show()) sets the left title and footer, selects the
/// first entry (or keeps the selected one, SetKeepSelection()) and shows its
/// description with the entry's footer, or with the refresh footers when
/// SetRefreshFooters() gave them: those then stay until the first move.

#include <cstddef>
#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "toolkit/RootWindow.h"

namespace Tulk {

class LabelItem;

/// One row of a MenuWindow.
struct MenuEntry {
  /// What the window knows the entry by (usually the catalogue id of its
  /// label).
  std::uint32_t id = 0;
  /// The label (markup, shown greyed when the entry is disabled).
  std::string label;
  /// Whether the entry can be chosen.
  bool enabled = true;
  /// The right half's title; empty: the label.
  std::string title;
  /// The right half's text, built when the entry is shown.
  std::function<std::string()> describe;
  /// The right half's footer.
  std::string footer;
  /// Enter on the entry; returns whether the window is shown again
  /// afterwards (Show()). Empty: Enter does nothing.
  std::function<bool()> action;
};

class MenuWindow : public RootWindow {
 public:
  /// Builds the window above `owner`.
  explicit MenuWindow(Frame* owner);
  ~MenuWindow() override;

  /// The key loop described above; returns 1 on Esc.
  int Run() override;

  /// Left title, left footer, the entries (the first, or the kept one,
  /// selected) and the right half.
  void Populate() override;

  /// The left title.
  void SetMenuTitle(std::string title) { menuTitle_ = std::move(title); }
  /// The left footer Populate() sets (Footer::kMenuSelect by default).
  void SetMenuFooter(std::string footer) { menuFooter_ = std::move(footer); }
  /// Footers that Populate() shows instead of the entry's own (left and
  /// right) until the selection moves.
  void SetRefreshFooters(std::string left, std::string right);
  /// Populate() keeps the selected entry (when it can still be chosen)
  /// instead of starting from the first.
  void SetKeepSelection(bool keep) { keepSelection_ = keep; }

  /// Replaces the entries; the first that can be chosen is selected.
  void SetEntries(std::vector<MenuEntry> entries);
  /// The entries in menu order.
  const std::vector<MenuEntry>& Entries() const { return entries_; }

  /// Enables or disables (greys) the entry at `position`, or every entry
  /// with identifier `id`. Not drawn until the menu is drawn.
  void SetEnabled(std::size_t position, bool enabled);
  void SetEnabledById(std::uint32_t id, bool enabled);
  /// Replaces the label of the entry at `position`.
  void SetLabel(std::size_t position, std::string label);

  /// Selects the entry at `position` or the first with identifier `id`
  /// (when it can be chosen); does not draw. Returns whether it did.
  bool SelectPosition(std::size_t position);
  bool SelectId(std::uint32_t id);
  /// The selected entry's position, or nullopt.
  std::optional<std::size_t> SelectedPosition() const;
  /// The selected entry, or null.
  const MenuEntry* Selected() const;
  /// The selected entry's identifier, or `none` when nothing is selected.
  std::uint32_t SelectedId(std::uint32_t none = 0) const;

  /// Moves the selection down or up; shows the new entry's description and
  /// footer. Returns whether it moved.
  bool Move(bool down);
  /// Rebuilds the right half for the selected entry, with its own footer.
  void ShowDescription();
  /// Draws the menu (after labels or enabling changed).
  void DrawMenu();

 protected:
  /// Keys other than Up, Down, Enter and Esc; returns true when handled.
  virtual bool OnKey(int key);
  /// Called before the selection moves away from an entry.
  virtual void BeforeMove() {}
  /// Esc: whether the window closes (a window with unsaved edits may ask
  /// first); the default closes it.
  virtual bool Leave() { return true; }

 private:
  void Relabel(std::size_t position);
  void ShowRight(bool ownFooter);

  std::string menuTitle_;
  std::string menuFooter_;
  std::string refreshLeft_;
  std::string refreshRight_;
  bool refreshFooters_ = false;
  bool keepSelection_ = false;
  std::vector<MenuEntry> entries_;
  std::vector<std::unique_ptr<LabelItem>> items_;
};

}  // namespace Tulk
