#pragma once
/// The host variables markup may name ("{hostname}", "{memory}") and their
/// values.
///
/// The names are fixed: "ip", "ssl-thumbprint-sha-1",
/// "ssl-thumbprint-sha-256", "ssl-thumbprint-sha-512",
/// "ssh-dsa-fingerprint", "ssh-rsa-fingerprint", "hostname", "tavproduct",
/// "tavversion", "memory", "servicetag", "assettag", "BIOSversion",
/// "BMCversion", "CPLDversion", "PLSAversion". Each value comes from the
/// provider registered for the name in render/HostValues.h, asked at every
/// lookup so that a text shows the host's current value. A name whose
/// provider is not registered (yet) stands for the empty value: the tag
/// disappears and takes no room. A key registered under any other name is
/// not a variable here; such a tag stays an unknown tag.

#include <string>
#include <string_view>

namespace Tulk {

class VariableTable {
 public:
  /// Whether `name` is one of the variable names.
  static bool IsVariable(std::string_view name);

  /// When `name` is a variable, fills `value` with its current value (empty
  /// without a provider) and returns true; otherwise returns false.
  bool Lookup(std::string_view name, std::string& value) const;
};

}  // namespace Tulk
