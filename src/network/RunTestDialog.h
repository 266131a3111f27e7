#pragma once
/// "Testing Management Network": runs the checks one by one and reports
/// each verdict, while Esc can end the test at any moment.
///
/// 70 x 14, header 5 rows ("You may interrupt the test at any time."),
/// footer "<Esc> Cancel" while the checks run. For each non-empty address,
/// in input order (an empty input is passed over and the others keep their
/// numbers), the report gets "Pinging address #N (<address><zone>)." —
/// the zone "%<interface>" for a link-local IPv6 address typed without one
/// — and PingAddress() runs on a detached thread; when its result arrives,
/// "OK." (exit status 0) or "Failed." ends the line, right-aligned. Then,
/// for a non-empty host name, "Resolving hostname (<name>)." and
/// ResolveHostName() the same way. Finally the footer becomes "<Enter> OK"
/// and only Enter closes the report (result 1).
///
/// The dialog waits with the shared key read that also wakes for a
/// worker's result, so dimming, the idle timeout and signals work while a
/// check runs. Esc ends the test at once (result 0); a check still running
/// finishes on its own and its result is dropped.
///
/// Decisions of this implementation:
/// - The resolution line names the host name, as the ping lines name their
///   address.
/// - A worker thread that cannot be started counts as a failed check.

#include <array>
#include <memory>
#include <string>

#include "host/NetworkTestTargets.h"
#include "toolkit/ProgressDialog.h"

namespace Tulk {

class WorkerResult;

class RunTestDialog : public ProgressDialog {
 public:
  static constexpr int kWidth = 70;
  static constexpr int kHeight = 14;
  static constexpr int kHeaderHeight = 5;

  /// The test above `owner`: the three ping inputs as typed (empty ones
  /// are skipped), the host name, and the management NIC's name (empty when
  /// there is none: the pings then name no interface).
  RunTestDialog(Frame* owner, std::array<std::string, kPingTargetCount> targets,
                std::string hostName, std::string interfaceName);

  /// Runs the test; 0 when Esc interrupted it, 1 when Enter closed the
  /// report.
  int Run() override;

 private:
  // Waits for `result`; false when Esc ended the test first.
  bool Await(const WorkerResult& result);
  // Starts `check` on a detached thread sharing `result` and waits for it;
  // false on Esc.
  template <typename Check, typename... Args>
  bool RunCheck(Check check, Args... args);

  std::array<std::string, kPingTargetCount> targets_;
  std::string hostName_;
  std::string interfaceName_;
};

}  // namespace Tulk
