#pragma once
/// What the key loop needs of the frame that waits for a key.
///
/// The toolkit's Frame implements this interface; the runtime sits below
/// the toolkit and knows frames only through it.

namespace Tulk {

class RuntimeFrame {
 public:
  virtual ~RuntimeFrame() = default;
  /// Draws the frame active (normal colours) or inactive (dimmed), then
  /// refreshes it on the terminal.
  virtual void Redraw(bool active) = 0;
  /// Reloads what the frame shows about the host (SIGUSR1). Frames that
  /// show no host state keep this default, which does nothing.
  virtual void ReloadHostInfo() {}

 protected:
  RuntimeFrame() = default;
  RuntimeFrame(const RuntimeFrame&) = default;
  RuntimeFrame& operator=(const RuntimeFrame&) = default;
};

}  // namespace Tulk
