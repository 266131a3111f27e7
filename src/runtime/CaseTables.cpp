#include "runtime/CaseTables.h"

#include <ctype.h>

#include <cstdint>

namespace Tulk {
namespace {

const std::int32_t* g_tolower = nullptr;

}  // namespace

void InitCaseTables() {
  g_tolower = *__ctype_tolower_loc();
}

int ToLowerByte(unsigned char c) {
  if (g_tolower == nullptr) {
    InitCaseTables();
  }
  return g_tolower[c];
}

bool EqualsIgnoreCase(std::string_view a, std::string_view b) {
  if (a.size() != b.size()) {
    return false;
  }
  for (std::size_t i = 0; i < a.size(); ++i) {
    if (ToLowerByte(static_cast<unsigned char>(a[i])) !=
        ToLowerByte(static_cast<unsigned char>(b[i]))) {
      return false;
    }
  }
  return true;
}

}  // namespace Tulk
