#pragma once
/// Well-formed terminal output built from arbitrary bytes: text, line
/// characters, attribute controls (SGR with known and unknown parameters,
/// curses' combined reset with a designation, G0 designations, shifts),
/// cursor moves, erases, line feeds, private modes, saved and restored
/// cursors, control strings, repeats and resets. Each byte of `choices`
/// picks the next control (and later bytes its parameters), so a fuzzer's
/// input and a seeded random string both become output of the kind curses
/// writes and worse. Every control is complete, so that terminals that
/// differ in how they treat malformed bytes cannot disagree about it.

#include <string>
#include <string_view>
#include <vector>

namespace TulkTest {

/// The output `choices` describes, for a terminal of `rows` x `cols`, one
/// control or run of text per element (a stream may be cut into updates
/// between any two).
std::vector<std::string> ControlStream(std::string_view choices, int rows, int cols);

}  // namespace TulkTest
