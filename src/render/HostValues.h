#pragma once
/// Host values for the markup renderer, registered at start-up.
///
/// The renderer sits below the host layer: it knows the host's values only
/// through the providers registered here (value keys such as "hostname" or
/// "memory", and the source of the catalogue's version line). The host
/// layer and the screens register them once at start-up, before the first
/// frame is drawn. A key without a provider yields an empty value.

#include <functional>
#include <string>
#include <string_view>

namespace Tulk {

/// Returns the current value of one host variable.
using ValueProvider = std::function<std::string()>;

/// Fills `line` with the version line ("%s %s (HyKernel %s Build %s)") and
/// returns true, or returns false when the host query failed.
using VersionLineSource = std::function<bool(std::string& line)>;

/// Registers (or replaces) the provider of a value key.
void RegisterValueProvider(std::string key, ValueProvider provider);

/// The provider of a value key, or null when none is registered.
const ValueProvider* FindValueProvider(std::string_view key);

/// Registers the source of catalogue text 2.
void SetVersionLineSource(VersionLineSource source);

/// The registered source of catalogue text 2 (empty when none).
const VersionLineSource& GetVersionLineSource();

}  // namespace Tulk
