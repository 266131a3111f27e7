#include "host/HostStartup.h"

#include <cstdlib>
#include <limits>

#include "host/AuditLog.h"
#include "host/EventReporter.h"
#include "host/HostValueProviders.h"
#include "include/Constants.h"
#include "platform/api/AdvancedOption.h"
#include "platform/api/HostMgrException.h"
#include "platform/api/LogConfig.h"
#include "platform/api/Preference.h"
#include "platform/api/ProductState.h"

namespace Tulk {

void InitPreferences() {
  Preference_Init();
}

void InitProductLogging() {
  Log_SetProductInfo(ProductState_GetName(), ProductState_GetVersion(),
                     ProductState_GetBuildNumberString(), ProductState_GetCompilationOption());
  Log_InitWithSyslogSimpleInt("TULK", Log_CfgInterface(), "TULK");
}

std::optional<std::uint32_t> ReadTulkTimeout() {
  try {
    std::int64_t value = HykCtl::Adv::UserAdvancedOptionImpl().GetUserOption(kTulkTimeOutOption);
    if (value < 0 || value > std::numeric_limits<std::uint32_t>::max()) {
      return std::nullopt;
    }
    return static_cast<std::uint32_t>(value);
  } catch (const HostMgr::Lib::HostMgrException&) {
    return std::nullopt;
  }
}

void StartHostServices() {
  RegisterHostValueProviders();
  if (InitEventReporting()) {
    std::atexit(CloseEventReporting);
  }
  WriteProductIssueRecord();
}

}  // namespace Tulk
