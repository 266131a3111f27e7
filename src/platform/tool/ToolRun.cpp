#include "platform/tool/ToolRun.h"

#include <fnmatch.h>
#include <unistd.h>

#include <chrono>
#include <cstdio>
#include <thread>

#include "platform/sim/SimHost.h"
#include "platform/sim/SimState.h"

namespace Sim::Tools {
namespace {

bool IsGlob(const std::string& key) {
  return key.find_first_of("*?[") != std::string::npos;
}

void WriteAll(int fd, const std::string& text) {
  std::size_t done = 0;
  while (done < text.size()) {
    ssize_t written = write(fd, text.data() + done, text.size() - done);
    if (written <= 0) {
      return;
    }
    done += static_cast<std::size_t>(written);
  }
}

}  // namespace

ToolRun::ToolRun(std::string name, std::vector<std::string> args)
    : name_(std::move(name)), args_(std::move(args)) {
  const json& commands = ObjectAt(SimHost::Instance().State(), "commands");
  const std::string line = Line();
  std::string best;
  const json* chosen = nullptr;
  for (const auto& [key, value] : commands.items()) {
    if (IsGlob(key)) {
      continue;
    }
    const bool prefix = line.compare(0, key.size(), key) == 0 &&
                        (line.size() == key.size() || line[key.size()] == ' ');
    if (prefix && (chosen == nullptr || key.size() > best.size())) {
      best = key;
      chosen = &value;
    }
  }
  if (chosen == nullptr) {
    for (const auto& [key, value] : commands.items()) {
      if (IsGlob(key) && fnmatch(key.c_str(), line.c_str(), 0) == 0) {
        chosen = &value;
        break;
      }
    }
  }
  if (chosen != nullptr) {
    override_ = *chosen;
  }
}

std::string ToolRun::Line() const {
  std::string line = name_;
  for (const std::string& arg : args_) {
    line += ' ';
    line += arg;
  }
  return line;
}

void ToolRun::Delay() {
  const int delay = override_ ? override_->value("delayMs", 0) : 0;
  if (delay > 0) {
    Record(nullptr);
    std::this_thread::sleep_for(std::chrono::milliseconds(delay));
  }
}

bool ToolRun::Suppressed() const {
  return override_ && override_->value("exitCode", 0) != 0;
}

int ToolRun::Finish(int exitCode) {
  if (override_) {
    exitCode = override_->value("exitCode", exitCode);
    if (override_->contains("stdout")) {
      out_ = (*override_)["stdout"].get<std::string>();
    }
    if (override_->contains("stderr")) {
      err_ = (*override_)["stderr"].get<std::string>();
    }
  }
  WriteAll(1, out_);
  WriteAll(2, err_);
  Record(exitCode);
  return exitCode & 0xff;
}

void ToolRun::Record(const json& exitCode) const {
  json argv = json::array({name_});
  for (const std::string& arg : args_) {
    argv.push_back(arg);
  }
  AppendRecord("commands.jsonl",
               {{"time", TimeStamp()}, {"pid", getpid()}, {"argv", argv}, {"exitCode", exitCode}});
}

}  // namespace Sim::Tools
