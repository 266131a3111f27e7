#include "SimTestSupport.h"

#include <fcntl.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cstdlib>
#include <fstream>
#include <sstream>

#include "platform/sim/DemoHost.h"
#include "platform/sim/SimHost.h"

extern char** environ;

namespace SimTest {
namespace {

std::string Slurp(int fd) {
  std::string text;
  char buffer[4096];
  ssize_t got = 0;
  while ((got = read(fd, buffer, sizeof buffer)) > 0) {
    text.append(buffer, static_cast<std::size_t>(got));
  }
  return text;
}

}  // namespace

ScratchHost::ScratchHost(const std::function<void(nlohmann::json&)>& edit) {
  Prepare();
  nlohmann::json state = Sim::DemoHostState();
  if (edit) {
    edit(state);
  }
  std::ofstream(state_) << state.dump(2);
  Sim::SimHost::Instance().Reset();
}

ScratchHost::ScratchHost(const std::string& text) {
  Prepare();
  std::ofstream(state_) << text;
  Sim::SimHost::Instance().Reset();
}

void ScratchHost::Prepare() {
  std::string pattern = (std::filesystem::temp_directory_path() / "tulk-platform-XXXXXX").string();
  folder_ = mkdtemp(pattern.data());
  root_ = folder_ / "root";
  state_ = folder_ / "host-state.json";
  Finished install = RunProgram({TULK_TEST_HOSTTOOL, "--install", root_.string()});
  if (install.status != 0) {
    throw std::runtime_error("tulk-hosttool --install failed: " + install.err);
  }
  setenv("TULK_ROOT", root_.c_str(), 1);
  setenv("TULK_HOST_STATE", state_.c_str(), 1);
}

ScratchHost::~ScratchHost() {
  Sim::SimHost::Instance().Reset();
  unsetenv("TULK_HOST_STATE");
  unsetenv("TULK_ROOT");
  std::error_code ignored;
  std::filesystem::remove_all(folder_, ignored);
}

nlohmann::json ScratchHost::ReadState() const {
  std::ifstream in(state_);
  return nlohmann::json::parse(in);
}

void ScratchHost::WriteState(const nlohmann::json& state) const {
  Sim::WriteFileAtomically(state_.string(), state.dump(2));
}

std::vector<nlohmann::json> ScratchHost::Records(const std::string& file) const {
  std::vector<nlohmann::json> records;
  std::ifstream in(root_ / "var/log/tulk-sim" / file);
  for (std::string line; std::getline(in, line);) {
    records.push_back(nlohmann::json::parse(line));
  }
  return records;
}

Finished ScratchHost::Run(const std::string& path, const std::vector<std::string>& args) const {
  std::vector<std::string> argv = {(root_ / path).string()};
  argv.insert(argv.end(), args.begin(), args.end());
  return RunProgram(argv);
}

Finished RunProgram(const std::vector<std::string>& argv) {
  int out[2];
  int err[2];
  if (pipe(out) != 0 || pipe(err) != 0) {
    return {};
  }
  posix_spawn_file_actions_t actions;
  posix_spawn_file_actions_init(&actions);
  posix_spawn_file_actions_adddup2(&actions, out[1], 1);
  posix_spawn_file_actions_adddup2(&actions, err[1], 2);
  posix_spawn_file_actions_addclose(&actions, out[0]);
  posix_spawn_file_actions_addclose(&actions, err[0]);
  std::vector<char*> args;
  for (const std::string& arg : argv) {
    args.push_back(const_cast<char*>(arg.c_str()));
  }
  args.push_back(nullptr);
  pid_t pid = -1;
  const int spawned = posix_spawn(&pid, args[0], &actions, nullptr, args.data(), environ);
  posix_spawn_file_actions_destroy(&actions);
  close(out[1]);
  close(err[1]);
  Finished finished;
  if (spawned == 0) {
    // Outputs are small: reading one after the other cannot deadlock.
    finished.out = Slurp(out[0]);
    finished.err = Slurp(err[0]);
    int status = 0;
    waitpid(pid, &status, 0);
    finished.status = WIFEXITED(status) ? WEXITSTATUS(status) : -1;
  }
  close(out[0]);
  close(err[0]);
  return finished;
}

}  // namespace SimTest
