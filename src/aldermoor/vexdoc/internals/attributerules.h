#ifndef ALDERMOOR_VEXDOC_INTERNALS_ATTRIBUTERULES_H
#define ALDERMOOR_VEXDOC_INTERNALS_ATTRIBUTERULES_H

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "aldermoor/vexdoc/conditions.h"

/// What the checks of both kinds of file ask of an attribute.  No attribute is built from
/// conditions: that would leave a block behind in the ConditionManager.
namespace Aldermoor::Vexdoc::Internals {

/// The number of points that a custom illumination must have in XML.
inline constexpr std::size_t kIlluminationPoints = 36;

/// "VEX", "SampleSet", "Sample", "Spectrum", "ColorVector" or "Recipe" for the names of elements
/// that readers take for one; empty for those that they take for an unknown attribute.
std::string ElementKind(const std::string& name);
/// Whether that is the kind of something that holds others, and so no attribute.
bool IsLevel(std::string_view kind);

/// The wavelengths under which XML holds the points of a spectrum: whole nm, from the range that
/// `conditions` name (380 and 730 without) and a step that is rounded down.
struct WavelengthSteps {
  /// Throws: std::invalid_argument if the range is no number or does not fit into 16 bits.
  WavelengthSteps(const Conditions& conditions, std::size_t points);
  WavelengthSteps(std::int64_t minimum, std::int64_t maximum, std::size_t points);

  std::int64_t first;
  std::int64_t step = 0;  // also of a single point
};

/// The number of points that the conditions of a spectrum name; none if that is no number.
std::optional<unsigned int> ExpectedPoints(const Conditions& conditions);
/// The mandatory conditions of a spectrum that are missing, one line each.  Readers let them pass.
std::vector<std::string> SpectrumFaults(const Conditions& conditions);

/// What keeps a colour of that many channels from being read under `conditions`, one line each.
std::vector<std::string> ColorFaults(const Conditions& conditions, std::size_t channels);
/// The same for the legacy dialect, where the colour space names the channels.
std::vector<std::string> LegacyColorFaults(const Conditions& conditions, std::size_t channels);

/// Whether the channels of a colour in a known space bear other labels than the space has for them,
/// those of absolute values or of differences, in its order: a line that says so, or nothing.
/// Readers take values by position, so such ones may count for another channel than was meant.
std::string LabelFault(const Conditions& conditions, const std::vector<std::string>& labels);

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_ATTRIBUTERULES_H
