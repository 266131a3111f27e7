#include "network/PingAddress.h"

#include "host/HostCommand.h"
#include "network/NetworkTestText.h"

namespace Tulk {

void PingAddress(const std::string& interfaceName, const std::string& address,
                 const std::shared_ptr<WorkerResult>& result) {
  result->Set(RunHostCommandLine(PingCommand(interfaceName, address)));
}

}  // namespace Tulk
