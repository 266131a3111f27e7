#include "runtime/HostPath.h"

#include <cstdlib>

namespace Tulk {
namespace {

std::string ReadRoot() {
  const char* value = std::getenv("TULK_ROOT");
  std::string root = (value == nullptr || *value == '\0') ? "/" : value;
  while (root.size() > 1 && root.back() == '/') {
    root.pop_back();
  }
  return root;
}

}  // namespace

const std::string& HostRoot() {
  static const std::string root = ReadRoot();
  return root;
}

bool HostRootConfined() {
  return HostRoot() != "/";
}

std::string HostPath(std::string_view path) {
  if (!HostRootConfined()) {
    return std::string(path);
  }
  std::string result = HostRoot();
  if (path.empty() || path.front() != '/') {
    result += '/';
  }
  result += path;
  return result;
}

std::string ProgramSearchPath() {
  if (!HostRootConfined()) {
    const char* path = std::getenv("PATH");
    return path != nullptr ? path : "/bin:/sbin:/usr/bin:/usr/sbin";
  }
  return HostRoot() + "/bin:" + HostRoot() + "/sbin";
}

}  // namespace Tulk
