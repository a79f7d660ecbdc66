#ifndef ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_DESCRIPTOR_H
#define ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_DESCRIPTOR_H

#include <string>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace Aldermoor::Platform::Posix {

/// An open file descriptor on something that is no directory; closed at the end of the scope.
class Descriptor {
 public:
  Descriptor(const std::string& path, int flags)
      // Without O_NONBLOCK the open of a pipe would wait for its other end.
      : descriptor_(::open(path.c_str(), flags | O_CLOEXEC | O_NONBLOCK)) {
    if (descriptor_ >= 0 && (::fstat(descriptor_, &status_) != 0 || S_ISDIR(status_.st_mode))) {
      ::close(descriptor_);
      descriptor_ = -1;
    }
  }
  Descriptor(const Descriptor&) = delete;
  Descriptor& operator=(const Descriptor&) = delete;
  ~Descriptor() {
    if (descriptor_ >= 0) {
      ::close(descriptor_);
    }
  }

  bool IsOpen() const { return descriptor_ >= 0; }
  const struct stat& GetStatus() const { return status_; }

 private:
  struct stat status_ {};
  int descriptor_;
};

}  // namespace Aldermoor::Platform::Posix

#endif  // ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_DESCRIPTOR_H
