#include "platform/sim/DemoHost.h"

namespace Sim {

nlohmann::json DemoHostState() {
  return nlohmann::json::parse(R"json(
{
  "product": {
    "name": "Brimlo Tavi",
    "version": "8.1.0",
    "build": "24519031",
    "kernelRelease": "Releasebuild",
    "compilationOption": "release"
  },
  "advancedOptions": {
    "/UserVars/TulkTimeOut": 600,
    "/UserVars/TaviShellTimeOut": 0,
    "/UserVars/TaviShellInteractiveTimeOut": 0
  },
  "faults": {}
}
)json");
}

}  // namespace Sim
