#include "platform/api/QobUserLib.h"

extern "C" {

int QobUserLib_Init(void) {
  return 1;
}

int QobUserLib_AddQob(const char* /*message*/, const char* const* /*arguments*/, int /*count*/) {
  return 1;
}

void QobUserLib_Close(void) {
}
}
