#include "runtime/ChildProcess.h"

#include <algorithm>
#include <string_view>

#include "runtime/HostPath.h"

extern char** environ;

namespace Tulk {
namespace {

std::string_view VariableName(std::string_view entry) {
  return entry.substr(0, entry.find('='));
}

bool HasVariable(const std::vector<std::string>& environment, std::string_view name) {
  return std::any_of(environment.begin(), environment.end(),
                     [name](const std::string& entry) { return VariableName(entry) == name; });
}

}  // namespace

std::vector<std::string> ChildEnvironment(const std::vector<std::string>* given) {
  std::vector<std::string> environment;
  if (given != nullptr) {
    environment = *given;
  } else {
    for (char** entry = environ; entry != nullptr && *entry != nullptr; ++entry) {
      environment.emplace_back(*entry);
    }
  }
  if (!HostRootConfined()) {
    return environment;
  }
  if (given != nullptr) {
    for (char** entry = environ; entry != nullptr && *entry != nullptr; ++entry) {
      std::string_view name = VariableName(*entry);
      if (name.starts_with("TULK_") && !HasVariable(environment, name)) {
        environment.emplace_back(*entry);
      }
    }
  }
  std::erase_if(environment,
                [](const std::string& entry) { return VariableName(entry) == "PATH"; });
  environment.push_back("PATH=" + ProgramSearchPath());
  return environment;
}

std::vector<char*> ExecVector(std::vector<std::string>& strings) {
  std::vector<char*> pointers;
  pointers.reserve(strings.size() + 1);
  for (std::string& text : strings) {
    pointers.push_back(text.data());
  }
  pointers.push_back(nullptr);
  return pointers;
}

}  // namespace Tulk
