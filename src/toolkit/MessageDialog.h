#pragma once
/// A one-button dialog that reports something: its title is a catalogue
/// text (render/StringFactory.h), its message free text. Only Enter closes
/// it; Esc and every other key are ignored. Its result is always 1.
///
///   MessageDialog error(this, TextId::kPasswordErrorTitle, Text(TextId::kOldPasswordIncorrect));
///   RunFrame(&error);
///
/// The size is the caller's choice. The default, 60 x 11 with a header of
/// 7 rows, gives the message three lines of 54 columns.

#include <cstdint>
#include <string>

#include "toolkit/Dialog.h"

namespace Tulk {

class MessageDialog : public Dialog {
 public:
  /// A message dialog above `owner` titled with catalogue text `titleId`.
  MessageDialog(Frame* owner, std::uint32_t titleId, std::string message, int width = 60,
                int height = 11, int headerHeight = 7);

  /// Shows the title, the message and the Enter/OK footer, and waits for
  /// Enter; returns 1.
  int Run() override;

  /// Runs a message dialog of the default size above `owner` until Enter
  /// closes it (the dialog lives on the stack, so the idle timeout unwinds
  /// through it).
  static void Show(Frame* owner, std::uint32_t titleId, std::string message);

  /// The message.
  const std::string& Message() const { return message_; }

 private:
  std::uint32_t titleId_;
  std::string message_;
};

}  // namespace Tulk
