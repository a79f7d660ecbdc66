#include "aldermoor/utilities/filesystem/posix/filereplacement.h"

#include <atomic>
#include <cerrno>
#include <cstdio>
#include <filesystem>
#include <system_error>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/utilities/filesystem/path.h"

namespace Aldermoor::Platform::Posix {

namespace FileSystem = Utilities::FileSystem;

namespace {

constexpr unsigned int kModeOfNewFiles = 0666;
constexpr unsigned int kModeBits = 07777;
constexpr int kMostLinks = 40;
constexpr int kMostNames = 1000;

// The path behind a link to a file that need not exist.
std::string FollowLinks(const std::string& path) {
  std::filesystem::path target = path;
  std::error_code error;
  for (int i = 0; i < kMostLinks && std::filesystem::is_symlink(target, error); ++i) {
    const std::filesystem::path next = std::filesystem::read_symlink(target, error);
    if (error) {
      break;
    }
    target = next.is_absolute() ? next : target.parent_path() / next;
  }
  return target.string();
}

// Not the name of a document, and of another process or another save only by a stale file.
std::string TemporaryName() {
  static std::atomic<unsigned int> count = 0;
  return ".aldermoor-" + std::to_string(::getpid()) + "-" + std::to_string(++count) + ".tmp";
}

}  // namespace

FileReplacement::FileReplacement(const std::string& path) try
    : name_(path), target_(FollowLinks(path)), stream_(&buffer_) {
  struct stat old {};
  if (::stat(path.c_str(), &old) != 0) {
    if (errno != ENOENT) {
      Fail(errno);
    }
    OpenTemporary(kModeOfNewFiles);
  } else if (S_ISREG(old.st_mode)) {
    // A file that may not be written may not be replaced either.
    // One that somebody has removed since is no hindrance.
    if (::faccessat(AT_FDCWD, target_.c_str(), W_OK, AT_EACCESS) != 0 && errno != ENOENT) {
      Fail(errno);
    }
    OpenTemporary(old.st_mode & kModeBits);
    CopyPermissions(old);
  } else {
    descriptor_.value = ::open(target_.c_str(), O_WRONLY | O_CLOEXEC | O_NOCTTY);
    if (descriptor_.value < 0) {
      Fail(errno);
    }
  }
  buffer_.SetDescriptor(descriptor_.value);
}
ALDERMOOR_FRAME(Aldermoor::Platform::Posix::FileReplacement::FileReplacement)

FileReplacement::~FileReplacement() {
  if (!temporary_.empty()) {
    ::unlink(temporary_.c_str());
  }
}

FileReplacement::OwnedDescriptor::~OwnedDescriptor() {
  if (value >= 0) {
    ::close(value);
  }
}

void FileReplacement::OpenTemporary(unsigned int mode) {
  const std::string directory = FileSystem::ParentPath(target_);
  // Opened first, so that its failure leaves the old file; one that cannot be read is not flushed.
  directory_.value = ::open(directory.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC);
  if (directory_.value < 0 && errno != EACCES) {
    Fail(errno);
  }
  for (int i = 0; descriptor_.value < 0; ++i) {
    std::string name = FileSystem::JoinPath(directory, TemporaryName());
    descriptor_.value = ::open(name.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, mode);
    if (descriptor_.value >= 0) {
      temporary_.swap(name);
    } else if (errno != EEXIST || i == kMostNames) {
      Fail(errno);
    }
  }
}

void FileReplacement::CopyPermissions(const struct stat& old) {
  // Not everybody may give a file away; the mode comes second, since a change of owner resets it.
  (void)!::fchown(descriptor_.value, old.st_uid, old.st_gid);
  if (::fchmod(descriptor_.value, old.st_mode & kModeBits) != 0) {
    const int error = errno;
    ::unlink(temporary_.c_str());
    Fail(error);
  }
}

FileStamp FileReplacement::Commit() try {
  stream_.flush();
  if (buffer_.GetError() != 0) {
    Fail(buffer_.GetError());
  }
  if (!temporary_.empty() && ::fsync(descriptor_.value) != 0) {
    Fail(errno);
  }
  struct stat status {};
  if (::fstat(descriptor_.value, &status) != 0) {
    Fail(errno);
  }
  const int closed = ::close(descriptor_.value);
  descriptor_.value = -1;
  if (closed != 0) {
    Fail(errno);
  }
  if (temporary_.empty()) {
    return FileStamp(status);
  }
  if (::rename(temporary_.c_str(), target_.c_str()) != 0) {
    Fail(errno);
  }
  temporary_.clear();
  // Some file systems have nothing to flush for a directory.
  if (directory_.value >= 0 && ::fsync(directory_.value) != 0 && errno != EINVAL) {
    Fail(errno);
  }
  return FileStamp(status);
}
ALDERMOOR_FRAME(Aldermoor::Platform::Posix::FileReplacement::Commit)

void FileReplacement::Fail(int error) const {
  throw Utilities::Exceptions::ResourceNotAvailableException(
      "file '" + name_ + "' cannot be written: " + std::generic_category().message(error),
      ALDERMOOR_HERE(Aldermoor::Platform::Posix::FileReplacement));
}

}  // namespace Aldermoor::Platform::Posix
