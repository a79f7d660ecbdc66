#ifndef ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_FILEREPLACEMENT_H
#define ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_FILEREPLACEMENT_H

#include <cstdint>
#include <ostream>
#include <string>
#include <string_view>

#include <sys/stat.h>

#include "aldermoor/utilities/filesystem/posix/descriptorbuffer.h"

namespace Aldermoor::Platform::Posix {

/// Size and hash of the bytes of a file.
struct ContentMark {
  std::uint64_t size = 0;
  std::uint64_t hash = 0;  // HashOf

  bool operator==(const ContentMark&) const = default;
};

/// New content for a file, which takes the place of the old one as a whole or not at all.
///
/// What is written goes to a temporary file beside the target.  Commit flushes it to disk and gives
/// it the target's name; without Commit it is removed, and the target stays as it is.  A link stays
/// a link: what it points to is replaced.  A target that is no regular file is written directly.
/// Permissions, and as far as possible the owner, are those of the old file.  Temporary files of
/// processes that were ended long ago are removed from the folder.
///
/// One case is not atomic: where the folder takes no temporary file, or does not let the target be
/// replaced, but the target itself may be written.  Then Commit writes over it in place, after
/// everything was composed and the space for it was reserved; if that fails half-way, the message
/// says that the file is no longer whole.
/// Throws: ResourceNotAvailableException with the name and the system's reason.
class FileReplacement {
 public:
  enum class Flush { kYes, kNo };

  /// `path` in platform form.  Opens at once.
  explicit FileReplacement(const std::string& path);
  /// For a file that belongs to another one, of which `owner` is the status, and gets its
  /// permissions.  Whatever bears the name is replaced itself: no link is followed and nothing is
  /// waited for.  What need not outlive a power cut is not flushed.
  FileReplacement(const std::string& path, const struct stat& owner, Flush flush);
  FileReplacement(const FileReplacement&) = delete;
  FileReplacement& operator=(const FileReplacement&) = delete;
  ~FileReplacement();

  std::ostream& GetStream() { return stream_; }
  /// Nothing may be written afterwards.  Returns the mark of what was written, whoever has replaced
  /// it since.
  ContentMark Commit();

 private:
  // Closed with this object, also where the constructor fails.
  struct OwnedDescriptor {
    ~OwnedDescriptor();
    int value = -1;
  };

  void OpenTemporary(unsigned int mode);
  void CopyPermissions(const struct stat& model);
  // Whether the target could be opened for that.
  bool OpenInPlace();
  void WriteInPlace(std::string_view bytes);
  void Rename();
  void Close();
  [[noreturn]] void Fail(int error) const;
  [[noreturn]] void FailInPlace(int error) const;

  std::string name_;    // in messages
  std::string target_;  // what the temporary is renamed to
  std::string directory_name_;
  std::string temporary_;  // empty if there is none
  Flush flush_ = Flush::kYes;
  bool belongs_to_another_ = false;
  bool is_in_place_ = false;
  OwnedDescriptor descriptor_;
  OwnedDescriptor directory_;  // of the target; not open if it cannot be read
  DescriptorBuffer buffer_;
  std::ostream stream_;
};

}  // namespace Aldermoor::Platform::Posix

#endif  // ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_FILEREPLACEMENT_H
