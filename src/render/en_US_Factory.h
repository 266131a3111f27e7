#pragma once
/// The US English catalogue: a fixed table of texts 0 to 291.
///
/// Text 2 is the version line under the welcome screen's title, built at
/// each lookup from the source registered with SetVersionLineSource()
/// (render/HostValues.h). When the source reports a failed host query, or
/// no source is registered, the last good line is returned: the empty text
/// until one lookup succeeded. Every line ever returned stays valid for the
/// whole run.

#include <cstdint>

#include "render/StringFactory.h"

namespace Tulk {

class en_US_Factory final : public StringFactory {
 public:
  /// Use GetStringFactory("en_US"); there is one catalogue per process.
  en_US_Factory() = default;
  ~en_US_Factory() = default;
  en_US_Factory(const en_US_Factory&) = delete;
  en_US_Factory& operator=(const en_US_Factory&) = delete;

  /// The highest text number; higher numbers give the empty text.
  static constexpr std::uint32_t kLastId = 291;

  /// Text `id`; 2 is the version line, above kLastId the empty text.
  const char* GetString(std::uint32_t id) override;

 private:
  const char* VersionLine();
};

}  // namespace Tulk
