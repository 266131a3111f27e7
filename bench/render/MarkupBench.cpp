// Layout and paint of marked-up text: a full 80 x 25 text area, painted
// into a curses window of a terminal that writes to /dev/null.

#include <benchmark/benchmark.h>
#include <curses.h>

#include <clocale>
#include <cstdio>
#include <string>

#include "include/ColorNumbers.h"
#include "render/ColorTable.h"
#include "render/MarkupLayout.h"
#include "render/MarkupPainter.h"
#include "render/StringFactory.h"
#include "render/VariableTable.h"
#include "runtime/Palette.h"
#include "toolkit/TextArea.h"
#include "toolkit/Window.h"

namespace {

// About 25 rows of 80 columns: catalogue paragraphs with colour tags, a
// padded table, variables and right-aligned footers.
std::string FullAreaText() {
  Tulk::StringFactory& texts = *Tulk::GetStringFactory("en_US");
  std::string text = "{color:white}Configure Management Network{/color}\n\n";
  text += "{color:light-grey}" + std::string(texts.GetString(26)) + "{/color}\n\n";
  text +=
      "  {align:padding:8}Name{/align}{align:padding:19}MAC Address{/align}"
      "{align:padding:10}Portset{/align}{align:padding:20}Portgroup{/align}\n";
  for (int i = 0; i < 3; ++i) {
    text +=
        "  {align:padding:8}hyk" + std::to_string(i) +
        "{/align}{align:padding:19}02:00:00:6a:bc:0" + std::to_string(i) +
        "{/align}{align:padding:10}vSwitch0{/align}{align:padding:20}Management Network{/align}\n";
  }
  text += "\nHost {hostname} with {memory}: " + std::string(texts.GetString(243)) + "\n\n";
  text += std::string(texts.GetString(171)) + "\n";
  text +=
      "{align:center}{color:red}Warning!{/color}{/align}\n"
      "{align:right}{color:black}<Enter>{/color} {color:dark-grey}OK{/color}  "
      "{color:black}<Esc>{/color} {color:dark-grey}Cancel{/color}{/align}";
  return text;
}

class Terminal {
 public:
  Terminal() {
    std::setlocale(LC_ALL, "C.UTF-8");
    out_ = std::fopen("/dev/null", "w");
    in_ = std::fopen("/dev/null", "r");
    screen_ = newterm("xterm-256color", out_, in_);
    resizeterm(25, 80);
    start_color();
    Tulk::InitColors();
  }
  ~Terminal() {
    endwin();
    delscreen(screen_);
    std::fclose(out_);
    std::fclose(in_);
  }
  Terminal(const Terminal&) = delete;
  Terminal& operator=(const Terminal&) = delete;

 private:
  FILE* out_;
  FILE* in_;
  SCREEN* screen_;
};

void BM_LayoutAndPaintFullArea(benchmark::State& state) {
  Terminal terminal;
  WINDOW* window = newwin(25, 80, 0, 0);
  const std::string text = FullAreaText();
  Tulk::ColorTable colors;
  Tulk::VariableTable table;
  Tulk::VariableLookup variables = [&](std::string_view name, std::string& value) {
    return table.Lookup(name, value);
  };
  Tulk::PaintStyle style{Tulk::kDarkGrey, Tulk::kLightGrey, true};
  for (auto _ : state) {
    werase(window);
    std::string laidOut = Tulk::LayOutMarkup(text, 80, variables);
    Tulk::PaintMarkup(window, laidOut, style, colors);
    benchmark::DoNotOptimize(laidOut.data());
  }
  state.SetBytesProcessed(static_cast<std::int64_t>(state.iterations() * text.size()));
  delwin(window);
}
BENCHMARK(BM_LayoutAndPaintFullArea);

void BM_LayoutOnly(benchmark::State& state) {
  const std::string text = FullAreaText();
  for (auto _ : state) {
    std::string laidOut = Tulk::LayOutMarkup(text, 80, {});
    benchmark::DoNotOptimize(laidOut.data());
  }
}
BENCHMARK(BM_LayoutOnly);

// The whole text area operation, including the copy to the virtual screen
// and the terminal update (which sends nothing when the text is the same).
void BM_TextAreaSetTextUnchanged(benchmark::State& state) {
  Terminal terminal;
  Tulk::Window frame(0, 0, 80, 25, Tulk::kDarkGrey, Tulk::kWhite);
  auto* area = new Tulk::TextArea(&frame, 0, 0, 80, 25, -1, Tulk::kLightGrey);
  const std::string text = FullAreaText();
  for (auto _ : state) {
    area->SetText(text);
  }
}
BENCHMARK(BM_TextAreaSetTextUnchanged);

}  // namespace
