#pragma once
/// A window the operator interacts with: a top-level window with an owner
/// frame (the one that was showing before it), the string catalogue, and a
/// key loop (Run).
///
/// Frames are modal. The frame that opens another builds it, runs it with
/// RunFrame() (toolkit/RunFrame.h), reads its result and deletes it. The
/// key loop reads keys with WaitForKey(this, true) (runtime/KeyInput.h).

#include <cstdint>

#include "render/StringFactory.h"
#include "runtime/RuntimeFrame.h"
#include "toolkit/Window.h"

namespace Tulk {

class Frame : public Window, public RuntimeFrame {
 public:
  /// A top-level frame; `owner` may be null (the welcome screen). Looks up
  /// the "en_US" string catalogue.
  Frame(Frame* owner, int column, int row, int width, int height, int background, int foreground);

  /// Draws the frame active or dimmed (Window::Redraw); the key loop calls
  /// it when it dims the screen and when a key wakes it.
  void Redraw(bool active) override;

  /// The frame's key loop; returns its result (for a dialog: 1 confirmed,
  /// 0 cancelled).
  virtual int Run() = 0;

  /// The frame shown before this one (null for the welcome screen).
  Frame* Owner() const { return owner_; }
  /// The "en_US" string catalogue.
  StringFactory* Strings() const { return strings_; }
  /// Catalogue text `id` (the empty text for an unknown number).
  const char* Text(std::uint32_t id) const;

 private:
  Frame* owner_;
  StringFactory* strings_;
};

}  // namespace Tulk
