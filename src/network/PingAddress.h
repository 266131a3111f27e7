#pragma once
/// The ping check of the network test, run on a worker thread.

#include <memory>
#include <string>

#include "runtime/WorkerResult.h"

namespace Tulk {

/// Runs PingCommand(`interfaceName`, `address`) through the host's command
/// execution and stores its exit status in `result` (0: the address
/// answered; -1 stands for a program that could not run, stored as -2).
/// Meant for a detached thread: it shares only `result` with the screen.
void PingAddress(const std::string& interfaceName, const std::string& address,
                 const std::shared_ptr<WorkerResult>& result);

}  // namespace Tulk
