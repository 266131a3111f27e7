#include "TestFolder.h"

#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <cstdlib>
#include <cstring>
#include <fstream>
#include <sstream>
#include <stdexcept>

extern char** environ;

namespace TulkTest {
namespace {

std::filesystem::path MakeFolder() {
  std::string pattern = (std::filesystem::temp_directory_path() / "tulk-test-XXXXXX").string();
  if (mkdtemp(pattern.data()) == nullptr) {
    throw std::runtime_error("mkdtemp failed: " + std::string(std::strerror(errno)));
  }
  return pattern;
}

void RunToCompletion(const std::vector<std::string>& argv) {
  pid_t pid = fork();
  if (pid == 0) {
    std::vector<char*> args;
    for (const std::string& arg : argv) {
      args.push_back(const_cast<char*>(arg.c_str()));
    }
    args.push_back(nullptr);
    execv(args[0], args.data());
    _exit(127);
  }
  int status = 0;
  while (pid > 0 && waitpid(pid, &status, 0) < 0 && errno == EINTR) {
  }
  if (pid < 0 || !WIFEXITED(status) || WEXITSTATUS(status) != 0) {
    throw std::runtime_error("failed to run " + argv[0]);
  }
}

}  // namespace

TestFolder::TestFolder(const Options& options, const std::string& hostTool)
    : folder_(MakeFolder()) {
  for (const char* sub : {"var/run", "var/log", "etc", "tmp"}) {
    std::filesystem::create_directories(Root() / sub);
  }
  if (options.hostTools && !hostTool.empty() && std::filesystem::exists(hostTool)) {
    RunToCompletion({hostTool, "--install", Root().string()});
  }
  if (options.hostState) {
    std::ofstream(HostStatePath()) << *options.hostState;
  }
  if (!options.pamUsers.empty()) {
    WritePamServices(options);
  }
  if (options.prepareRoot) {
    options.prepareRoot(Root());
  }
}

TestFolder::~TestFolder() {
  if (std::getenv("TULK_KEEP_TEST_ROOT") == nullptr) {
    std::error_code ignored;
    std::filesystem::remove_all(folder_, ignored);
  }
}

std::vector<std::string> TestFolder::Environment(
    const Options& options, const std::map<std::string, std::string>& harness) const {
  std::map<std::string, std::string> env;
  for (char** entry = environ; *entry != nullptr; ++entry) {
    std::string text = *entry;
    auto equals = text.find('=');
    if (equals != std::string::npos) {
      env[text.substr(0, equals)] = text.substr(equals + 1);
    }
  }
  for (const char* name :
       {"TULK_ROOT", "TULK_HOST_STATE", "TULK_LOG_FILE", "TULK_TIME_SCALE", "TULK_READY_FD",
        "SSH_CLIENT", "TERMINFO", "TULK_SIM_DEMO_FILE", "LESSSECURE", "ESCDELAY"}) {
    env.erase(name);
  }
  env["TULK_ROOT"] = Root().string();
  env["TULK_LOG_FILE"] = LogPath().string();
  env["TMPDIR"] = folder_.string();
  if (options.term.empty()) {
    env.erase("TERM");
  } else {
    env["TERM"] = options.term;
  }
  if (options.hostState) {
    env["TULK_HOST_STATE"] = HostStatePath().string();
  }
  if (options.timeScale > 0) {
    std::ostringstream scale;
    scale << options.timeScale;
    env["TULK_TIME_SCALE"] = scale.str();
  }
  if (!options.pamUsers.empty()) {
    env["LD_PRELOAD"] = TULK_TEST_PAM_WRAPPER_LIBRARY;
    env["PAM_WRAPPER"] = "1";
    env["PAM_WRAPPER_SERVICE_DIR"] = (folder_ / "pam").string();
#ifdef TULK_TEST_SANITIZED
    // The sanitizer runtime cannot come first when a library is preloaded.
    // pam_wrapper loads libpam with RTLD_DEEPBIND, which the sanitizer
    // runtime refuses; this release reads the switch under the name of its
    // sibling wrapper, so both names are set.
    env["PAM_WRAPPER_DISABLE_DEEPBIND"] = "1";
    env["UID_WRAPPER_DISABLE_DEEPBIND"] = "1";
    std::string asan = env.count("ASAN_OPTIONS") != 0 ? env["ASAN_OPTIONS"] + ":" : "";
    env["ASAN_OPTIONS"] = asan + "verify_asan_link_order=0";
#endif
  }
  for (const auto& [name, value] : harness) {
    env[name] = value;
  }
  for (const auto& [name, value] : options.env) {
    env[name] = value;
  }
  for (const std::string& name : options.unsetEnv) {
    env.erase(name);
  }
  std::vector<std::string> result;
  for (const auto& [name, value] : env) {
    result.push_back(name + "=" + value);
  }
  return result;
}

void TestFolder::WritePamServices(const Options& options) const {
  std::filesystem::path services = folder_ / "pam";
  std::filesystem::create_directories(services);
  {
    std::ofstream passdb(services / "passdb");
    for (const auto& [user, password] : options.pamUsers) {
      passdb << user << ":" << password << ":tulk\n";
    }
  }
  {
    std::ofstream policy(services / "policy");
    for (const std::string& line : options.pamPolicy) {
      policy << line << "\n";
    }
  }
  const std::string matrix =
      std::string(TULK_TEST_PAM_MATRIX_MODULE) + " passdb=" + (services / "passdb").string();
  const std::string policy =
      std::string(TULK_TEST_PAM_POLICY_MODULE) + " policy=" + (services / "policy").string();
  for (const char* service : {"tulk", "other"}) {
    std::ofstream file(services / service);
    file << "auth     required  " << matrix << "\n"
         << "account  requisite " << policy << "\n"
         << "account  required  " << matrix << "\n"
         << "password requisite " << policy << "\n"
         << "password required  " << matrix << "\n"
         << "session  required  " << matrix << "\n";
  }
}

}  // namespace TulkTest
