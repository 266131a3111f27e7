#include "host/InfoType.h"

namespace Tulk {

std::string InfoType::DetailsFooter() const {
  return "{align:right}{color:black}<Enter>{/color} {color:dark-grey}OK{/color}{/align}  ";
}

std::string InfoType::Shorten(const std::string& value, std::size_t limit) {
  if (value.size() <= limit) {
    return value;
  }
  return value.substr(0, limit >= 3 ? limit - 3 : 0) + "...";
}

}  // namespace Tulk
