#include "platform/tool/Installer.h"

#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstdlib>
#include <cstring>
#include <fstream>

namespace Sim::Tools {
namespace {

// Tools that are run as programs, by the folder they live in.
constexpr const char* kLinkedTools[] = {
    "bin/tavcli",    "sbin/tavcli",       "sbin/localcli",
    "bin/osk-cmd",   "bin/powerOffVms",   "sbin/powerOffVms",
    "bin/hykping",   "sbin/hykbacktrace", "sbin/firmwareConfig.py",
    "sbin/poweroff", "sbin/reboot",       "bin/poweroff",
    "bin/reboot"};

// Tools that callers may also run as "sh <file>", so they are scripts.
constexpr const char* kScriptTools[] = {"etc/init.d/TavShell", "etc/init.d/SSH",
                                        "etc/init.d/zyo-opsagent", "sbin/services.sh",
                                        "sbin/backup.sh"};

// Real programs the console runs or shell lines need.
constexpr const char* kRealPrograms[] = {
    "sh",      "less",     "openssl", "awk",   "cat",    "echo", "grep",  "sed",    "head",
    "tail",    "cut",      "tr",      "sleep", "test",   "true", "false", "ls",     "rm",
    "cp",      "mv",       "mkdir",   "env",   "printf", "wc",   "sort",  "uname",  "date",
    "dirname", "basename", "id",      "kill",  "stty",   "tput", "clear", "getent", "touch"};

constexpr const char* kFolders[] = {"bin",
                                    "sbin",
                                    "etc/init.d",
                                    "etc/ssh",
                                    "etc/brimlo/ssl",
                                    "var/run/brimlo",
                                    "var/log/tulk-sim",
                                    "var/lib/tulk-sim",
                                    "tmp",
                                    "usr/lib/brimlo/openssh/bin"};

std::string MakeFolders(const std::string& path) {
  std::size_t at = 1;
  while (at != std::string::npos) {
    at = path.find('/', at + 1);
    const std::string prefix = path.substr(0, at);
    if (mkdir(prefix.c_str(), 0755) != 0 && errno != EEXIST) {
      return "cannot create " + prefix + ": " + std::strerror(errno);
    }
  }
  return "";
}

std::string Link(const std::string& target, const std::string& path) {
  unlink(path.c_str());
  if (symlink(target.c_str(), path.c_str()) != 0) {
    return "cannot link " + path + ": " + std::strerror(errno);
  }
  return "";
}

std::string FindProgram(const std::string& name) {
  for (const char* folder : {"/usr/local/bin", "/usr/bin", "/bin", "/usr/sbin", "/sbin"}) {
    std::string candidate = std::string(folder) + "/" + name;
    if (access(candidate.c_str(), X_OK) == 0) {
      return candidate;
    }
  }
  return "";
}

std::string Quoted(const std::string& text) {
  std::string quoted = "'";
  for (char c : text) {
    quoted += c == '\'' ? std::string("'\\''") : std::string(1, c);
  }
  return quoted + "'";
}

}  // namespace

std::string InstallRoot(const std::string& rootText, const std::string& tool) {
  std::string root = rootText;
  while (root.size() > 1 && root.back() == '/') {
    root.pop_back();
  }
  if (root.empty() || root == "/") {
    return "refusing to install into the real root";
  }
  // Whatever path leads to "/" ("/tmp/..", a link to it) is refused too;
  // the root is created first so that a new one can be resolved.
  if (std::string error = MakeFolders(root); !error.empty()) {
    return error;
  }
  char* resolved = realpath(root.c_str(), nullptr);
  const std::string resolvedRoot = resolved != nullptr ? resolved : "";
  std::free(resolved);
  if (resolvedRoot.empty() || resolvedRoot == "/") {
    return "refusing to install into the real root";
  }
  for (const char* folder : kFolders) {
    if (std::string error = MakeFolders(root + "/" + folder); !error.empty()) {
      return error;
    }
  }
  for (const char* path : kLinkedTools) {
    if (std::string error = Link(tool, root + "/" + path); !error.empty()) {
      return error;
    }
  }
  for (const char* path : kScriptTools) {
    const std::string file = root + "/" + path;
    const std::string name = file.substr(file.rfind('/') + 1);
    unlink(file.c_str());
    std::ofstream script(file);
    script << "#!/bin/sh\nexec " << Quoted(tool) << " --as " << name << " \"$@\"\n";
    script.close();
    if (!script || chmod(file.c_str(), 0755) != 0) {
      return "cannot write " + file;
    }
  }
  for (const char* name : kRealPrograms) {
    const std::string real = FindProgram(name);
    if (!real.empty()) {
      if (std::string error = Link(real, root + "/bin/" + name); !error.empty()) {
        return error;
      }
    }
  }
  if (const std::string keygen = FindProgram("ssh-keygen"); !keygen.empty()) {
    if (std::string error = Link(keygen, root + "/usr/lib/brimlo/openssh/bin/ssh-keygen");
        !error.empty()) {
      return error;
    }
  }
  return "";
}

}  // namespace Sim::Tools
