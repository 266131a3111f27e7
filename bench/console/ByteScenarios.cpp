#include "ByteScenarios.h"

#include <csignal>
#include <cstdio>
#include <cstdlib>

#include "BenchConsole.h"
#include "KeyNames.h"
#include "ScratchFolder.h"

namespace TulkBench {
namespace {

using namespace std::chrono_literals;

constexpr int kRows = 25;
constexpr int kCols = 80;

// One answer of the console: the bytes it sent, the fewest that make the
// same change, and whether the screen changed at all.
struct Change {
  double bytes = 0;
  double fewest = 0;
  bool changed = false;
};

// The picture of the screen. A terminal that cannot hide its cursor shows
// it where drawing ended; its place counts only where the console shows an
// input cursor.
Screen Picture(const TulkTest::TestConsole& console, const TerminalProfile& profile,
               bool inputCursor) {
  Screen screen = Capture(console, kRows, kCols);
  if (!profile.Has("civis") && !inputCursor) {
    screen.cursor.visible = false;
  }
  return screen;
}

// With TULK_BENCH_TRACE set: the bytes of each change, escaped, and the
// cells that changed, on standard error.
void Trace(const std::string& key, const Change& change, const std::string& bytes,
           const Screen& before, const Screen& after) {
  (void)std::fprintf(stderr, "key %s: %g bytes, fewest %g\n  %s\n", key.c_str(), change.bytes,
                     change.fewest, TulkTest::VisibleBytes(bytes).c_str());
  for (int row = 0; row < kRows; ++row) {
    for (int col = 0; col < kCols; ++col) {
      const TulkTest::Cell& a = before.At(row, col);
      const TulkTest::Cell& b = after.At(row, col);
      if (!LooksSame(a, b)) {
        (void)std::fprintf(stderr, "  %d,%d '%s' %d/%d%s -> '%s' %d/%d%s\n", row, col,
                           a.text.c_str(), a.fg, a.bg, a.reverse ? " reverse" : "", b.text.c_str(),
                           b.fg, b.bg, b.reverse ? " reverse" : "");
      }
    }
  }
}

Change Measure(TulkTest::TestConsole& console, const TerminalProfile& profile,
               const std::string& key, bool inputCursor, const char* waitText = nullptr) {
  Settle(console, 200ms);
  const Screen before = Picture(console, profile, inputCursor);
  const std::size_t sent = console.BytesReceived();
  Press(console, key);
  if (waitText != nullptr) {
    console.WaitForText(waitText);
  }
  Settle(console, 200ms);
  const Screen after = Picture(console, profile, inputCursor);
  Change change;
  change.bytes = static_cast<double>(console.BytesReceived() - sent);
  change.fewest = FewestBytes(before, after, profile);
  change.changed = !SameScreen(before, after);
  if (std::getenv("TULK_BENCH_TRACE") != nullptr) {
    Trace(key, change, console.Output().substr(sent), before, after);
  }
  return change;
}

// The fewest bytes of a full repaint of `screen`: clear, then paint.
double FullRepaint(const Screen& screen, const TerminalProfile& profile) {
  Screen blank = BlankScreen(screen.rows, screen.cols);
  blank.cursor.visible = screen.cursor.visible;
  return profile.Cost("clear") + FewestBytes(blank, screen, profile);
}

void Stop(TulkTest::TestConsole& console) {
  console.Signal(SIGTERM);
  console.WaitExit(2s);
}

class TermFigures {
 public:
  explicit TermFigures(const std::string& term) : term_(term) {}

  Figure& Get(const std::string& name, const std::string& unit) {
    for (Figure& figure : figures_) {
      if (figure.name == term_ + "." + name) {
        return figure;
      }
    }
    figures_.push_back(Figure{term_ + "." + name, unit, {}});
    return figures_.back();
  }

  // The bytes, the fewest and their ratio of one change.
  void Add(const std::string& name, double bytes, double fewest) {
    Get(name + "_bytes", "bytes").values.push_back(bytes);
    Get(name + "_fewest", "bytes").values.push_back(fewest);
    if (fewest > 0) {
      Get(name + "_ratio", "x").values.push_back(bytes / fewest);
    }
  }

  std::vector<Figure>& All() { return figures_; }

 private:
  std::string term_;
  std::vector<Figure> figures_;
};

// First screen, typing in the login dialog, login to menu, and moving down
// the menu (only keys that moved the selection are samples).
void MeasureSession(const TerminalProfile& profile, const std::string& program,
                    TermFigures& figures) {
  ScratchFolder pam("tulk-bench-pam");
  TulkTest::TestConsole console(DemoOptions(profile.term, pam.Path().string(), program));
  console.Start();
  if (!console.WaitForText("Customize System/View Logs")) {
    return;
  }
  Settle(console, 300ms);
  Screen start = BlankScreen(kRows, kCols);
  start.cursor.visible = false;
  const Screen first = Picture(console, profile, false);
  figures.Add("first_screen", static_cast<double>(console.BytesReceived()),
              FewestBytes(start, first, profile) + profile.setup);
  if (std::getenv("TULK_BENCH_TRACE") != nullptr) {
    const Change change{static_cast<double>(console.BytesReceived()),
                        static_cast<double>(FewestBytes(start, first, profile) + profile.setup),
                        true};
    Trace("(first screen)", change, console.Output(), start, first);
  }

  Settle(console, 200ms);
  console.Key("F2");
  if (!console.WaitForText("Authentication Required")) {
    return;
  }
  Change typed = Measure(console, profile, "a", true);
  figures.Add("typed_char_first", typed.bytes, typed.fewest);
  double bytes = 0;
  double fewest = 0;
  const std::string next = "bcdef";
  for (char key : next) {
    Change change = Measure(console, profile, std::string(1, key), true);
    bytes += change.bytes;
    fewest += change.fewest;
  }
  figures.Add("typed_char_next", bytes / static_cast<double>(next.size()),
              fewest / static_cast<double>(next.size()));
  console.Key("Backspace", static_cast<int>(next.size()) + 1);
  console.Type("root");
  console.Key("Down");
  console.Type("tulk");
  Change login = Measure(console, profile, "Enter", false, "System Customization");
  figures.Add("login_to_menu", login.bytes, login.fewest);

  bytes = 0;
  fewest = 0;
  int moves = 0;
  for (int key = 0; key < 16; ++key) {
    Change change = Measure(console, profile, "Down", false);
    if (change.changed) {
      bytes += change.bytes;
      fewest += change.fewest;
      ++moves;
    }
  }
  if (moves > 0) {
    figures.Add("menu_down", bytes / moves, fewest / moves);
  }
  Stop(console);
}

// A key that ends the dimmed state, on the welcome screen and in the menu.
// The console's clock runs fast so that the minute passes in a second or
// three.
void MeasureDimming(const TerminalProfile& profile, const std::string& program,
                    TermFigures& figures) {
  ScratchFolder pam("tulk-bench-pam");
  {
    TulkTest::TestConsole console(DemoOptions(profile.term, pam.Path().string(), program, 60));
    console.Start();
    if (console.WaitForText("Customize System/View Logs")) {
      Settle(console, 200ms);
      const double firstScreen = static_cast<double>(console.BytesReceived());
      if (WaitForChange(console, Capture(console, kRows, kCols), 5s)) {
        Change wake = Measure(console, profile, "x", false);
        const Screen after = Picture(console, profile, false);
        figures.Add("dim_wake_welcome", wake.bytes, FullRepaint(after, profile));
        figures.Get("dim_wake_welcome_vs_first_screen", "x")
            .values.push_back(wake.bytes / firstScreen);
      }
    }
    Stop(console);
  }
  {
    TulkTest::TestConsole console(DemoOptions(profile.term, pam.Path().string(), program, 20));
    console.Start();
    if (LogIn(console)) {
      Settle(console, 200ms);
      if (WaitForChange(console, Capture(console, kRows, kCols), 10s)) {
        Change wake = Measure(console, profile, "Down", false);
        const Screen after = Picture(console, profile, false);
        figures.Add("dim_wake_menu", wake.bytes, FullRepaint(after, profile));
      }
    }
    Stop(console);
  }
}

}  // namespace

std::vector<Figure> RunByteScenarios(const BenchSettings& settings) {
  std::vector<Figure> all;
  for (const char* term : {"xterm-256color", "vt102"}) {
    const TerminalProfile profile = ReadTerminalProfile(term);
    TermFigures figures(term);
    for (int run = 0; run < settings.byteRuns; ++run) {
      MeasureSession(profile, settings.program, figures);
      MeasureDimming(profile, settings.program, figures);
    }
    all.insert(all.end(), figures.All().begin(), figures.All().end());
  }
  return all;
}

}  // namespace TulkBench
