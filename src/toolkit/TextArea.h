#pragma once
/// A window that shows one marked-up text (render/MarkupLayout.h).
///
/// Each draw erases the window, lays the text out to the window's width
/// (word-wrapped, aligned, host variables filled in) and paints it; colour
/// tags colour the text only while the area is drawn active. Text beyond
/// the last row is not shown; the area does not scroll.
///
///   auto* note = new TextArea(body, 2, 1, 56, 3, -1, kBlack);
///   note->SetText("{color:red}Warning!{/color} The host will restart.");

#include <string>
#include <string_view>

#include "render/ColorTable.h"
#include "render/VariableTable.h"
#include "toolkit/Window.h"

namespace Tulk {

class TextArea : public Window {
 public:
  /// A text area inside `parent`; a background or foreground of -1 takes
  /// the parent's.
  TextArea(Window* parent, int column, int row, int width, int height, int background = -1,
           int foreground = -1);

  /// Stores `text`, erases the area and draws the text at once (active or
  /// dimmed as the area was last drawn).
  void SetText(std::string_view text);
  /// Adds `text` to the end of the current text and draws it (progress
  /// lines).
  void Append(std::string_view text);
  /// The text as set (markup).
  const std::string& Text() const { return text_; }

 protected:
  void PaintContents(bool active) override;

 private:
  std::string text_;
  ColorTable colors_;
  VariableTable variables_;
};

}  // namespace Tulk
