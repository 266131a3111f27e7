#pragma once
// The toolkit demo program (ToolkitDemo.cpp) showing one of its scenes.

#include "Options.h"

namespace ToolkitTest {

/// Options that run the toolkit demo with `scene` (TULK_DEMO_SCENE).
inline TulkTest::Options Scene(const char* scene) {
  TulkTest::Options options = TulkTest::TestProgram(TULK_TEST_TOOLKIT_DEMO_BINARY);
  options.env["TULK_DEMO_SCENE"] = scene;
  return options;
}

}  // namespace ToolkitTest
