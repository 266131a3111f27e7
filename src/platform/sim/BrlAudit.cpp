#include "platform/api/BrlAudit.h"

extern "C" {

int BrlAudit_LogList(const char* /*eventName*/, const char* /*component*/, const char* /*user*/,
                     BrlAuditResult /*result*/, const BrlAuditPair* /*pairs*/,
                     std::size_t /*pairCount*/) {
  return 1;
}
}
