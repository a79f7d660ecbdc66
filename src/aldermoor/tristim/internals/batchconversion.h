#ifndef ALDERMOOR_TRISTIM_INTERNALS_BATCHCONVERSION_H
#define ALDERMOOR_TRISTIM_INTERNALS_BATCHCONVERSION_H

#include <array>
#include <cstddef>
#include <optional>
#include <string>

#include "aldermoor/tristim/hxmeasureconditions.h"
#include "aldermoor/tristim/hxspectrum.h"
#include "aldermoor/tristim/internals/batchmath.h"

/// The conversions of TristimService over arrays, with everything that the process keeps for it in
/// an object of the caller.
namespace Aldermoor::Tristim::Internals::Batch {

/// The weights and the white of one illuminant and observer.
class Weighting {
 public:
  /// Throws: as Weightfactors.
  explicit Weighting(const HXMeasureConditions& conditions);

  AxisWeights GetWeights() const {
    return {weights_[0].data(), weights_[1].data(), weights_[2].data()};
  }
  const Triple& GetWhite() const { return white_; }

 private:
  std::array<HXSpectrum::Bands, 3> weights_;
  Triple white_;
};

/// How spectra become XYZ.
struct Viewing {
  /// Conditions of what is seen; `is_emission`: it shines by itself, whatever illuminant is asked.
  Viewing(const HXMeasureConditions& conditions, bool is_emission,
          const std::optional<HXSpectrum::Bands>& paper_white);

  const float* GetPaper() const { return paper ? paper->data() : nullptr; }
  /// XYZ of so little light that only its chromaticity counts; it stands in for that of black.
  Triple GetAlmostBlack() const;

  Weighting weighting;
  std::optional<HXSpectrum::Bands> paper;  ///< by which spectra are divided
  bool lacks_paper;                        ///< relative to a paper that is not there
  /// Whether the almost black is divided by the paper: it stands under the conditions of the
  /// colour, so that it shines by itself where these say so, even if the spectra do not.
  bool black_is_relative;
};

/// What the second step of a conversion from spectra needs.
struct SpectrumView {
  const Viewing& viewing;
  const Weighting& asked;  ///< of the request; differs from that of an emission
  Triple almost_black;
};

/// Turns rows of XYZ in place into a colour space.
using FromXyz = void (*)(const SpectrumView& view, std::size_t count, float* colors);
/// Null if there is no way from spectra to that colour space.
FromXyz FindFromXyz(const std::string& color_space);

/// What the conversion of colours needs.
struct ColorView {
  Triple white;                        ///< of the colours
  Triple rgb_white;                    ///< of what an RGB stands for
  std::optional<Triple> almost_black;  ///< nothing if it cannot be computed
};

/// Converts rows; returns how many of them have no colour and are NaN.
using FromColors = std::size_t (*)(const ColorView& view, const float* colors, std::size_t count,
                                   float* converted);
/// Null if there is no way.
FromColors FindFromColors(const std::string& from, const std::string& to);

}  // namespace Aldermoor::Tristim::Internals::Batch

#endif  // ALDERMOOR_TRISTIM_INTERNALS_BATCHCONVERSION_H
