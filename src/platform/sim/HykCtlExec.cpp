#include "platform/api/HykCtlExec.h"

#include <fcntl.h>
#include <spawn.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <csignal>
#include <cstdlib>
#include <cstring>
#include <thread>
#include <vector>

#include "platform/sim/SimHost.h"
#include "platform/sim/SimState.h"

extern char** environ;

namespace HykCtl::Util {
namespace {

constexpr std::size_t kCaptureLimit = std::size_t{64} * 1024;

bool IsExecutable(const std::string& path) {
  struct stat info {};
  return stat(path.c_str(), &info) == 0 && S_ISREG(info.st_mode) && access(path.c_str(), X_OK) == 0;
}

bool Confined() {
  const char* root = std::getenv("TULK_ROOT");
  return root != nullptr && *root != '\0' && std::strcmp(root, "/") != 0;
}

std::string SearchPath() {
  if (Confined()) {
    return Sim::RootPath("/bin") + ":" + Sim::RootPath("/sbin");
  }
  const char* path = std::getenv("PATH");
  return path != nullptr ? path : "/bin:/sbin:/usr/bin:/usr/sbin";
}

std::string Resolve(const std::string& program, const std::string& searchPath) {
  if (program.find('/') != std::string::npos) {
    return program;
  }
  std::size_t start = 0;
  while (start <= searchPath.size()) {
    std::size_t end = searchPath.find(':', start);
    if (end == std::string::npos) {
      end = searchPath.size();
    }
    std::string candidate = searchPath.substr(start, end - start) + "/" + program;
    if (end > start && IsExecutable(candidate)) {
      return candidate;
    }
    start = end + 1;
  }
  return "";
}

std::vector<std::string> Words(const std::string& line) {
  std::vector<std::string> words;
  std::string word;
  for (char c : line) {
    if (c == ' ' || c == '\t') {
      if (!word.empty()) {
        words.push_back(word);
      }
      word.clear();
    } else {
      word += c;
    }
  }
  if (!word.empty()) {
    words.push_back(word);
  }
  return words;
}

// Releases the spawn objects and descriptors on every path.
struct SpawnSetup {
  posix_spawn_file_actions_t actions{};
  posix_spawnattr_t attributes{};
  int pipe[2] = {-1, -1};
  SpawnSetup() {
    posix_spawn_file_actions_init(&actions);
    posix_spawnattr_init(&attributes);
  }
  ~SpawnSetup() {
    posix_spawn_file_actions_destroy(&actions);
    posix_spawnattr_destroy(&attributes);
    for (int fd : pipe) {
      if (fd >= 0) {
        close(fd);
      }
    }
  }
  SpawnSetup(const SpawnSetup&) = delete;
  SpawnSetup& operator=(const SpawnSetup&) = delete;
};

}  // namespace

ExecResult HykCtl_Exec(const std::string& commandLine, bool captureOutput, bool waitForExit,
                       bool useShell) {
  Sim::Query("HykCtl::Util::HykCtl_Exec");
  const std::string searchPath = SearchPath();
  std::vector<std::string> arguments;
  if (useShell) {
    const std::string rootShell = Sim::RootPath("/bin/sh");
    arguments = {Confined() && IsExecutable(rootShell) ? rootShell : "/bin/sh", "-c", commandLine};
  } else {
    arguments = Words(commandLine);
  }
  if (arguments.empty()) {
    Sim::Fail("Cannot run an empty command line");
  }
  const std::string program = Resolve(arguments.front(), searchPath);
  if (program.empty()) {
    Sim::Fail("Cannot run " + arguments.front() + ": " + std::strerror(ENOENT));
  }

  std::vector<std::string> environment;
  for (char** entry = environ; *entry != nullptr; ++entry) {
    if (std::strncmp(*entry, "PATH=", 5) != 0) {
      environment.emplace_back(*entry);
    }
  }
  environment.push_back("PATH=" + searchPath);
  std::vector<char*> argv;
  argv.reserve(arguments.size() + 1);
  for (std::string& argument : arguments) {
    argv.push_back(argument.data());
  }
  argv.push_back(nullptr);
  std::vector<char*> envp;
  envp.reserve(environment.size() + 1);
  for (std::string& entry : environment) {
    envp.push_back(entry.data());
  }
  envp.push_back(nullptr);

  const bool capture = captureOutput && waitForExit;
  SpawnSetup setup;
  if (capture && pipe2(setup.pipe, O_CLOEXEC) != 0) {
    Sim::Fail("Cannot run " + program + ": " + std::strerror(errno));
  }
  posix_spawn_file_actions_addopen(&setup.actions, 0, "/dev/null", O_RDONLY, 0);
  if (capture) {
    posix_spawn_file_actions_adddup2(&setup.actions, setup.pipe[1], 1);
    posix_spawn_file_actions_adddup2(&setup.actions, setup.pipe[1], 2);
  } else {
    posix_spawn_file_actions_addopen(&setup.actions, 1, "/dev/null", O_WRONLY, 0);
    posix_spawn_file_actions_adddup2(&setup.actions, 1, 2);
  }
  posix_spawn_file_actions_addclosefrom_np(&setup.actions, 3);
  sigset_t none;
  sigemptyset(&none);
  sigset_t defaults;
  sigfillset(&defaults);
  posix_spawnattr_setsigmask(&setup.attributes, &none);
  posix_spawnattr_setsigdefault(&setup.attributes, &defaults);
  posix_spawnattr_setflags(&setup.attributes, POSIX_SPAWN_SETSIGMASK | POSIX_SPAWN_SETSIGDEF);

  pid_t pid = -1;
  const int error = posix_spawn(&pid, program.c_str(), &setup.actions, &setup.attributes,
                                argv.data(), envp.data());
  if (error != 0) {
    Sim::Fail("Cannot run " + program + ": " + std::strerror(error));
  }

  ExecResult result;
  if (!waitForExit) {
    std::thread([pid] {
      int ignored = 0;
      while (waitpid(pid, &ignored, 0) < 0 && errno == EINTR) {
      }
    }).detach();
    return result;
  }
  if (capture) {
    close(setup.pipe[1]);
    setup.pipe[1] = -1;
    char buffer[4096];
    for (;;) {
      const ssize_t got = read(setup.pipe[0], buffer, sizeof buffer);
      if (got < 0 && errno == EINTR) {
        continue;
      }
      if (got <= 0) {
        break;
      }
      const std::size_t room = kCaptureLimit - result.output.size();
      result.output.append(buffer, std::min(room, static_cast<std::size_t>(got)));
    }
  }
  int status = 0;
  while (waitpid(pid, &status, 0) < 0) {
    if (errno != EINTR) {
      Sim::Fail("Cannot wait for " + program + ": " + std::strerror(errno));
    }
  }
  result.status = WIFEXITED(status) ? WEXITSTATUS(status) : -1;
  return result;
}

}  // namespace HykCtl::Util
