#pragma once
/// Running the host's own command-line tools.

#include <string>

namespace HykCtl::Util {

/// The outcome of HykCtl_Exec.
struct ExecResult {
  /// The exit status (0..255) when the program was waited for and ended
  /// normally; -1 when it ended by a signal; 0 when it was not waited for.
  int status = 0;
  /// Standard output and standard error together, when captured and
  /// waited for (at most 64 KiB; the rest is read and dropped).
  std::string output;
};

/// Runs `commandLine` on the host.
///
/// - `captureOutput`: collect standard output and error into the result
///   (only together with `waitForExit`); otherwise both go to /dev/null,
///   never to the console's terminal.
/// - `waitForExit`: wait for the program and report its status; otherwise
///   return once it has started (it is reaped in the background).
/// - `useShell`: run the line with "/bin/sh -c"; otherwise split it at
///   blanks and tabs and run the first word as the program, which is
///   looked up in the host's program path when it holds no "/".
///
/// Standard input is /dev/null; descriptors above 2 are closed; the
/// signal mask and dispositions are reset. The program runs with the
/// host's program path as PATH (the root's bin and sbin under a confined
/// root). A program path given in the line is used as it is: callers
/// resolve absolute paths for the root themselves. Throws HostMgr::Lib::HostMgrException("Cannot
/// run <program>: <reason>") when the program cannot be started.
ExecResult HykCtl_Exec(const std::string& commandLine, bool captureOutput, bool waitForExit,
                       bool useShell);

}  // namespace HykCtl::Util
