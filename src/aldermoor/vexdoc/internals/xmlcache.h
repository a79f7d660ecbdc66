#ifndef ALDERMOOR_VEXDOC_INTERNALS_XMLCACHE_H
#define ALDERMOOR_VEXDOC_INTERNALS_XMLCACHE_H

#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "aldermoor/utilities/filesystem/file.h"
#include "aldermoor/utilities/filesystem/posix/regularfile.h"
#include "aldermoor/vexdoc/internals/cachestamp.h"
#include "aldermoor/vexdoc/vex.h"

namespace Aldermoor::Vexdoc::Internals {

/// The binary cache beside an XML file with its stamp: which of the two a load may take.
///
/// "Cache/paper.vexb" and "Cache/paper.vexb.stamp" beside "paper.xml".  A cache counts if its date
/// is later than that of the XML file, its bytes are those that its stamp names, and the XML file
/// is the one that the stamp names: by size, times and inode where they settle it, else by its
/// bytes. One without a stamp, by an older version of this library, counts if its date is later
/// than everything that is known of the XML file.  docs/binaryformat.md tells the rules.
class XmlCache {
 public:
  /// What a load asks of a cache.
  enum class Need {
    kAny,    ///< What a document in memory was when it was written.
    kExact,  ///< Exactly what the XML file says, by a stamp.
  };

  /// The bytes of the cache, or the reason why they may not be used.
  struct Found {
    bool IsUsable() const { return reason.empty(); }
    std::string_view GetBytes() const { return {bytes.data(), bytes.size()}; }

    std::vector<char> bytes;
    std::string reason;
    /// With the times of now, if the XML file had to be read.
    std::optional<CacheStamp> renewed;
  };

  explicit XmlCache(const Utilities::FileSystem::File& xml);

  Utilities::FileSystem::File& GetFile() { return cache_; }

  /// Whether a file is longer than any cache of that document.
  static bool IsTooLong(const Platform::Posix::RegularFile& cache,
                        const Platform::Posix::RegularFile& xml);

  /// Throws: ResourceNotAvailableException for a file that cannot be read.
  Found Find(Need need) const;

  /// Writes the document that was read from XML bytes, and its stamp; leaves no cache if the XML
  /// file is another one by now.  Does nothing if that is no regular file.
  /// Throws: ResourceNotAvailableException for a file that cannot be written.
  void Write(VEX& document, const XmlReading& reading, bool is_exact);
  /// Writes the stamp of Find, so that the next load need not read the XML file.
  void Renew(const CacheStamp& stamp) const;
  /// Removes the cache.  The stamp stays, of which no other cache can make use.
  void Remove() const;

 private:
  using RegularFile = Platform::Posix::RegularFile;

  static bool IsStamped(const RegularFile& xml, std::int64_t now, const CacheStamp& stamp,
                        Found& found);
  bool IsLaterThanAllOf(const RegularFile& xml, const RegularFile& cache) const;
  bool ConfirmLast(XmlReading& reading) const;
  void WriteStamp(const std::string& text, const struct stat& owner) const;

  std::string xml_path_;
  Utilities::FileSystem::File cache_;
  std::string cache_path_;
  std::string stamp_path_;
};

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_XMLCACHE_H
