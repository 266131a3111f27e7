#include "network/PingAddress.h"

#include "host/HostCommand.h"
#include "network/NetworkTestText.h"

namespace Tulk {

void PingAddress(std::string interfaceName, std::string address,
                 std::shared_ptr<WorkerResult> result) {
  result->Set(RunHostCommandLine(PingCommand(interfaceName, address)));
}

}  // namespace Tulk
