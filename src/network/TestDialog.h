#pragma once
/// "Test Management Network": the addresses to ping and the name to
/// resolve, reviewed by the operator before the test runs.
///
/// 70 x 14, header 6 rows, footer "<Up/Down> Select ... <Enter> OK  <Esc>
/// Cancel". Four inputs, 30 columns each: "Ping Address #1:" to "Ping
/// Address #3:" and "Resolve Hostname", pre-filled from the host
/// (ReadNetworkTestDefaults(): gateways, name servers, host name and
/// domain; NetworkTestTargets.h gives the order). Enter runs RunTestDialog
/// with the values and returns 1 once its report is closed (also when the
/// test was interrupted); Esc returns 0.
///
/// Decisions of this implementation:
/// - Each non-empty address must be an IPv4 or IPv6 address (an IPv6 one
///   may carry "%zone"); otherwise "Invalid IP address" / "Invalid IP or
///   IPv6 address." is shown and that input takes the cursor again.
/// - An empty host name skips the resolution.

#include <array>
#include <string>

#include "host/NetworkTestTargets.h"
#include "toolkit/FormDialog.h"

namespace Tulk {

class TestDialog : public FormDialog {
 public:
  static constexpr int kWidth = 70;
  static constexpr int kHeight = 14;
  static constexpr int kHeaderHeight = 6;
  static constexpr int kInputWidth = 30;

  /// The form above `owner`, filled from the host.
  explicit TestDialog(Frame* owner);

  /// The form, then the test; 1 when the form was confirmed.
  int Run() override;

 protected:
  bool Accept() override;

 private:
  NetworkTestDefaults defaults_;
  std::array<InputItem*, kPingTargetCount> addresses_{};
  InputItem* hostName_ = nullptr;
};

}  // namespace Tulk
