#include "screens/ShutdownConfirmDialog.h"

#include "render/TextId.h"

namespace Tulk {

ShutdownConfirmDialog::ShutdownConfirmDialog(Frame* owner, bool graceful)
    : PowerConfirmDialog(owner, graceful, TextId::kShutdownHostTitle, TextId::kShutdownInProgress,
                         "poweroff") {
}

}  // namespace Tulk
