#include "host/StandardSwitchInfo.h"

#include <utility>

namespace Tulk {

StandardSwitchInfo::StandardSwitchInfo(SwitchSummary summary) : summary_(std::move(summary)) {
}

std::string StandardSwitchInfo::Heading() const {
  return "  {align:padding:20}Switch Name{/align}{align:padding:30}Uplinks{/align}"
         "{align:padding:14}Port Groups{/align}";
}

std::string StandardSwitchInfo::Row() const {
  return "{align:padding:20}" + Shorten(summary_.name, 18) + "{/align}{align:padding:30}" +
         Shorten(JoinNames(summary_.uplinks), 28) + "{/align}{align:padding:14}" +
         std::to_string(summary_.portGroups.size()) + "{/align}";
}

std::string StandardSwitchInfo::DetailsTitle() const {
  return "Standard Switch Details";
}

std::string StandardSwitchInfo::NameLine() const {
  return "Switch Name: " + summary_.name;
}

std::string StandardSwitchInfo::DetailsText() const {
  return FormatSwitchSummary(summary_);
}

}  // namespace Tulk
