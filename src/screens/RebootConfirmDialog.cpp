#include "screens/RebootConfirmDialog.h"

#include "render/TextId.h"

namespace Tulk {

RebootConfirmDialog::RebootConfirmDialog(Frame* owner, bool graceful)
    : PowerConfirmDialog(owner, graceful, TextId::kRestartHostTitle, TextId::kRestartInProgress,
                         "reboot") {
}

}  // namespace Tulk
