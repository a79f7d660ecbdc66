#ifndef ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_FILESTAMP_H
#define ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_FILESTAMP_H

#include <cstdint>
#include <string>

#include <sys/stat.h>

namespace Aldermoor::Platform::Posix {

/// What tells one state of a file from another without a look at its content.
class FileStamp {
 public:
  /// Of the file at `path`; equal for all files that cannot be looked at.
  explicit FileStamp(const std::string& path) {
    struct stat status {};
    if (::stat(path.c_str(), &status) == 0) {
      *this = FileStamp(status);
    }
  }
  explicit FileStamp(const struct stat& status)
      : is_known_(true),
        device_(status.st_dev),
        node_(status.st_ino),
        size_(status.st_size),
        seconds_(status.st_mtim.tv_sec),
        nanoseconds_(status.st_mtim.tv_nsec) {}

  bool operator==(const FileStamp&) const = default;

  /// Whether the last write came later, by whole seconds; never if one of the two is not known.
  bool IsLaterThan(const FileStamp& other) const {
    return is_known_ && other.is_known_ && seconds_ > other.seconds_;
  }

 private:
  bool is_known_ = false;
  dev_t device_ = 0;
  ino_t node_ = 0;
  off_t size_ = 0;
  std::int64_t seconds_ = 0;
  std::int64_t nanoseconds_ = 0;
};

}  // namespace Aldermoor::Platform::Posix

#endif  // ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_FILESTAMP_H
