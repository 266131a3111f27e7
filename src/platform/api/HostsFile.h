#pragma once
/// The host's name table file ("/etc/hosts").

#include <string>
#include <vector>

namespace HykCtl::Network {

/// Edits the hosts file in place. Lines are "address name [alias...]",
/// "#" starts a comment; lines the editor does not change are kept byte
/// for byte. Every operation may throw HostMgr::Lib::HostMgrException
/// (for example when the file cannot be read or replaced).
class HostsFile {
 public:
  /// One entry of the file.
  struct Entry {
    std::string address;
    /// The canonical name first, then the aliases.
    std::vector<std::string> names;
  };

  /// The hosts file of the host, "/etc/hosts" (under the host root).
  HostsFile();
  /// A hosts file at `path`, taken as it is.
  explicit HostsFile(std::string path);

  /// The entries, in file order.
  std::vector<Entry> GetEntries() const;
  /// Removes every line that names `hostName` as canonical name or alias.
  /// Names compare without case, and a bare name and a qualified name with
  /// that first label match each other ("tavi-01" and
  /// "tavi-01.lab.example.net").
  /// Returns the number of lines removed. The file is replaced atomically.
  int RemoveEntryByHostName(const std::string& hostName);
  /// Appends an entry.
  void AddEntry(const Entry& entry);

  /// The file's path.
  const std::string& GetPath() const { return path_; }

 private:
  std::string path_;
};

}  // namespace HykCtl::Network
