#include "render/ColorTable.h"

#include "include/ColorNumbers.h"

namespace Tulk {
namespace {

struct NamedColor {
  std::string_view name;
  int number;
};

constexpr NamedColor kColors[] = {
    {"white", kWhite},          {"black", kBlack},   {"dark-grey", kDarkGrey},
    {"light-grey", kLightGrey}, {"yellow", kYellow}, {"red", kRed},
};

}  // namespace

std::optional<int> ColorTable::Find(std::string_view name) const {
  for (const NamedColor& color : kColors) {
    if (color.name == name) {
      return color.number;
    }
  }
  return std::nullopt;
}

}  // namespace Tulk
