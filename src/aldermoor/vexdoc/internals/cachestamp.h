#ifndef ALDERMOOR_VEXDOC_INTERNALS_CACHESTAMP_H
#define ALDERMOOR_VEXDOC_INTERNALS_CACHESTAMP_H

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

#include <sys/stat.h>

#include "aldermoor/utilities/filesystem/posix/filereplacement.h"

namespace Aldermoor::Vexdoc::Internals {

/// What tells one state of a file from another without a look at its bytes.  Times in nanoseconds
/// since 1970.
struct FileState {
  FileState() = default;
  explicit FileState(const struct stat& status);

  bool operator==(const FileState&) const = default;

  std::uint64_t size = 0;
  std::uint64_t inode = 0;
  std::int64_t modified = 0;
  std::int64_t changed = 0;
};

/// The bytes of an XML file as they were read, without the bytes themselves.
struct XmlReading {
  XmlReading() = default;
  /// `verified` is a clock reading from before `status` was taken, and `status` one of the same
  /// open file from before `bytes` were read.
  XmlReading(std::int64_t verified, const struct stat& status, std::string_view bytes);

  /// The clock by which the system dates files, in nanoseconds.
  static std::int64_t Now();

  bool HasBytesOf(const XmlReading& other) const {
    return state.size == other.state.size && hash == other.hash;
  }
  /// Whether a later change of the file shows in its times in any case.  One that came within the
  /// resolution of the clock may not.
  bool IsSettled() const;

  FileState state;
  std::uint64_t hash = 0;
  std::int64_t verified = 0;
};

/// Ties a cache to the XML bytes whose document it holds.
struct CacheStamp {
  /// One line, with a line feed.
  std::string ToText() const;
  /// Nothing, if `text` differs in any byte from what ToText could have made.
  static std::optional<CacheStamp> FromText(std::string_view text);

  /// What stands in the place of a stamp while its cache is being written.
  static std::string UnfinishedText();

  XmlReading xml;
  Platform::Posix::ContentMark cache;
  /// Whether the document in the cache is exactly what the XML says.
  bool is_exact = true;
};

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_CACHESTAMP_H
