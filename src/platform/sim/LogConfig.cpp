#include "platform/api/LogConfig.h"

#include <string>

namespace {

// The simulated library keeps the identity it was given; the console's own
// system-log calls do the logging.
struct LogState {
  std::string name, version, build, compilationOption, ident;
  bool initialised = false;
} g_log;

int g_config = 0;

}  // namespace

extern "C" {

void Log_SetProductInfo(const char* name, const char* version, const char* build,
                        const char* compilationOption) {
  g_log.name = name != nullptr ? name : "";
  g_log.version = version != nullptr ? version : "";
  g_log.build = build != nullptr ? build : "";
  g_log.compilationOption = compilationOption != nullptr ? compilationOption : "";
}

void* Log_CfgInterface() {
  return &g_config;
}

int Log_InitWithSyslogSimpleInt(const char* ident, void* /*config*/, const char* /*syslogIdent*/) {
  g_log.ident = ident != nullptr ? ident : "";
  g_log.initialised = true;
  return 0;
}
}
