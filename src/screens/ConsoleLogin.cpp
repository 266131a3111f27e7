#include "screens/ConsoleLogin.h"

#include <unistd.h>

#include "host/ManagementNetwork.h"
#include "runtime/HostPath.h"

namespace Tulk {

bool IsConsoleLoginAllowed() {
  return access(HostPath(kShowLoginMarker).c_str(), F_OK) == 0;
}

std::string LoginHostText(std::string_view lead) {
  return std::string(lead) + GetHostFqdn() + ".";
}

}  // namespace Tulk
