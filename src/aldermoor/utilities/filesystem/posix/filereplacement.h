#ifndef ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_FILEREPLACEMENT_H
#define ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_FILEREPLACEMENT_H

#include <ostream>
#include <string>

#include <sys/stat.h>

#include "aldermoor/utilities/filesystem/posix/descriptorbuffer.h"
#include "aldermoor/utilities/filesystem/posix/filestamp.h"

namespace Aldermoor::Platform::Posix {

/// New content for a file, which takes the place of the old one as a whole or not at all.
///
/// What is written goes to a temporary file beside the target.  Commit flushes it to disk and gives
/// it the target's name; without Commit it is removed, and the target stays as it is.  A link stays
/// a link: what it points to is replaced.  A target that is no regular file is written directly.
/// Permissions, and as far as possible the owner, are those of the old file.
/// Throws: ResourceNotAvailableException with the name and the system's reason.
class FileReplacement {
 public:
  /// `path` in platform form.  Opens at once.
  explicit FileReplacement(const std::string& path);
  FileReplacement(const FileReplacement&) = delete;
  FileReplacement& operator=(const FileReplacement&) = delete;
  ~FileReplacement();

  std::ostream& GetStream() { return stream_; }
  /// Nothing may be written afterwards.  Returns the stamp of what was written, whoever has
  /// replaced it since.
  FileStamp Commit();

 private:
  // Closed with this object, also where the constructor fails.
  struct OwnedDescriptor {
    ~OwnedDescriptor();
    int value = -1;
  };

  void OpenTemporary(unsigned int mode);
  void CopyPermissions(const struct stat& old);
  [[noreturn]] void Fail(int error) const;

  std::string name_;       // in messages
  std::string target_;     // what the temporary is renamed to
  std::string temporary_;  // empty if there is none
  OwnedDescriptor descriptor_;
  OwnedDescriptor directory_;  // of the target; not open if it cannot be read
  DescriptorBuffer buffer_;
  std::ostream stream_;
};

}  // namespace Aldermoor::Platform::Posix

#endif  // ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_FILEREPLACEMENT_H
