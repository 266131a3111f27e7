#include "screens/LockdownDialog.h"

#include "host/HostTools.h"
#include "include/Keys.h"
#include "toolkit/ItemList.h"
#include "toolkit/MessageDialog.h"
#include "toolkit/RunFrame.h"

namespace Tulk {
namespace {

constexpr char kFooter[] =
    "{color:black}<Space>{/color} {color:dark-grey}Toggle{/color}"
    "{align:right}{color:black}<Enter>{/color} {color:dark-grey}OK{/color}  "
    "{color:black}<Esc>{/color} {color:dark-grey}Cancel{/color}{/align}";

}  // namespace

LockdownDialog::LockdownDialog(Frame* owner)
    : Dialog(owner, 60, 11, 6),
      wasEnabled_(OskCmdGetFlag("osksvc/auth/lockdown_is_enabled")),
      box_(Text(256), wasEnabled_),
      list_(new ItemList(Content(), 0, 0, Content()->Width(), Content()->Height())) {
  list_->SetItems({&box_});
  Fill();
}

LockdownDialog::~LockdownDialog() = default;

bool LockdownDialog::Ticked() const {
  return box_.Checked();
}

void LockdownDialog::Fill() {
  DrawBatch batch;
  SetTitle(Text(254));
  SetText(Text(255));
  SetFooter(kFooter);
  list_->Draw();
}

int LockdownDialog::Run() {
  Fill();
  for (;;) {
    const int key = WaitKey();
    if (key == kKeyEsc) {
      return 0;
    }
    if (key == kKeySpace) {
      box_.Toggle();
      list_->Draw();
    } else if (key == kKeyEnter) {
      break;
    }
  }
  if (Ticked() != wasEnabled_) {
    const char* command = Ticked() ? "osksvc/auth/lockdown_enter" : "osksvc/auth/lockdown_exit";
    if (RunOskCommand(command) != 0) {
      MessageDialog message(this, 276, Text(280));
      RunFrame(&message);
    }
  }
  return 1;
}

}  // namespace Tulk
