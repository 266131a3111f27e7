#pragma once
/// A value computed from one file, kept until the file changes.
///
/// The support page shows certificate thumbprints and SSH key fingerprints,
/// each made by running a program on a host file. The markup renderer asks
/// for them at every draw; this cache runs the program again only when the
/// file's identity, size or modification time changed (or it appeared or
/// went away), so paging through the support information costs nothing and
/// a failure is logged once per change of the file, not once per draw.

#include <sys/stat.h>

#include <functional>
#include <optional>
#include <string>

namespace Tulk {

class FileValueCache {
 public:
  /// `compute` makes the value; `path` is the file it depends on (already
  /// resolved under the host root).
  FileValueCache(std::string path, std::function<std::string()> compute);

  /// The value, computed again when the file changed since the last call.
  std::string Get();

 private:
  struct Stamp {
    bool exists = false;
    dev_t device = 0;
    ino_t inode = 0;
    off_t size = 0;
    timespec modified{};

    bool operator==(const Stamp& other) const;
  };
  Stamp Read() const;

  std::string path_;
  std::function<std::string()> compute_;
  std::optional<Stamp> stamp_;
  std::string value_;
};

}  // namespace Tulk
