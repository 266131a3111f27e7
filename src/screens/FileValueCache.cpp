#include "screens/FileValueCache.h"

namespace Tulk {

bool FileValueCache::Stamp::operator==(const Stamp& other) const {
  return exists == other.exists && device == other.device && inode == other.inode &&
         size == other.size && modified.tv_sec == other.modified.tv_sec &&
         modified.tv_nsec == other.modified.tv_nsec;
}

FileValueCache::FileValueCache(std::string path, std::function<std::string()> compute)
    : path_(std::move(path)), compute_(std::move(compute)) {
}

FileValueCache::Stamp FileValueCache::Read() const {
  Stamp stamp;
  struct stat info {};
  if (stat(path_.c_str(), &info) == 0) {
    stamp.exists = true;
    stamp.device = info.st_dev;
    stamp.inode = info.st_ino;
    stamp.size = info.st_size;
    stamp.modified = info.st_mtim;
  }
  return stamp;
}

std::string FileValueCache::Get() {
  Stamp now = Read();
  if (!stamp_ || !(*stamp_ == now)) {
    value_ = compute_();
    stamp_ = now;
  }
  return value_;
}

}  // namespace Tulk
