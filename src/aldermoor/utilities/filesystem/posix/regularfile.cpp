#include "aldermoor/utilities/filesystem/posix/regularfile.h"

#include <cerrno>

#include <fcntl.h>
#include <unistd.h>

#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/utilities/filesystem/posix/filecontent.h"

namespace Aldermoor::Platform::Posix {

RegularFile::RegularFile(const std::string& path, Link link) : path_(path) {
  const bool follow = link == Link::kFollow;
  // Looked at first: to open a pipe and to close it again would end the program at its other end.
  if ((follow ? ::stat : ::lstat)(path.c_str(), &status_) != 0) {
    error_ = errno;
    return;
  }
  if (!S_ISREG(status_.st_mode)) {
    return;
  }
  // It may be something else by now, hence no waiting and the second look.
  constexpr int kFlags = O_RDONLY | O_CLOEXEC | O_NOCTTY | O_NONBLOCK;
  descriptor_ = ::open(path.c_str(), kFlags | (follow ? 0 : O_NOFOLLOW), 0);
  if (descriptor_ < 0) {
    error_ = errno == ELOOP && !follow ? 0 : errno;
  } else if (::fstat(descriptor_, &status_) != 0 || !S_ISREG(status_.st_mode)) {
    error_ = S_ISREG(status_.st_mode) ? errno : 0;
    ::close(descriptor_);
    descriptor_ = -1;
  }
}

RegularFile::~RegularFile() {
  if (descriptor_ >= 0) {
    ::close(descriptor_);
  }
}

std::vector<char> RegularFile::Read() const try { return ReadAll(descriptor_, status_, path_); }
ALDERMOOR_FRAME(Aldermoor::Platform::Posix::RegularFile::Read)

}  // namespace Aldermoor::Platform::Posix
