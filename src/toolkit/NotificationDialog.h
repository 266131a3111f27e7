#pragma once
/// A one-button dialog like MessageDialog whose title is free text. Only
/// Enter closes it; its result is always 1.
///
/// The size is the caller's choice; the default is that of MessageDialog.

#include <string>

#include "toolkit/Dialog.h"

namespace Tulk {

class NotificationDialog : public Dialog {
 public:
  /// A notification dialog above `owner` with its own `title`.
  NotificationDialog(Frame* owner, std::string title, std::string message, int width = 60,
                     int height = 11, int headerHeight = 7);

  /// Shows the title, the message and the Enter/OK footer, and waits for
  /// Enter; returns 1.
  int Run() override;

  /// The title and the message.
  const std::string& Title() const { return title_; }
  const std::string& Message() const { return message_; }

 private:
  std::string title_;
  std::string message_;
};

}  // namespace Tulk
