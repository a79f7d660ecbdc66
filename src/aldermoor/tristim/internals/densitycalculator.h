#ifndef ALDERMOOR_TRISTIM_INTERNALS_DENSITYCALCULATOR_H
#define ALDERMOOR_TRISTIM_INTERNALS_DENSITYCALCULATOR_H

#include "aldermoor/tristim/hxspectrum.h"
#include "aldermoor/tristim/internals/basecalculator.h"
#include "aldermoor/tristim/internals/densityfilter.h"
#include "aldermoor/tristim/internals/hxdensity.h"

namespace Aldermoor::Tristim::Internals {

/// One tint in the output of RecognizeColorField.
struct ColorFieldResult {
  float dotGain = 0.0F;  ///< measured minus nominal tone value, percent points
  bool present = false;  ///< whether the entry was written
};

/// Densities of reflectance spectra and the print control values that are derived from them.
///
/// Channels and filter modes: 0 black (visual), 1 cyan, 2 magenta, 3 yellow, 4 "Max", the densest
/// band from 410 nm to 700 nm, 5 "Auto", the channel that would be reported.  Standards: the
/// numbers of DensityStandard.  Results are fractions, 1 = 100 %, but for RecognizeColorField.
/// All operations return false if the paper white that they need is missing; outputs are then as
/// each says.  The formulas themselves are in densitymath.h.
/// Shared state: the active filter, which follows the standard last used, the calibration, the
/// paper white.
class DensityCalculator : public BaseCalculator {
 public:
  DensityCalculator& operator=(const DensityCalculator&) { return *this; }

  /// Slope 1 and offset 0 everywhere.
  static void InitializeDensityCalibration();
  /// The same for one physical filter and one standard.
  /// Throws: OutOfRangeException unless the filter is 0..12 and the standard 0..7, here and in the
  /// other operations on the calibration.
  static void ResetDensityCalibration(int physicalFilter, const int& standard);
  /// The address of the four slopes.
  static float* GetDensitySlope(int physicalFilter, int standard);
  static void GetDensitySlope(int physicalFilter, int standard, float out[4]);
  static void SetDensitySlope(int physicalFilter, int standard, const float in[4]);
  static float* GetDensityOffset(int physicalFilter, int standard);
  static void GetDensityOffset(int physicalFilter, int standard, float out[4]);
  static void SetDensityOffset(int physicalFilter, int standard, const float in[4]);

  static DensityFilter& GetActDensityStdFilter();

  /// The four densities, less those of the paper on demand: a difference of densities, not the
  /// density of a quotient.  Without a paper white the absolute ones stay in `density`.
  [[nodiscard]] static bool GetDensityVector(const HXSpectrum& spectrum, int standard,
                                             bool paperRelative, HXDensity& density);
  /// With the slopes of the physical filter of the spectrum and, unless relative to paper, the
  /// offsets.
  [[nodiscard]] static bool GetDensityVectorWithSlope(const HXSpectrum& spectrum, int standard,
                                                      bool paperRelative, HXDensity& density);
  /// The channel to report.
  [[nodiscard]] static int GetDensityFilter(const HXDensity& density);
  /// One density: of `channel`, or with `automatic` of the one to report, which `channel` then
  /// names.  9.99 and -1 without a paper white.
  [[nodiscard]] static bool GetDensity(const HXSpectrum& spectrum, int standard, bool paperRelative,
                                       float& value, int& channel, bool automatic);
  /// Density band by band; room for 36 values.
  [[nodiscard]] static bool GetDensitySpectrum(const HXSpectrum& spectrum, bool paperRelative,
                                               float* densities);
  /// The densest band from 410 nm to 700 nm, of equal ones that nearest to the middle; its
  /// wavelength in nm.  Without a paper white the absolute one is found.
  [[nodiscard]] static bool GetMaxDensity(const HXSpectrum& spectrum, bool paperRelative,
                                          float& maxDensity, unsigned short& wavelength);
  /// Cyan, magenta, yellow in descending order.
  static void SortColorDensities(const HXDensity& density, float sorted[3]);

  /// Always relative to paper and without slope; `n` is the Yule-Nielsen factor.
  [[nodiscard]] static bool GetDotArea(const HXSpectrum& solid, const HXSpectrum& tint,
                                       int standard, int mode, float& dotArea);
  [[nodiscard]] static bool GetDotArea(const HXSpectrum& solid, const HXSpectrum& tint,
                                       int standard, int mode, float n, float& dotArea);
  [[nodiscard]] static bool GetContrast(const HXSpectrum& solid, const HXSpectrum& tint,
                                        int standard, bool paperRelative, int mode,
                                        float& contrast);
  /// Always relative to paper and without slope; `first` is printed first.
  [[nodiscard]] static bool GetTrapping(const HXSpectrum& first, const HXSpectrum& second,
                                        const HXSpectrum& overprint, int standard, int mode,
                                        float& trapping);
  [[nodiscard]] static bool GetTrapping(const HXDensity& first, const HXDensity& second,
                                        const HXDensity& overprint, int mode, float& trapping);
  [[nodiscard]] static bool GetGreyness(const HXSpectrum& spectrum, int standard,
                                        bool paperRelative, float& greyness, bool withSlope);
  [[nodiscard]] static bool GetHueError(const HXSpectrum& spectrum, int standard,
                                        bool paperRelative, float& hueError, bool withSlope);

  /// What kind of printed field a measurement shows.
  ///
  /// `solids`: the density of the solid of each channel, of which its own channel is read.
  /// `tones`: nominal tone values in percent, 1 to 3; a value of 100 or above takes no part.
  /// `field`: channel + 4·tone − 3 for a tint, 13 to 15 for an overprint, 16 + channel for a solid,
  /// 0 if no tone fits, −1 without a paper white; `color`: the channel, −1 for an overprint.
  /// Of `results` the entry of a tint, field − 1, is written.
  [[nodiscard]] static bool RecognizeColorField(const HXDensity solids[4],
                                                const HXSpectrum& spectrum, int standard,
                                                const float tones[4], int& field, int& color,
                                                HXDensity& density, ColorFieldResult results[12]);
};

}  // namespace Aldermoor::Tristim::Internals

#endif  // ALDERMOOR_TRISTIM_INTERNALS_DENSITYCALCULATOR_H
