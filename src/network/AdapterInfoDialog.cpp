#include "network/AdapterInfoDialog.h"

#include "toolkit/TextArea.h"

namespace Tulk {

AdapterInfoDialog::AdapterInfoDialog(Frame* owner, const PnicRow& pnic) : Dialog(owner, 70, 13, 4) {
  SetTitle("Adapter Details");
  SetFooter(Footer::kOk);
  if (Window* content = Content(); content != nullptr) {
    auto* details = new TextArea(content, 0, 0, content->Width(), content->Height());
    details->SetText(Details(pnic));
  }
}

int AdapterInfoDialog::Run() {
  return WaitForEnter();
}

std::string AdapterInfoDialog::Details(const PnicRow& pnic) {
  return "Device Name: " + pnic.name + "\nHardware Label: " + pnic.hardwareLabel +
         "\nMAC Address: " + pnic.mac + "\nStatus: " + pnic.linkState +
         "\nVirtual Switch: " + (pnic.switchName.empty() ? "None" : pnic.switchName);
}

}  // namespace Tulk
