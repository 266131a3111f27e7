#pragma once
/// What every program the console starts is given: its environment and the
/// argument and environment vectors that execve() and posix_spawn() take.
/// The command runner (host/CommandRunner.h) and programs run in front of
/// the console (ForegroundProgram.h, the log pager) share them.

#include <string>
#include <vector>

namespace Tulk {

/// The environment of a child: `given` ("NAME=value" entries), or the
/// process's own environment when null. Under a confined host root
/// (HostRootConfined()) PATH becomes ProgramSearchPath(), and a given
/// environment is completed with the process's TULK_* variables it lacks,
/// so that the simulated tools find the same host.
std::vector<std::string> ChildEnvironment(const std::vector<std::string>* given = nullptr);

/// The null-terminated pointer vector of `strings` (which must outlive it).
std::vector<char*> ExecVector(std::vector<std::string>& strings);

}  // namespace Tulk
