#include "render/HostValues.h"

#include <map>

namespace Tulk {
namespace {

std::map<std::string, ValueProvider, std::less<>>& Providers() {
  static std::map<std::string, ValueProvider, std::less<>> providers;
  return providers;
}

VersionLineSource& VersionSource() {
  static VersionLineSource source;
  return source;
}

}  // namespace

void RegisterValueProvider(std::string key, ValueProvider provider) {
  Providers()[std::move(key)] = std::move(provider);
}

const ValueProvider* FindValueProvider(std::string_view key) {
  auto found = Providers().find(key);
  return found == Providers().end() ? nullptr : &found->second;
}

void SetVersionLineSource(VersionLineSource source) {
  VersionSource() = std::move(source);
}

const VersionLineSource& GetVersionLineSource() {
  return VersionSource();
}

}  // namespace Tulk
