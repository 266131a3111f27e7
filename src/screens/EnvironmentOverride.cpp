#include "screens/EnvironmentOverride.h"

#include <cstdlib>

namespace Tulk {

EnvironmentOverride::EnvironmentOverride(std::string name, const std::string& value)
    : name_(std::move(name)) {
  const char* current = std::getenv(name_.c_str());
  saved_ = current != nullptr ? current : "";
  setenv(name_.c_str(), value.c_str(), 1);
}

EnvironmentOverride::~EnvironmentOverride() {
  setenv(name_.c_str(), saved_.c_str(), 1);
}

}  // namespace Tulk
