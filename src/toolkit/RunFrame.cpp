#include "toolkit/RunFrame.h"

#include "include/ProcessFlags.h"
#include "runtime/KeyInput.h"
#include "toolkit/Frame.h"

namespace Tulk {
int RunFrame(Frame* frame) {
  {
    Window::DrawBatch batch;
    currentWindow = nullptr;
    if (Frame* owner = frame->Owner(); owner != nullptr) {
      owner->Redraw(false);
      owner->Update();
    }
    frame->Redraw(true);
  }
  currentWindow = frame;
  int result;
  try {
    result = frame->Run();
  } catch (const TulkTimeout&) {
    currentWindow = nullptr;
    throw;
  }
  if (Frame* owner = frame->Owner(); owner != nullptr) {
    owner->Redraw(true);
    owner->Update();
    currentWindow = owner;
  } else {
    currentWindow = nullptr;
  }
  return result;
}

}  // namespace Tulk
