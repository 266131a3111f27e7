// The attribute filter against a terminal emulator. The input describes a
// well-formed stream of the kind curses writes (ControlStream.h) and where
// it is cut into updates; after every update the filtered stream must show
// exactly what the original shows and leave the terminal's attributes and
// character set the same. The raw input, cut the same way, must pass the
// filter without a fault.

#include <cstddef>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <string>
#include <string_view>
#include <vector>

#include "ControlStream.h"
#include "VirtualTerminal.h"
#include "runtime/AttributeFilter.h"

namespace {

constexpr int kRows = 8;
constexpr int kCols = 24;

[[noreturn]] void Fail(const std::string& what) {
  (void)std::fprintf(stderr, "filtered output differs: %s\n", what.c_str());
  std::abort();
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  if (size < 1) {
    return 0;
  }
  const unsigned cut = data[0];
  const std::string_view input(reinterpret_cast<const char*>(data + 1), size - 1);

  const std::vector<std::string> pieces = TulkTest::ControlStream(input, kRows, kCols);
  Tulk::AttributeFilter filter((cut & 1U) != 0);
  TulkTest::VirtualTerminal original(kRows, kCols);
  TulkTest::VirtualTerminal filtered(kRows, kCols);
  std::size_t at = 0;
  for (unsigned number = 0; at < pieces.size(); ++number) {
    std::string update;
    for (std::size_t count = 1 + ((cut >> 1) + number * 7) % 9; count > 0 && at < pieces.size();
         --count) {
      update += pieces[at++];
    }
    original.Write(update);
    filtered.Write(filter.Filter(update));
    if (std::string difference = original.Difference(filtered); !difference.empty()) {
      Fail(difference);
    }
  }
  original.Write("lqk");
  filtered.Write(filter.Filter("lqk"));
  if (std::string difference = original.Difference(filtered); !difference.empty()) {
    Fail("the character set: " + difference);
  }

  Tulk::AttributeFilter raw(true);
  const std::size_t step = 1 + cut % 17;
  for (std::size_t from = 0; from < input.size(); from += step) {
    (void)raw.Filter(input.substr(from, step));
  }
  return 0;
}
