#pragma once
/// "Network Adapters": which physical NICs carry the management network,
/// in which order.
///
/// A form 70 x 20 with a header of 7 rows: the text "Select the adapters
/// for this host's default management network connection. ...", a heading
/// row "Device Name", "Hardware Label (MAC Address)", "Status", then one
/// check box per physical NIC (its name, its hardware label with its MAC
/// address, "Connected" or "Disconnected"), checked when the NIC is among
/// the pending adapters. Footer "<D> View Details  <Space> Toggle Selected
/// ... <Enter> OK  <Esc> Cancel".
///
/// Keys: Up and Down move; Space marks the NIC, appending it to the
/// selection, or unmarks it, removing it and keeping the others' order (the
/// first in the selection is the primary adapter); D or d shows the NIC's
/// details (AdapterInfoDialog); Esc cancels. Enter looks at the selection
/// in order: the first NIC that is an uplink of a switch other than the
/// management switch raises UsedAdaptersDialog once. Enter there accepts
/// the selection.
///
/// When the NIC list or the switch scan cannot be read, the dialog still
/// opens (with what was read) but its result is 0 whatever the key.
///
/// Decisions of this implementation:
/// - Esc in UsedAdaptersDialog answers "do not take them off": the adapter
///   list stays open with the selection as marked, so that the operator can
///   change it or press Enter again to be asked again.
/// - A hardware label too long for its column is cut with "..." so that the
///   MAC address stays whole; the details show it in full.

#include <string>
#include <vector>

#include "host/PnicRow.h"
#include "toolkit/FormDialog.h"

namespace Tulk {

class AdaptersDialog : public FormDialog {
 public:
  /// The list above `owner`, with the pending adapters `selected` marked;
  /// `managementSwitch` is the switch that holds the management network.
  AdaptersDialog(Frame* owner, std::vector<std::string> selected, std::string managementSwitch);

  /// 1 when accepted, 0 on Esc or when the NICs could not be read.
  int Run() override;

  /// The selection in marking order (after Enter: the new adapters).
  const std::vector<std::string>& Selected() const { return selected_; }

  /// The row caption of `pnic`: its name, its hardware label with its MAC
  /// address and its link state, in the heading's columns.
  static std::string Caption(const PnicRow& pnic);

 protected:
  bool OnKey(int key) override;
  void Marked(Item& item) override;
  bool Accept() override;

 private:
  const PnicRow* RowOf(const Item* item) const;

  std::vector<std::string> selected_;
  std::string managementSwitch_;
  std::vector<PnicRow> pnics_;
  std::vector<CheckItem*> checks_;
  bool readOk_ = true;
};

}  // namespace Tulk
