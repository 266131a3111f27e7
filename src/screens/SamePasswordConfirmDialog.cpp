#include "screens/SamePasswordConfirmDialog.h"

namespace Tulk {
namespace {

constexpr char kFooter[] =
    "{color:black}<Enter>{/color} {color:dark-grey}Confirm{/color}{align:right}"
    "{color:black}<Esc>{/color} {color:dark-grey}Cancel{/color}{/align}";

}  // namespace

SamePasswordConfirmDialog::SamePasswordConfirmDialog(Frame* owner) : Dialog(owner, 60, 9, 6) {
  SetTitle(Text(163));
  SetText(Text(167));
  SetFooter(kFooter);
}

}  // namespace Tulk
