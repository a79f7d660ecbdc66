#ifndef ALDERMOOR_TRISTIM_INTERNALS_COLORMATH_H
#define ALDERMOOR_TRISTIM_INTERNALS_COLORMATH_H

#include <array>

/// The formulas between colour spaces.  Every input stands in the signature, nothing is remembered.
///
/// Units: reflectance, 1 = perfect reflector; XYZ, 0..about 100; hue, degrees, (0, 360];
/// RGB, 0..255; CMYK, 0..100.
/// Precision: single, sums and products from left to right, unless a formula says double.
/// A division by 0 gives an infinity or a NaN.
namespace Aldermoor::Tristim::Internals {

using Triple = std::array<float, 3>;
using Quadruple = std::array<float, 4>;

/// The 36 weights of X, Y, Z.
using AxisWeights = std::array<const float*, 3>;

/// So little light in every band that only its chromaticity counts; it stands in for that of black.
inline constexpr float kAlmostBlack = 1e-5F;

/// Dot products of the weights with 36 bands, each accumulated from band 0 upward.
Triple XyzFromSpectrum(const AxisWeights& weights, const float* spectrum) noexcept;

/// CIE 1976 L*a*b* of `xyz` against `white`.  L* is not below 0; a* and b* have no limit.
/// Linear up to 0.008856, above it the power 0.33333334 (the float nearest to 1/3).
/// Source: CIE 15:2004, 8.2.1.
Triple LabFromXyz(const Triple& xyz, const Triple& white) noexcept;
/// The way back; a lightness of 0 that was clamped stays 0.
Triple XyzFromLab(const Triple& lab, const Triple& white) noexcept;

/// The hue of a direction; that of the neutral axis and of the positive first axis is 360, never 0.
float HueOf(float a, float b) noexcept;
/// Polar form of any rectangular triple.
Triple PolarFromRectangular(const Triple& rectangular) noexcept;

/// x, y, Y; X + Y + Z is not 0.
Triple XyYFromXyz(const Triple& xyz) noexcept;

/// X + 15 Y + 3 Z, the divisor of u' and v'.
float UvDivisor(const Triple& xyz) noexcept;
/// `lightness`, u', v'.  The chromaticities themselves stand in the place of u* and v*.
Triple LuvFromXyz(float lightness, const Triple& xyz) noexcept;

/// u', v', Y of the CIE 1976 diagram; the equal-energy values for black.  Source: CIE 15:2004, 8.1.
Triple UvY1976FromXyz(const Triple& xyz) noexcept;
Triple UvY1976FromXyY(const Triple& xyy) noexcept;
/// u, v, Y of the CIE 1960 diagram.
Triple UvY1960FromUvY1976(const Triple& uvy) noexcept;

/// Hunter L, a, b with the coefficients 17.5 and 7; the root of Y is not below 0.0001.
Triple HunterLabFromXyz(const Triple& xyz, const Triple& white) noexcept;

/// Share of the short-wave lobe in X: a hundredth of the sum of the X weights from 380 nm to 500
/// nm.
float ShortWaveShare(const float* x_weights) noexcept;
/// Reflectance factors as seen through the three filters of a colorimeter.
Triple RxRyRzFromXyz(const Triple& xyz, const Triple& white, float short_wave_share) noexcept;

/// This system's own transform of L*, C*, h with even visual steps.  Chroma is computed in double,
/// the hue is not brought back into (0, 360].  The lightness steps at L* = 16.
Triple LchHxFromLch(const Triple& lch) noexcept;
/// Its rectangular form; the angle in double.
Triple LabHxFromLchHx(const Triple& lch) noexcept;

/// sRGB-like values, whole numbers 0..255, out of gamut clipped.  The white (95.04, 100, 108.9)
/// becomes 255 each; there is no adaptation to other whites.
Triple RgbFromXyz(const Triple& xyz) noexcept;
/// XYZ against D50; another matrix and another exponent (2) than the way above, and double.
Triple XyzFromRgb(const Triple& rgb) noexcept;
/// Grey component is replaced by a fifth, black covers four fifths.  Double.
Triple RgbFromCmyk(const Quadruple& cmyk) noexcept;

/// Differences of lightness, chroma and hue, first minus second, of any rectangular triples; the
/// fourth channel enters the length only.
Triple DeltaLch(const Quadruple& first, const Quadruple& second) noexcept;

}  // namespace Aldermoor::Tristim::Internals

#endif  // ALDERMOOR_TRISTIM_INTERNALS_COLORMATH_H
