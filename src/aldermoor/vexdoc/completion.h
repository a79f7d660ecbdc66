#ifndef ALDERMOOR_VEXDOC_COMPLETION_H
#define ALDERMOOR_VEXDOC_COMPLETION_H

#include <cstddef>
#include <map>
#include <string>
#include <string_view>
#include <vector>

#include "aldermoor/export.h"
#include "aldermoor/vexdoc/vex.h"

/// Giving spectra and colours the mandatory conditions that their file does not name, as files of
/// the legacy dialect often do not.  Without them, a saved document is refused by the next load.
namespace Aldermoor::Vexdoc {

/// Whether a condition of the key `key` belongs to spectra, or to colours, where no kind is named:
/// "Physical." to spectra, "Colorimetric." and "ColorSpaceDescription." to colours,
/// "CustomCondition" to both, any other to neither.
ALDERMOOR_EXPORT bool IsConditionOfSpectra(std::string_view key);
ALDERMOOR_EXPORT bool IsConditionOfColors(std::string_view key);

/// Conditions, key to value, for what lacks them.  What a file does name is never replaced, but a
/// wavelength that is no number counts as lacking, there and here.
struct Completion {
  std::map<std::string, std::string> spectra;
  std::map<std::string, std::string> colors;
};

/// What a completion did and what it could not do.
struct CompletionReport {
  /// An attribute that lacks mandatory conditions, and was left as it is.
  struct Missing {
    std::string set;
    std::string sample;
    bool is_spectrum = false;       ///< Else a colour.
    std::vector<std::string> keys;  ///< Not empty.
  };
  /// At most so many are listed.
  static constexpr std::size_t kMostListed = 100;

  /// Spectra whose number of points was set from their data, by that number.
  std::map<std::size_t, std::size_t> counted;
  /// How many spectra and colours took a condition, by its key; the value is that of the
  /// Completion.
  std::map<std::string, std::size_t> spectra;
  std::map<std::string, std::size_t> colors;
  std::vector<Missing> missing;
  std::size_t missing_count = 0;  ///< Those that are not listed too.
};

/// Sets the mandatory conditions that spectra and colours of `document` lack: the number of points
/// from the data, whatever the conditions say, everything else from `completion`.  An attribute
/// for which something is still missing stays as it is; colours of other than the standard colour
/// spaces need nothing.
///
/// Conditions are blocks that attributes share; those that change get another one, so equal blocks
/// stay shared.  Shared state: the blocks of the process.
ALDERMOOR_EXPORT CompletionReport CompleteConditions(VEX& document, const Completion& completion);

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_COMPLETION_H
