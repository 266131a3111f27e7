#pragma once
/// "Adapter Details": the five fields of one physical NIC of the adapter
/// list.
///
/// A dialog 70 x 13 with a header of 4 rows (the title alone), the lines
/// "Device Name: ", "Hardware Label: ", "MAC Address: ", "Status: " and
/// "Virtual Switch: " (the switch using the NIC as an uplink, "None" when
/// no switch does) with their values in the client area, and the footer
/// "<Enter> OK". Only Enter closes it; its result is 1.

#include <string>

#include "host/PnicRow.h"
#include "toolkit/Dialog.h"

namespace Tulk {

class AdapterInfoDialog : public Dialog {
 public:
  /// The details of `pnic` above `owner`.
  AdapterInfoDialog(Frame* owner, const PnicRow& pnic);

  /// Waits for Enter; returns 1.
  int Run() override;

  /// The client area's text (five lines).
  static std::string Details(const PnicRow& pnic);
};

}  // namespace Tulk
