#include "aldermoor/utilities/filesystem/posix/filereplacement.h"

#include <cerrno>
#include <cstdio>
#include <filesystem>
#include <new>
#include <system_error>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/utilities/filesystem/path.h"
#include "aldermoor/utilities/filesystem/posix/filecontent.h"
#include "aldermoor/utilities/filesystem/posix/temporaryfiles.h"

namespace Aldermoor::Platform::Posix {

namespace FileSystem = Utilities::FileSystem;

namespace {

constexpr unsigned int kModeOfNewFiles = 0666;
constexpr unsigned int kModeBits = 07777;
constexpr unsigned int kModeBitsOfDependants = 0777;
constexpr unsigned int kGroupBits = 0070;
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

// A name that starts like one with a drive may have no "/" at all.
std::string DirectoryOf(const std::string& path) {
  return path.find('/') == std::string::npos ? "." : FileSystem::ParentPath(path);
}

bool IsLackOfRights(int error) {
  return error == EACCES || error == EPERM || error == EROFS;
}

}  // namespace

FileReplacement::FileReplacement(const std::string& path) try
    : name_(path),
      target_(FollowLinks(path)),
      directory_name_(DirectoryOf(target_)),
      stream_(&buffer_) {
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
    descriptor_.value = ::open(target_.c_str(), O_WRONLY | O_CLOEXEC | O_NOCTTY, 0);
    if (descriptor_.value < 0) {
      Fail(errno);
    }
  }
  buffer_.SetDescriptor(descriptor_.value);
}
ALDERMOOR_FRAME(Aldermoor::Platform::Posix::FileReplacement::FileReplacement)

FileReplacement::FileReplacement(const std::string& path, const struct stat& owner, Flush flush) try
    : name_(path),
      target_(path),
      directory_name_(DirectoryOf(path)),
      flush_(flush),
      belongs_to_another_(true),
      stream_(&buffer_) {
  // Closed to everybody else until the owner's permissions are there.
  OpenTemporary(S_IRUSR | S_IWUSR);
  CopyPermissions(owner);
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
  // Opened first, so that its failure leaves the old file; one that cannot be read is not flushed.
  directory_.value = ::open(directory_name_.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC, 0);
  if (directory_.value < 0 && errno != EACCES) {
    Fail(errno);
  }
  for (int i = 0; descriptor_.value < 0; ++i) {
    std::string name = FileSystem::JoinPath(directory_name_, MakeTemporaryName());
    descriptor_.value = ::open(name.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, mode);
    if (descriptor_.value >= 0) {
      temporary_.swap(name);
    } else if (const int error = errno; IsLackOfRights(error)) {
      if (!OpenInPlace()) {
        Fail(error);
      }
    } else if (error != EEXIST || i == kMostNames) {
      Fail(error);
    }
  }
}

bool FileReplacement::OpenInPlace() {
  constexpr int kFlags = O_WRONLY | O_CLOEXEC | O_NOCTTY | O_NONBLOCK | O_NOFOLLOW;
  const int opened = ::open(target_.c_str(), kFlags, 0);
  if (opened < 0) {
    return false;
  }
  struct stat status {};
  // A further name of the same file is a link too.
  if (::fstat(opened, &status) != 0 || !S_ISREG(status.st_mode) ||
      (belongs_to_another_ && status.st_nlink != 1)) {
    ::close(opened);
    return false;
  }
  if (descriptor_.value >= 0) {
    ::close(descriptor_.value);
  }
  descriptor_.value = opened;
  is_in_place_ = true;
  buffer_.HoldBack();
  return true;
}

void FileReplacement::CopyPermissions(const struct stat& model) {
  if (is_in_place_ && !belongs_to_another_) {
    return;  // they are there
  }
  unsigned int mode = model.st_mode & (belongs_to_another_ ? kModeBitsOfDependants : kModeBits);
  // Not everybody may give a file away; the mode comes second, since a change of owner resets it.
  if (::fchown(descriptor_.value, model.st_uid, model.st_gid) != 0 &&
      ::fchown(descriptor_.value, static_cast<uid_t>(-1), model.st_gid) != 0 &&
      belongs_to_another_) {
    mode &= ~kGroupBits;  // it would be another group than that of the owner
  }
  if (::fchmod(descriptor_.value, mode) != 0) {
    const int error = errno;
    if (!temporary_.empty()) {
      ::unlink(temporary_.c_str());
    }
    Fail(error);
  }
}

ContentMark FileReplacement::Commit() try {
  stream_.flush();
  if (buffer_.GetError() != 0) {
    Fail(buffer_.GetError());
  }
  if (!stream_) {
    throw std::bad_alloc();  // for what is held back
  }
  const ContentMark written{buffer_.GetSize(), buffer_.GetHash()};
  if (is_in_place_) {
    WriteInPlace(buffer_.GetHeldBack());
    return written;
  }
  if (!temporary_.empty() && flush_ == Flush::kYes && ::fsync(descriptor_.value) != 0) {
    Fail(errno);
  }
  Close();
  if (!temporary_.empty()) {
    Rename();
  }
  return written;
}
ALDERMOOR_FRAME(Aldermoor::Platform::Posix::FileReplacement::Commit)

void FileReplacement::Rename() {
  if (::rename(temporary_.c_str(), target_.c_str()) != 0) {
    const int error = errno;
    // A file of somebody else in a folder like /tmp, or one on which another is mounted.
    if ((error != EPERM && error != EBUSY) || !OpenInPlace()) {
      Fail(error);
    }
    const FileContent content = ReadFileContent(temporary_);
    WriteInPlace({content.bytes.data(), content.bytes.size()});
    return;
  }
  temporary_.clear();
  if (flush_ == Flush::kNo) {
    return;
  }
  // Some file systems have nothing to flush for a directory.
  if (directory_.value >= 0 && ::fsync(directory_.value) != 0 && errno != EINVAL) {
    Fail(errno);
  }
  RemoveAbandonedFiles(directory_name_);
}

void FileReplacement::WriteInPlace(std::string_view bytes) {
  const auto size = static_cast<off_t>(bytes.size());
  // Not every file system can reserve space; one that can says here that there is none.
  if (size > 0 && ::fallocate(descriptor_.value, FALLOC_FL_KEEP_SIZE, 0, size) != 0 &&
      (errno == ENOSPC || errno == EDQUOT || errno == EFBIG)) {
    Fail(errno);
  }
  if (const int error = WriteAll(descriptor_.value, bytes); error != 0) {
    FailInPlace(error);
  }
  // The new bytes are safe before the rest of the old ones goes.
  if (::fsync(descriptor_.value) != 0 || ::ftruncate(descriptor_.value, size) != 0 ||
      ::fsync(descriptor_.value) != 0) {
    FailInPlace(errno);
  }
  Close();
}

void FileReplacement::Close() {
  const int closed = ::close(descriptor_.value);
  descriptor_.value = -1;
  if (closed != 0) {
    Fail(errno);
  }
}

void FileReplacement::Fail(int error) const {
  throw Utilities::Exceptions::ResourceNotAvailableException(
      "file '" + name_ + "' cannot be written: " + std::generic_category().message(error),
      ALDERMOOR_HERE(Aldermoor::Platform::Posix::FileReplacement));
}

void FileReplacement::FailInPlace(int error) const {
  throw Utilities::Exceptions::ResourceNotAvailableException(
      "file '" + name_ +
          "' could not be replaced as a whole, and writing it in place has failed, " +
          "so that it holds neither the old nor the new content: " +
          std::generic_category().message(error),
      ALDERMOOR_HERE(Aldermoor::Platform::Posix::FileReplacement));
}

}  // namespace Aldermoor::Platform::Posix
