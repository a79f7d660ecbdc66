#ifndef ALDERMOOR_VEXDOC_LOADOPTIONS_H
#define ALDERMOOR_VEXDOC_LOADOPTIONS_H

#include <cstddef>
#include <map>
#include <optional>
#include <string>
#include <vector>

#include "aldermoor/vexdoc/completion.h"

/// What a load may do beyond the plain ones, and what it tells.
namespace Aldermoor::Vexdoc {

/// What a load does with the binary cache beside an XML file.
enum class CacheUse {
  kNone,          ///< Reads the XML file; the cache is neither looked at nor written.
  kRead,          ///< Reads a cache that holds what the XML file says, and writes none.
  kReadAndWrite,  ///< Reads such a one, or else writes it after the XML file was read.
};

/// What is done about spectra whose wavelengths in the file are not those of their conditions.
///
/// A document keeps the conditions and no wavelengths, so such values count at other wavelengths
/// than they were measured at, and a save writes them there.
enum class WavelengthUse {
  kRefuse,    ///< The load fails.
  kComplete,  ///< Minimum, maximum and number become those of the points; the load fails where the
              ///< points have no single step in whole nm.  Reads the XML, not the cache.
  kReport,    ///< The conditions count, and the report tells.
};

struct LoadOptions {
  CacheUse cache = CacheUse::kRead;
  WavelengthUse wavelengths = WavelengthUse::kRefuse;
  /// Asks for CompleteConditions, ahead of the comparison of the wavelengths, but behind kComplete:
  /// a range comes from the points first.  Spectra that still lack a range afterwards are told as
  /// such only.  Reads the XML, not the cache.
  std::optional<Completion> completion = std::nullopt;
};

/// What a load found and did.
struct LoadReport {
  /// A spectrum whose wavelengths are not those of its conditions; an illuminant of conditions
  /// without set and sample.
  struct Contradiction {
    std::string set;
    std::string sample;
    std::string text;  ///< What the points and what the conditions are.

    /// In one line, the place in front.
    std::string Text() const {
      return (set.empty() && sample.empty() ? "" : "set '" + set + "', sample '" + sample + "': ") +
             text;
    }
  };
  /// At most so many are listed.
  static constexpr std::size_t kMostListed = 100;

  /// Whether the document came from the cache; it is the same either way.
  bool from_cache = false;
  /// Why not, in plain words that go on after "not used: ", as StateOfCache has them; empty if it
  /// did, or if the cache was not looked at.
  std::string cache_reason;
  std::vector<Contradiction> contradictions;
  std::size_t contradiction_count = 0;  ///< Those that are not listed too.
  /// Ranges such as "31 from 400nm to 700nm" and how many spectra took them from their points.
  std::map<std::string, std::size_t> ranges_taken;
  CompletionReport completion;

  /// Whether the document holds conditions that its file does not.
  bool HasCompleted() const {
    return !ranges_taken.empty() || !completion.counted.empty() || !completion.spectra.empty() ||
           !completion.colors.empty();
  }
};

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_LOADOPTIONS_H
