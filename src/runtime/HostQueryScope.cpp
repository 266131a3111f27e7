#include "runtime/HostQueryScope.h"

namespace Tulk {
namespace {

thread_local int t_depth = 0;

}  // namespace

HostQueryScope::HostQueryScope() {
  ++t_depth;
}

HostQueryScope::~HostQueryScope() {
  --t_depth;
}

bool HostQueryScope::Open() {
  return t_depth > 0;
}

}  // namespace Tulk
