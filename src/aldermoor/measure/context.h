#ifndef ALDERMOOR_MEASURE_CONTEXT_H
#define ALDERMOOR_MEASURE_CONTEXT_H

#include <array>
#include <concepts>
#include <cstddef>
#include <memory>
#include <optional>
#include <span>

#include "aldermoor/export.h"
#include "aldermoor/measure/colordifference.h"
#include "aldermoor/measure/density.h"
#include "aldermoor/vexdoc/conditions.h"

namespace Aldermoor::Measure {

/// What a spectrum is made of: 380 nm to 730 nm, 10 nm.
inline constexpr std::size_t kBands = 36;

/// Stands in the place of a difference that cannot be computed: of a colour without hue by "2000",
/// of a reference without light by "FMCII".  The single request throws there.
inline constexpr float kNoDifference = 1000000.0F;

/// Spectra of 36 bands in memory of the caller: reflectances, 1 = perfect reflector, or the
/// relative power of lights.  They are not limited to a range.
struct SpectrumRows {
  /// `row_stride`: floats from the start of one spectrum to that of the next; below 36 they
  /// overlap. Behind the last spectrum the rest of its row may be missing.
  template <class Range>
  requires std::convertible_to<const Range&, std::span<const float>> SpectrumRows(
      const Range& all_values, std::size_t row_stride = kBands)
      : values(all_values), stride(row_stride) {}

  std::span<const float> values;
  std::size_t stride;
};

/// Colorimetry on whole arrays, under conditions that are decided once.
///
/// A context owns its weights and uses nothing of the process, neither its paper white nor its user
/// densities: it is copied freely, and any number of threads may use one, or several, at once.
/// Making one only reads the conditions that are passed, which no other thread may do meanwhile.
///
/// Results are equal to the last bit to those of single requests (Sample::GetSampleAttribute,
/// ColorDifference, UncalibratedDensitiesOf) under the same conditions, on every processor; this
/// holds for negative, infinite and missing numbers too.
///
/// Layout: rows of 3 values for a colour (4 for "CMYK"), 4 for densities, 1 for a difference, dense
/// and in order.  The output says how many rows there are; input and output must not overlap,
/// unless they are the same colours of three channels.
/// Nothing is allocated while arrays are computed.
///
/// Units: Y of the perfect reflector is 100, and so is its L*; x, y, u', v' 0 to 1; RGB 0 to 255;
/// CMYK in percent; angles of hue in degrees.  Input is not checked, and what is not a number makes
/// results that are none, but 255 in "RGB" and the greatest value in a density.
///
/// Throws: MeasureException where a single request would fail for every row, with its reason, and
/// for arrays whose lengths do not fit; the output is unchanged then.  Making one throws it for a
/// word that colorimetry does not know (words.h), and for an illumination "Userdefined" without a
/// curve of 36 values.
class ALDERMOOR_EXPORT Context {
 public:
  /// `target`: what is asked for, by the words of the library: colour space, illuminant, observer,
  /// white base and difference formula; as for a request, D65, two-degree, CIELab and "Automatic"
  /// stand for what is not said.  A daylight outside 4000 K to 25000 K is extrapolated without a
  /// warning (words.h).
  /// `source`: what the arrays hold.  For spectra, whether the illumination is "Emission"; for
  /// colours, all that stands for `target` too.
  /// `paper_white`: the paper that the white base "Paper" refers to.
  explicit Context(const Vexdoc::Conditions& target,
                   const Vexdoc::Conditions& source = Vexdoc::Conditions(),
                   const std::optional<std::array<float, kBands>>& paper_white = std::nullopt);

  /// Channels of a colour as it comes in (that of `source`) and goes out (that of `target`).
  std::size_t GetSourceChannels() const;
  std::size_t GetTargetChannels() const;

  /// The colours of spectra in the colour space of `target`.
  void ConvertSpectra(const SpectrumRows& spectra, std::span<float> colors) const;

  /// Colours of `source` in the colour space of `target`.  As for a single colour, illuminant and
  /// observer are those of `source`.
  /// Returns how many rows have no colour and are NaN in all channels: black in "CIExyY", relative
  /// to a paper that is not there.
  std::size_t ConvertColors(std::span<const float> colors, std::span<float> converted) const;

  /// Differences of the colours of spectra by the formula of `target`.  One row on either side is
  /// compared with all of the other.  `first` is the reference where the formula has one.
  /// Returns how many rows are kNoDifference.
  std::size_t CompareSpectra(const SpectrumRows& first, const SpectrumRows& second,
                             std::span<float> differences,
                             const DifferenceWeights& weights = {}) const;

  /// The same for colours of `source`, by way of CIELab.
  std::size_t CompareColors(std::span<const float> first, std::span<const float> second,
                            std::span<float> differences,
                            const DifferenceWeights& weights = {}) const;

  /// Densities of reflectance spectra: black, cyan, magenta, yellow; decadic, without a
  /// calibration. Where a filter lets nothing through, it is 11.99 for black and 9.99 for the
  /// others. Throws also for the standard "User", whose curves are those of the process.
  void MeasureDensities(const SpectrumRows& spectra, const DensityOptions& options,
                        std::span<float> densities) const;

 private:
  struct Plan;
  std::shared_ptr<const Plan> plan_;
};

}  // namespace Aldermoor::Measure

#endif  // ALDERMOOR_MEASURE_CONTEXT_H
