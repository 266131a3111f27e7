#pragma once
/// Sets an environment variable for a while and puts the old value back.

#include <string>

namespace Tulk {

class EnvironmentOverride {
 public:
  /// Remembers the current value of `name` (the empty text when it is
  /// unset) and sets it to `value`.
  EnvironmentOverride(std::string name, const std::string& value);
  /// Sets the variable back to the remembered value. A variable that was
  /// unset comes back set and empty: it is deliberately not removed.
  ~EnvironmentOverride();
  EnvironmentOverride(const EnvironmentOverride&) = delete;
  EnvironmentOverride& operator=(const EnvironmentOverride&) = delete;

 private:
  std::string name_;
  std::string saved_;
};

}  // namespace Tulk
