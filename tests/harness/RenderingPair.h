#pragma once
/// Two terminals (libvterm) fed two byte streams that must look the same:
/// what curses wrote and what the console's attribute filter made of it.
/// The filter's unit test and its fuzzer compare them after every update.

#include <string>
#include <string_view>

struct VTerm;

namespace TulkTest {

class RenderingPair {
 public:
  RenderingPair(int rows, int cols);
  ~RenderingPair();
  RenderingPair(const RenderingPair&) = delete;
  RenderingPair& operator=(const RenderingPair&) = delete;

  /// Feeds the original bytes to one terminal and the filtered ones to the
  /// other.
  void Feed(std::string_view original, std::string_view filtered);

  /// Empty when both show the same cells (characters, colours and
  /// attributes), have the cursor in the same place and would give a
  /// character written next the same attributes; otherwise the first
  /// difference, described.
  std::string Difference() const;

 private:
  VTerm* original_;
  VTerm* filtered_;
  int rows_;
  int cols_;
};

}  // namespace TulkTest
