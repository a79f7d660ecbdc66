#ifndef ALDERMOOR_TRISTIM_INTERNALS_TRISTIMCALCULATOR_H
#define ALDERMOOR_TRISTIM_INTERNALS_TRISTIMCALCULATOR_H

#include "aldermoor/tristim/hxcolorvector.h"
#include "aldermoor/tristim/hxspectrum.h"
#include "aldermoor/tristim/internals/basecalculator.h"
#include "aldermoor/tristim/internals/hxlab.h"

namespace Aldermoor::Tristim::Internals {

/// The colour spaces, from a spectrum and from each other.
///
/// White follows the illuminant and observer in the conditions of the spectrum or vector.  All
/// operations return false if a step below them fails: no paper white for the white base "Paper",
/// or a vector of another colour space than the operation reads.
/// Shared state: TristimFilter::Get(), whose conditions change with almost every operation, and the
/// paper white.  The formulas themselves are in colormath.h.
class TristimCalculator : public BaseCalculator {
 public:
  /// The root of all that starts from a spectrum.  A spectrum measured as emission stays emission,
  /// whatever illuminant is asked for.
  [[nodiscard]] static bool GetVector_CIEXYZ(const HXSpectrum& spectrum,
                                             const HXMeasureConditions& conditions,
                                             HXColorVector& out);
  [[nodiscard]] static bool GetVector_CIELab(const HXSpectrum& spectrum,
                                             const HXMeasureConditions& conditions,
                                             HXColorVector& out);
  [[nodiscard]] static bool GetVector_CIELCh_ab(const HXSpectrum& spectrum,
                                                const HXMeasureConditions& conditions,
                                                HXColorVector& out);
  [[nodiscard]] static bool GetVector_CIExyY(const HXSpectrum& spectrum,
                                             const HXMeasureConditions& conditions,
                                             HXColorVector& out);
  /// L* with u' and v' themselves; for black the chromaticity of the light.
  [[nodiscard]] static bool GetVector_CIELuv(const HXSpectrum& spectrum,
                                             const HXMeasureConditions& conditions,
                                             HXColorVector& out);
  [[nodiscard]] static bool GetVector_CIELCh_uv(const HXSpectrum& spectrum,
                                                const HXMeasureConditions& conditions,
                                                HXColorVector& out);
  [[nodiscard]] static bool GetVector_HunterLab(const HXSpectrum& spectrum,
                                                const HXMeasureConditions& conditions,
                                                HXColorVector& out);
  [[nodiscard]] static bool GetVector_RxRyRz(const HXSpectrum& spectrum,
                                             const HXMeasureConditions& conditions,
                                             HXColorVector& out);
  [[nodiscard]] static bool GetVector_LCHhx(const HXSpectrum& spectrum,
                                            const HXMeasureConditions& conditions,
                                            HXColorVector& out);
  [[nodiscard]] static bool GetVector_LABhx(const HXSpectrum& spectrum,
                                            const HXMeasureConditions& conditions,
                                            HXColorVector& out);
  [[nodiscard]] static bool GetVector_RGB(const HXSpectrum& spectrum,
                                          const HXMeasureConditions& conditions,
                                          HXColorVector& out);

  [[nodiscard]] static bool GetVector_CIELab(const HXColorVector& xyz, HXColorVector& out);
  [[nodiscard]] static bool GetVector_CIEXYZ(const HXColorVector& lab, HXColorVector& out);
  /// Any rectangular triple to its polar one.
  [[nodiscard]] static bool GetVector_CIELCh_ab(const HXColorVector& in, HXColorVector& out);
  /// For black the chromaticity of the light.
  [[nodiscard]] static bool GetVector_CIExyY(const HXColorVector& xyz, HXColorVector& out);
  /// From "CIEXYZ" or "CIExyY"; false for any other.
  [[nodiscard]] static bool GetVector_CIEuvY1976(const HXColorVector& in, HXColorVector& out);
  [[nodiscard]] static bool GetVector_CIEuvY1960(const HXColorVector& in, HXColorVector& out);
  /// Of the conditions of `out` only the colour space is set.
  [[nodiscard]] static bool GetVector_CIELab_RGB(const HXColorVector& lab, HXColorVector& out);
  /// The result is against D50, two-degree, absolute white, whatever the conditions of `rgb` say.
  [[nodiscard]] static bool GetVector_RGB_CIEXYZ(const HXColorVector& rgb, HXColorVector& out);
  [[nodiscard]] static bool GetVector_CMYK_RGB(const HXColorVector& cmyk, HXColorVector& out);

  /// Differences of lightness, chroma and hue, first minus second.  The three are the same and
  /// bear the names of the rectangular triples that they are meant for.
  [[nodiscard]] static bool GetVector_DeltaCIELCH_ab(const HXColorVector& first,
                                                     const HXColorVector& second,
                                                     HXColorVector& out);
  [[nodiscard]] static bool GetVector_CIELCH_uv(const HXColorVector& first,
                                                const HXColorVector& second, HXColorVector& out);
  [[nodiscard]] static bool GetVector_LCHhx_delta(const HXColorVector& first,
                                                  const HXColorVector& second, HXColorVector& out);

  /// Colour differences of two spectra under `conditions`.  kNoDeltaE if a colour or the difference
  /// cannot be computed; else as the functions of deltaemath.h have it.
  [[nodiscard]] static float GetDeltaE_CIELAB(const HXSpectrum& first, const HXSpectrum& second,
                                              const HXMeasureConditions& conditions);
  /// Distance in L*, u', v': the lightness decides nearly alone.
  [[nodiscard]] static float GetDeltaE_CIELUV(const HXSpectrum& first, const HXSpectrum& second,
                                              const HXMeasureConditions& conditions);
  [[nodiscard]] static float GetDeltaE_hx(const HXSpectrum& first, const HXSpectrum& second,
                                          const HXMeasureConditions& conditions);
  [[nodiscard]] static float GetDeltaE_FMCII(const HXSpectrum& first, const HXSpectrum& second,
                                             const HXMeasureConditions& conditions);
  [[nodiscard]] static float GetDeltaE_CMC(const HXSpectrum& first, const HXSpectrum& second,
                                           const HXMeasureConditions& conditions, float l, float c);
  [[nodiscard]] static float GetDeltaE_94(const HXSpectrum& first, const HXSpectrum& second,
                                          const HXMeasureConditions& conditions, float kL, float kC,
                                          float kH);
  [[nodiscard]] static float GetDeltaE_2000(const HXSpectrum& first, const HXSpectrum& second,
                                            const HXMeasureConditions& conditions, float kL,
                                            float kC, float kH);

  [[nodiscard]] static float GetDeltaE_CIELAB(const HXLab& first, const HXLab& second);
  [[nodiscard]] static float GetDeltaE_CMC(const HXLab& first, const HXLab& second, float l,
                                           float c);
  [[nodiscard]] static float GetDeltaE_94(const HXLab& first, const HXLab& second, float kL,
                                          float kC, float kH);
  [[nodiscard]] static float GetDeltaE_2000(const HXLab& first, const HXLab& second, float kL,
                                            float kC, float kH);

  /// For the inner loop of a search: CIELab difference of `lab` and 36 bare values.  The caller has
  /// set TristimFilter for the conditions of `lab`.  L* is not kept at 0 here.
  [[nodiscard]] static float GetDeltaE_CIELAB_SpeedOptimized(const HXLab& lab,
                                                             const float* spectrum);

  /// Number of the colour family, 0 to 15, under the conditions of the spectrum; -1 if its colour
  /// cannot be computed.
  [[nodiscard]] static int GetColorType(const HXSpectrum& spectrum);
  /// How far two samples drift apart under `illumination` that match under `conditions`, as CIELab
  /// difference; what there is under `conditions` already is divided out of XYZ.  kNoDeltaE on
  /// failure.  Source: CIE 15:2004, 9.2.2.3, multiplicative correction.
  [[nodiscard]] static float GetMetamery(const HXSpectrum& first, const HXSpectrum& second,
                                         const HXMeasureConditions& conditions,
                                         const HXIllumination& illumination);

  /// The white point of `conditions`: Xn, 100, Zn.
  [[nodiscard]] static bool GetNormValence(const HXMeasureConditions& conditions,
                                           HXColorVector& out);

  static double DegToRad(double degrees);
  static double RadToDeg(double radians);
};

}  // namespace Aldermoor::Tristim::Internals

#endif  // ALDERMOOR_TRISTIM_INTERNALS_TRISTIMCALCULATOR_H
