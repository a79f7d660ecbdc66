#ifndef ALDERMOOR_VEXDOC_INTERNALS_CACHEDUMP_H
#define ALDERMOOR_VEXDOC_INTERNALS_CACHEDUMP_H

#include <cstddef>
#include <iosfwd>
#include <string>
#include <string_view>

#include "aldermoor/vexdoc/internals/cachewalker.h"

namespace Aldermoor::Vexdoc::Internals {

/// Writes the bytes of a cache in lines of 16 with their meaning beside them.
class CacheDump {
 public:
  /// `bytes` and `out` are kept by reference.
  CacheDump(std::string_view bytes, std::ostream& out) : bytes_(bytes), out_(out) {}

  /// Returns whether the walk came to the end.
  bool Write();

 private:
  void WriteField(const CacheField& field);
  // The words for the bytes of a line, of which `begin` is the first within the field.
  std::string Meaning(const CacheField& field, std::size_t begin) const;
  std::string Values(const CacheField& field, std::size_t begin) const;

  std::string_view bytes_;
  std::ostream& out_;
};

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_CACHEDUMP_H
