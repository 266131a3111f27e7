#pragma once
/// A standard switch as a list entry: name, uplinks and portgroups, with
/// its summary as details.

#include <string>

#include "host/InfoType.h"
#include "host/SwitchSummary.h"

namespace Tulk {

class StandardSwitchInfo : public InfoType {
 public:
  /// An entry for the switch `summary` describes.
  explicit StandardSwitchInfo(SwitchSummary summary);

  /// The switch as the scan saw it.
  const SwitchSummary& Summary() const { return summary_; }
  const std::string& Name() const { return summary_.name; }

  /// "Switch Name", "Uplinks", "Port Groups" in fields of 20, 30 and 14
  /// columns after two blanks.
  std::string Heading() const override;
  /// The name (shortened beyond 18 bytes), the uplinks joined by commas
  /// (beyond 28 bytes) and the number of portgroups.
  std::string Row() const override;
  /// "Standard Switch Details".
  std::string DetailsTitle() const override;
  /// "Switch Name: " and the name.
  std::string NameLine() const override;
  /// FormatSwitchSummary() of the switch.
  std::string DetailsText() const override;

 private:
  SwitchSummary summary_;
};

}  // namespace Tulk
