#include "host/FactoryNetworkRestore.h"

#include <syslog.h>

#include <functional>

#include "host/CommandRunner.h"
#include "platform/api/HostMgrException.h"
#include "platform/api/NetworkInfoImpl.h"
#include "platform/api/ResourceInfoImpl.h"
#include "runtime/SystemLog.h"

namespace Tulk {
namespace {

HostOutcome Attempt(const std::function<void(HykCtl::Network::NetworkInfoImpl&)>& step) {
  try {
    HykCtl::Network::NetworkInfoImpl network;
    step(network);
    return HostOutcome::Done();
  } catch (const HostMgr::Lib::HostMgrException& failure) {
    return HostOutcome::Failed(failure.what());
  }
}

}  // namespace

bool HasRunningVirtualMachines() {
  try {
    return HykCtl::Resource::ResourceInfoImpl().HasRunningVirtualMachines();
  } catch (const HostMgr::Lib::HostMgrException& failure) {
    Log(LOG_ERR, "Checking for running VMs failed: %s", failure.what());
    return true;
  }
}

int PowerOffAllVirtualMachines() {
  return RunLoggedCommand("/sbin/powerOffVms", {"powerOffVms"}, nullptr,
                          kPowerOffVmsTimeoutSeconds);
}

HostOutcome DisableNetworkDumper() {
  return Attempt([](HykCtl::Network::NetworkInfoImpl& network) { network.DisableNetDumper(); });
}

HostOutcome ClearNetworkConfiguration() {
  Log(LOG_INFO, "Clearing Network Config");
  return Attempt([](HykCtl::Network::NetworkInfoImpl& network) { network.ClearNetworkConfig(); });
}

HostOutcome AutoConfigureNetwork() {
  Log(LOG_INFO, "Auto-Configuring Network");
  return Attempt([](HykCtl::Network::NetworkInfoImpl& network) { network.AutoConfigNetwork(); });
}

}  // namespace Tulk
