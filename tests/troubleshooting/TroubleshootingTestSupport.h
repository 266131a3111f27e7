#pragma once
// The troubleshooting screen tests' host: the demo host with the shell and
// SSH running (and enabled) or not.

#include <string>
#include <vector>

#include "ScreenTestSupport.h"

namespace TulkTest {

using Lines = std::vector<std::string>;

inline Json HostWithServices(bool shellRunning, bool sshRunning) {
  Json host = DemoHostState();
  host["services"]["TavShell"] = {{"running", shellRunning}, {"enabled", shellRunning}};
  host["services"]["SSH"] = {{"running", sshRunning}, {"enabled", sshRunning}};
  return host;
}

}  // namespace TulkTest
