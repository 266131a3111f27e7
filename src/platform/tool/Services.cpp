#include "platform/tool/Services.h"

#include "platform/sim/SimHost.h"
#include "platform/sim/SimState.h"

namespace Sim::Tools {
namespace {

// The services that services.sh starts and stops.
constexpr const char* kManagementAgents[] = {"mgmtd", "hlma"};

void Apply(json& service, const std::string& verb) {
  if (verb == "start") {
    service["running"] = true;
  } else if (verb == "stop") {
    service["running"] = false;
  } else {
    service["running"] = true;
    service["restarts"] = service.value("restarts", 0) + 1;
  }
}

bool IsVerb(const std::string& verb, bool withStatus) {
  return verb == "start" || verb == "stop" || verb == "restart" || (withStatus && verb == "status");
}

}  // namespace

int InitScript(ToolRun& run) {
  const std::string& name = run.Name();
  const std::string verb = run.Args().empty() ? "" : run.Args().front();
  if (!IsVerb(verb, true)) {
    run.Err("Usage: " + name + " {start|stop|restart|status}\n");
    return 1;
  }
  SimHost& host = SimHost::Instance();
  const json& service = ObjectAt(ObjectAt(host.State(), "services"), name.c_str());
  if (!service.value("installed", true)) {
    run.Err(name + " is not installed\n");
    return 1;
  }
  if (verb == "status") {
    const bool running = service.value("running", false);
    run.Out(name + (running ? " is running\n" : " is not running\n"));
    return running ? 0 : 3;
  }
  host.Modify(
      [&](json& state) { Apply(ObjectFor(ObjectFor(state, "services"), name.c_str()), verb); });
  run.Out((verb == "stop"    ? "Stopping "
           : verb == "start" ? "Starting "
                             : "Restarting ") +
          name + "\n");
  return 0;
}

int ServicesScript(ToolRun& run) {
  const std::string verb = run.Args().empty() ? "" : run.Args().front();
  if (!IsVerb(verb, false)) {
    run.Err("Usage: services.sh {start|stop|restart}\n");
    return 1;
  }
  SimHost::Instance().Modify([&](json& state) {
    json& services = ObjectFor(state, "services");
    for (const char* agent : kManagementAgents) {
      Apply(ObjectFor(services, agent), verb);
    }
  });
  for (const char* agent : kManagementAgents) {
    run.Out("Running " + verb + " action on " + agent + "\n");
  }
  return 0;
}

}  // namespace Sim::Tools
