#ifndef ALDERMOOR_VEXDOC_LOADOPTIONS_H
#define ALDERMOOR_VEXDOC_LOADOPTIONS_H

#include <string>

namespace Aldermoor::Vexdoc {

/// What a load does with the binary cache beside an XML file.
enum class CacheUse {
  kNone,          ///< Reads the XML file; the cache is neither looked at nor written.
  kRead,          ///< Reads a cache that holds what the XML file says, and writes none.
  kReadAndWrite,  ///< Reads such a one, or else writes it after the XML file was read.
};

/// How VEX::LoadXML reads a file.
struct LoadOptions {
  CacheUse cache = CacheUse::kRead;
};

/// What VEX::LoadXML has done.
struct LoadReport {
  /// Whether the document came from the cache; it is the same either way.
  bool from_cache = false;
  /// Why not, in plain words that go on after "not used: ", as StateOfCache has them; empty if it
  /// did, or if the cache was not looked at.
  std::string cache_reason;
};

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_LOADOPTIONS_H
