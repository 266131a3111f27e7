#pragma once
/// What a TestConsole starts, and in which surroundings (TestConsole.h).

#include <filesystem>
#include <functional>
#include <map>
#include <optional>
#include <string>
#include <utility>
#include <vector>

namespace TulkTest {

/// Options of a TestConsole; the defaults start tulk on 80 x 25 xterm-256color
/// in a fresh root with the simulated host tools and the built-in demo host.
struct Options {
  int cols = 80;
  int rows = 25;
  /// TERM for the program; empty leaves TERM unset.
  std::string term = "xterm-256color";
  /// Arguments after the program name.
  std::vector<std::string> args;
  /// Extra environment; these win over the harness's own settings.
  std::map<std::string, std::string> env;
  /// Variables removed from the environment.
  std::vector<std::string> unsetEnv;
  /// The program; empty means the tulk binary of this build.
  std::string program;
  /// JSON text of the simulated host's state, written into the test folder
  /// and named by TULK_HOST_STATE. Unset: the built-in demo host.
  std::optional<std::string> hostState;
  /// TULK_TIME_SCALE for the program; 0 leaves it unset.
  double timeScale = 0;
  /// Install the simulated host tools into the root.
  bool hostTools = true;
  /// Called with the root before the program starts (to add files).
  std::function<void(const std::filesystem::path& root)> prepareRoot;
  /// Start the program in the constructor.
  bool start = true;
  /// Keep every byte the program writes (Output()).
  bool keepOutput = false;
  /// Console logins through the real PAM library: pam_wrapper preloaded,
  /// a "tulk" service of pam_matrix with these users (name → password), and
  /// the test policy module before it. Empty: no PAM set-up.
  std::map<std::string, std::string> pamUsers;
  /// Lines "user:outcome" for the test policy module: "expired",
  /// "denied", "chauthtok-fails".
  std::vector<std::string> pamPolicy;
};

/// Options that run `program`, a test program of this build, instead of
/// tulk, in a root without the simulated host tools.
inline Options TestProgram(std::string program) {
  Options options;
  options.program = std::move(program);
  options.hostTools = false;
  return options;
}

}  // namespace TulkTest
