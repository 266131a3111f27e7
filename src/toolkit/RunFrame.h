#pragma once
/// Runs a frame modally.
///
///   auto* dialog = new MessageDialog(this, TextId::kPasswordErrorTitle,
///   Text(TextId::kPasswordMismatch)); RunFrame(dialog); delete dialog;
///
/// The owner is dimmed while the frame runs and drawn active again
/// afterwards; `currentWindow` (include/ProcessFlags.h) names the frame
/// that receives keys. TulkTimeout (runtime/KeyInput.h) passes through:
/// `currentWindow` is cleared and the exception rethrown, so that it
/// unwinds every open frame up to the welcome screen.

namespace Tulk {

class Frame;

/// Dims the owner, draws `frame` active, runs its key loop and returns its
/// result (1 confirmed, 0 cancelled for a dialog). The owner and the frame
/// are drawn in one terminal update, so the part of the owner under the
/// frame is never sent.
int RunFrame(Frame* frame);

}  // namespace Tulk
