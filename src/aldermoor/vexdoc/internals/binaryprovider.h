#ifndef ALDERMOOR_VEXDOC_INTERNALS_BINARYPROVIDER_H
#define ALDERMOOR_VEXDOC_INTERNALS_BINARYPROVIDER_H

#include <string_view>

#include <sys/stat.h>

#include "aldermoor/utilities/filesystem/file.h"
#include "aldermoor/utilities/filesystem/posix/filereplacement.h"
#include "aldermoor/vexdoc/internals/loadnotes.h"
#include "aldermoor/vexdoc/vex.h"

namespace Aldermoor::Vexdoc::Internals {

/// Fills the document that it serves from a cache file, or writes it to one; lives for one call.
class BinaryProvider {
 public:
  /// `document` is not owned.
  explicit BinaryProvider(VEX* document);
  virtual ~BinaryProvider() = default;

  /// Throws: VexException for a file that cannot be read; what BinaryLoader throws.  The document
  /// then stays as it was.
  virtual void Read(Utilities::FileSystem::File& file);
  /// Replaces the file as a whole.
  /// Throws: ResourceNotAvailableException for a file that cannot be written; what BinaryDumper
  /// throws.  The old file then stays.
  virtual void Write(Utilities::FileSystem::File& file);

  /// The same from the bytes of a cache.
  void Read(std::string_view bytes, const LoadRules& rules);
  /// Writes to a file that belongs to the one of which `owner` is the status; whatever bears its
  /// name is replaced itself.  Returns the mark of the bytes written.
  Platform::Posix::ContentMark Write(Utilities::FileSystem::File& file, const struct stat& owner);

 private:
  Platform::Posix::ContentMark WriteTo(Platform::Posix::FileReplacement& replacement);

  VEX* document_;
};

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_BINARYPROVIDER_H
