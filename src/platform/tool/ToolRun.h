#pragma once
/// One invocation of a simulated host tool: its name and arguments, the
/// output it produces, the state's per-command override, and the record
/// it leaves in "<root>/var/log/tulk-sim/commands.jsonl".

#include <optional>
#include <string>
#include <vector>

#include <nlohmann/json.hpp>

namespace Sim::Tools {

class ToolRun {
 public:
  /// `name` is the tool's base name ("osk-cmd"), `args` the arguments
  /// after it.
  ToolRun(std::string name, std::vector<std::string> args);

  const std::string& Name() const { return name_; }
  const std::vector<std::string>& Args() const { return args_; }
  /// The name and arguments joined by single blanks.
  std::string Line() const;

  /// Appends to the tool's standard output or error.
  void Out(const std::string& text) { out_ += text; }
  void Err(const std::string& text) { err_ += text; }

  /// The state's "commands" entry for this invocation: the key equal to
  /// the line, else the longest key that is a prefix of the line ending at
  /// a word boundary, else the first glob key (with * ? or [) that matches
  /// the whole line. Null when none applies.
  const nlohmann::json* Override() const { return override_ ? &*override_ : nullptr; }

  /// Waits the override's delay; a delayed run first records itself with
  /// a null exit code, so that a run killed while waiting leaves a trace.
  void Delay();
  /// True when the override sets a non-zero exit code: the tool then has
  /// no effect, it only prints the override's output.
  bool Suppressed() const;

  /// Ends the run: the override's exit code and output replace the tool's
  /// own, the output is written, the invocation is recorded. Returns the
  /// exit status.
  int Finish(int exitCode);

 private:
  void Record(const nlohmann::json& exitCode) const;

  std::string name_;
  std::vector<std::string> args_;
  std::string out_;
  std::string err_;
  std::optional<nlohmann::json> override_;
};

}  // namespace Sim::Tools
