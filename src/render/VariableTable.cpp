#include "render/VariableTable.h"

#include "render/HostValues.h"

namespace Tulk {
namespace {

constexpr std::string_view kNames[] = {
    "ip",
    "ssl-thumbprint-sha-1",
    "ssl-thumbprint-sha-256",
    "ssl-thumbprint-sha-512",
    "ssh-dsa-fingerprint",
    "ssh-rsa-fingerprint",
    "hostname",
    "tavproduct",
    "tavversion",
    "memory",
    "servicetag",
    "assettag",
    "BIOSversion",
    "BMCversion",
    "CPLDversion",
    "PLSAversion",
};

}  // namespace

bool VariableTable::IsVariable(std::string_view name) {
  for (std::string_view known : kNames) {
    if (known == name) {
      return true;
    }
  }
  return false;
}

bool VariableTable::Lookup(std::string_view name, std::string& value) const {
  if (!IsVariable(name)) {
    return false;
  }
  value.clear();
  if (const ValueProvider* provider = FindValueProvider(name); provider != nullptr && *provider) {
    value = (*provider)();
  }
  return true;
}

}  // namespace Tulk
