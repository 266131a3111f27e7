#include "screens/ShutdownDialog.h"

namespace Tulk {

ShutdownDialog::ShutdownDialog(Frame* owner) : Dialog(owner, 60, 19, 12), terminate_("") {
}

int ShutdownDialog::Run() {
  Dialog::Run();
  return 0;
}

void ShutdownDialog::PowerAction(bool /*reboot*/) {
}

}  // namespace Tulk
