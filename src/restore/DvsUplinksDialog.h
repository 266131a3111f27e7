#pragma once
/// "DVS Uplinks": which of the distributed switch's uplinks the repaired
/// management port uses.
///
/// 70 x 14, header 6 rows, footer "<Up/Down> Select  <Space> Toggle ...
/// <Enter> OK  <Esc> Cancel", one check box per uplink of the switch. Enter
/// with no box ticked asks "DVS Uplinks: Warning" / "No uplinks were
/// selected." / "Do you want to continue?" (Y/N): Y accepts the empty
/// choice, N or Esc returns to the boxes. Esc returns 0 and keeps the
/// previous choice.

#include <string>
#include <vector>

#include "toolkit/FormDialog.h"

namespace Tulk {

class DvsUplinksDialog : public FormDialog {
 public:
  static constexpr int kWidth = 70;
  static constexpr int kHeight = 14;
  static constexpr int kHeaderHeight = 6;

  /// The choice above `owner` among `uplinks` (the switch's, in its order),
  /// with `chosen` ticked.
  DvsUplinksDialog(Frame* owner, std::vector<std::string> uplinks,
                   const std::vector<std::string>& chosen);

  /// The ticked uplinks, in the switch's order.
  std::vector<std::string> Chosen() const;

 protected:
  bool Accept() override;

 private:
  std::vector<std::string> uplinks_;
  std::vector<CheckItem*> boxes_;
};

}  // namespace Tulk
