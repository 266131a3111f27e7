#include "network/RunTestDialog.h"

#include <syslog.h>

#include <system_error>
#include <thread>
#include <utility>

#include "include/Keys.h"
#include "network/NetworkTestText.h"
#include "network/PingAddress.h"
#include "network/ResolveHostName.h"
#include "render/TextId.h"
#include "runtime/KeyInput.h"
#include "runtime/SystemLog.h"
#include "runtime/WorkerResult.h"
#include "toolkit/Footer.h"

namespace Tulk {
namespace {

// The exit status that stands for a check that could not be started.
constexpr int kNotStarted = 255;

}  // namespace

RunTestDialog::RunTestDialog(Frame* owner, std::array<std::string, kPingTargetCount> targets,
                             std::string hostName, std::string interfaceName)
    : ProgressDialog(owner, kWidth, kHeight, kHeaderHeight),
      targets_(std::move(targets)),
      hostName_(std::move(hostName)),
      interfaceName_(std::move(interfaceName)) {
  SetTitle(Text(TextId::kTestingNetworkTitle));
  SetText(Text(TextId::kTestingNetworkText));
  SetFooter(Footer::kCancel);
}

bool RunTestDialog::Await(const WorkerResult& result) {
  for (;;) {
    const int key = WaitKeyOrResult(result);
    if (key == kKeyEsc) {
      return false;
    }
    if (result.Ready()) {
      return true;
    }
  }
}

template <typename Check, typename... Args>
bool RunTestDialog::RunCheck(Check check, Args... args) {
  std::shared_ptr<WorkerResult> result = WorkerResult::Create();
  try {
    std::thread(check, std::move(args)..., result).detach();
  } catch (const std::system_error& failure) {
    Log(LOG_ERR, "Starting the network test failed: %s", failure.what());
    result->Set(kNotStarted);
  }
  if (!Await(*result)) {
    return false;
  }
  Append(VerdictLine(Text(result->Get() == 0 ? TextId::kOk : TextId::kFailed)));
  return true;
}

int RunTestDialog::Run() {
  for (std::size_t i = 0; i < targets_.size(); ++i) {
    const std::string& typed = targets_[i];
    if (typed.empty()) {
      continue;
    }
    const std::optional<PingTarget> target = ParsePingTarget(typed);
    const std::string zone = target ? ZoneSuffix(*target, interfaceName_) : std::string();
    Append(PingingLine(Text(TextId::kPingingAddress), static_cast<int>(i + 1), typed, zone));
    if (!RunCheck(PingAddress, interfaceName_, typed + zone)) {
      return 0;
    }
  }
  if (!hostName_.empty()) {
    Append(std::string(Text(TextId::kResolvingHostname)) + " (" + hostName_ + ").");
    if (!RunCheck(ResolveHostName, hostName_)) {
      return 0;
    }
  }
  return Finish(Footer::kOk);
}

}  // namespace Tulk
