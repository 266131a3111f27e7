#pragma once
/// "Restart Management Network: Confirm": the question before the
/// management network is restarted.
///
/// 70 x 12, header 7 rows (title and the three-line warning), the question
/// "Restart management network now?" in the client area, footer "<F11> OK
/// <Esc> Cancel". Only F11 confirms; Enter, Space and every other key are
/// ignored; Esc returns 0. On F11 the management NIC's configuration is read
/// and DoRestartNetworkDialog does the restart; Run() returns its result.
///
/// Decisions of this implementation:
/// - The management NIC is read when F11 is pressed. When it has gone
///   meanwhile (or cannot be read), the message "Restart Management
///   Network: Error" / "Management network interface cannot be found." is
///   shown and nothing is restarted; Run() returns 0.

#include "toolkit/ConfirmDialog.h"

namespace Tulk {

class RestartNetworkDialog : public ConfirmDialog {
 public:
  static constexpr int kWidth = 70;
  static constexpr int kHeight = 12;
  static constexpr int kHeaderHeight = 7;

  /// The question above `owner` (the System Customization menu).
  explicit RestartNetworkDialog(Frame* owner);

  /// 0 on Esc; after F11, the result of DoRestartNetworkDialog.
  int Run() override;
};

}  // namespace Tulk
