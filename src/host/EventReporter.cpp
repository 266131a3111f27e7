#include "host/EventReporter.h"

#include <syslog.h>

#include "platform/api/QobUserLib.h"
#include "runtime/SystemLog.h"

namespace Tulk {
namespace {

struct EventEntry {
  const char* id;
  const char* text;
};

EventEntry Entry(TulkEvent event) {
  switch (event) {
    case TulkEvent::LoginAccessDenied:
      return {"qob.user.tulk.login.failed", "Access denied for user %s"};
    case TulkEvent::LoginAuthenticationFailed:
      return {"qob.user.tulk.login.failed", "Authentication of user %s failed"};
    case TulkEvent::PasswordChanged:
      return {"qob.user.tulk.login.passwd.changed", "Login password for user %s changed"};
    case TulkEvent::NetworkRestart:
      return {"qob.user.tulk.network.restart", "Restarting %s"};
    case TulkEvent::FactoryNetworkRestored:
      return {"qob.user.tulk.factory.network.restored", "Restoring factory network settings"};
    case TulkEvent::RestartingHostAgents:
      return {"qob.user.tulk.restarting.hostagents", "Restarting host agents"};
    case TulkEvent::RestoreFactoryDefaults:
      return {"qob.user.tulk.restore.factory.defaults", "Restoring factory defaults"};
    case TulkEvent::RebootHost:
      return {"qob.user.tulk.reboot.host", "Rebooting host"};
    case TulkEvent::ShutdownHost:
      return {"qob.user.tulk.shutdown.host", "Shutting down host"};
  }
  return {"", ""};
}

bool g_open = false;

}  // namespace

const char* EventId(TulkEvent event) {
  return Entry(event).id;
}

const char* EventText(TulkEvent event) {
  return Entry(event).text;
}

std::string EventMessage(TulkEvent event) {
  EventEntry entry = Entry(event);
  return std::string(kEventMarker) + entry.id + ")" + entry.text;
}

bool InitEventReporting() {
  Log(LOG_INFO, "Initializing qobuser library");
  int rc = QobUserLib_Init();
  if (rc != 0) {
    Log(LOG_ERR, "Unable to initialize qobuser library from TULK. Error code: %d", rc);
    return false;
  }
  g_open = true;
  return true;
}

void ReportEvent(const std::string& message, const std::vector<std::string>& arguments) {
  std::vector<const char*> texts;
  texts.reserve(arguments.size());
  for (const std::string& argument : arguments) {
    texts.push_back(argument.c_str());
  }
  QobUserLib_AddQob(message.c_str(), texts.empty() ? nullptr : texts.data(),
                    static_cast<int>(texts.size()));
}

void CloseEventReporting() {
  QobUserLib_Close();
  g_open = false;
}

bool EventReportingOpen() {
  return g_open;
}

bool PostEvent(TulkEvent event, const std::vector<std::string>& arguments) {
  bool openedHere = false;
  if (!g_open) {
    if (!InitEventReporting()) {
      return false;
    }
    openedHere = true;
  }
  ReportEvent(EventMessage(event), arguments);
  if (openedHere) {
    CloseEventReporting();
  }
  return true;
}

}  // namespace Tulk
