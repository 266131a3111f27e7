#include "platform/api/QobUserLib.h"

#include <unistd.h>

#include <atomic>
#include <cstdlib>
#include <string>

#include "platform/api/HostMgrException.h"
#include "platform/sim/SimHost.h"
#include "platform/sim/SimState.h"

// The simulated facility appends one JSON object per event to
// "<root>/var/log/tulk-sim/events.jsonl".

namespace {

constexpr char kMarker[] = "@&!*@*@(";
std::atomic<bool> g_open = false;

// A fault's message that is a number becomes the error code; anything
// else gives 1.
int FaultCode(const char* operation) {
  try {
    Sim::SimHost::Instance().CheckFault(operation);
    return 0;
  } catch (const HostMgr::Lib::HostMgrException& fault) {
    char* end = nullptr;
    long code = std::strtol(fault.what(), &end, 10);
    return (end != fault.what() && *end == '\0' && code != 0) ? static_cast<int>(code) : 1;
  }
}

std::string Fill(const std::string& text, const char* const* arguments, int count) {
  std::string filled;
  int next = 0;
  for (std::size_t i = 0; i < text.size(); ++i) {
    if (text[i] == '%' && i + 1 < text.size() && text[i + 1] == 's' && next < count) {
      filled += arguments[next] != nullptr ? arguments[next] : "";
      ++next;
      ++i;
    } else if (text[i] == '%' && i + 1 < text.size() && text[i + 1] == '%') {
      filled += '%';
      ++i;
    } else {
      filled += text[i];
    }
  }
  return filled;
}

}  // namespace

extern "C" {

int QobUserLib_Init(void) {
  const int code = FaultCode("QobUserLib_Init");
  g_open = code == 0;
  return code;
}

int QobUserLib_AddQob(const char* message, const char* const* arguments, int count) {
  if (!g_open) {
    return 1;
  }
  const std::string text = message != nullptr ? message : "";
  const std::size_t close = text.find(')');
  if (text.rfind(kMarker, 0) != 0 || close == std::string::npos || close == sizeof kMarker - 1) {
    return 2;
  }
  if (FaultCode("QobUserLib_AddQob") != 0) {
    return 3;
  }
  const std::string body = text.substr(close + 1);
  Sim::json record = {{"time", Sim::TimeStamp()},
                      {"pid", getpid()},
                      {"id", text.substr(sizeof kMarker - 1, close - (sizeof kMarker - 1))},
                      {"text", Fill(body, arguments, count)},
                      {"message", text},
                      {"arguments", Sim::json::array()}};
  for (int i = 0; i < count; ++i) {
    record["arguments"].push_back(arguments[i] != nullptr ? arguments[i] : "");
  }
  return Sim::AppendRecord("events.jsonl", record) ? 0 : 3;
}

void QobUserLib_Close(void) {
  g_open = false;
}
}
