#include "platform/api/Preference.h"

#include <cstdio>
#include <cstdlib>
#include <string>

#include "platform/sim/SimHost.h"

extern "C" {

// The simulated host's start: it refuses to run against the real machine's
// root (whatever path leads there: "/tmp/..", "/proc/self/root", a link to
// "/") or a root that does not exist, and loads the host state before the
// screen starts, so that a bad state file is reported on standard error with
// exit status 1.
void Preference_Init() {
  if (Sim::ResolvedScratchRoot().empty()) {
    std::fprintf(stderr,
                 "tulk: the simulated host needs TULK_ROOT set to a scratch root "
                 "(scripts/make-demo-root.sh builds one)\n");
    std::exit(1);
  }
  try {
    Sim::SimHost::Instance().Load();
  } catch (const Sim::StateError& error) {
    std::fprintf(stderr, "tulk: %s\n", error.what());
    std::exit(1);
  }
}
}
