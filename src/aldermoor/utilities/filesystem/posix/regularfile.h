#ifndef ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_REGULARFILE_H
#define ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_REGULARFILE_H

#include <optional>
#include <string>
#include <vector>

#include <sys/stat.h>

namespace Aldermoor::Platform::Posix {

/// A regular file, open for reading.  Nothing else is opened, and nothing is waited for.
class RegularFile {
 public:
  enum class Link {
    kFollow,
    kRefuse,  ///< a link in the last component of the path is no regular file
  };

  RegularFile(const std::string& path, Link link);
  RegularFile(const RegularFile&) = delete;
  RegularFile& operator=(const RegularFile&) = delete;
  ~RegularFile();

  bool IsOpen() const { return descriptor_ >= 0; }
  /// Why it is not open: an error number of the system, 0 for something that is no regular file.
  int GetError() const { return error_; }
  /// As it was when the file was opened.
  const struct stat& GetStatus() const { return status_; }
  /// All bytes of a file that is open.
  /// Throws: ResourceNotAvailableException with the name and the system's reason.
  std::vector<char> Read() const;

 private:
  std::string path_;
  int descriptor_ = -1;
  int error_ = 0;
  struct stat status_ {};
};

}  // namespace Aldermoor::Platform::Posix

#endif  // ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_REGULARFILE_H
