#include "runtime/PidFile.h"

#include <fcntl.h>
#include <signal.h>
#include <syslog.h>
#include <unistd.h>

#include <cstdio>
#include <string>

#include "include/Constants.h"
#include "runtime/HostPath.h"
#include "runtime/SystemLog.h"

namespace Tulk {

void WritePidFile() {
  const std::string path = HostPath(kPidFilePath);
  if (FILE* file = std::fopen(path.c_str(), "re"); file != nullptr) {
    long pid = 0;
    int fields = std::fscanf(file, "%ld", &pid);
    (void)std::fclose(file);  // read only: nothing to lose
    if (fields == 1 && pid > 0 && kill(static_cast<pid_t>(pid), 0) == 0) {
      Log(LOG_ERR, "Attempt to run multiple TULK instances, not updating %s", kPidFilePath);
      return;
    }
  }
  int fd = open(path.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, 0644);
  if (fd < 0) {
    return;
  }
  std::string text = std::to_string(getpid());
  ssize_t written = write(fd, text.data(), text.size());
  (void)written;
  close(fd);
}

}  // namespace Tulk
