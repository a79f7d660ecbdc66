#ifndef ALDERMOOR_TRISTIM_INTERNALS_DELTAEMATH_H
#define ALDERMOOR_TRISTIM_INTERNALS_DELTAEMATH_H

#include "aldermoor/tristim/internals/colormath.h"

/// The colour-difference formulas and the judgement of a colour.  Every input stands in the
/// signature, nothing is remembered.
///
/// Where a formula is not symmetric, the first colour is the reference that sets the scale.
/// Precision: single, unless a formula says double.
namespace Aldermoor::Tristim::Internals {

/// What every formula gives for a difference that it cannot compute.
inline constexpr float kNoDeltaE = 1000000.0F;

/// Length of the difference over all four channels, summed from the first: CIE 1976 for L*a*b*.
/// Source: CIE 15:2004, 8.2.1.
[[nodiscard]] float DeltaE76(const Quadruple& first, const Quadruple& second) noexcept;

/// CIE94 with the weights kL, kC, kH.  Chroma of the first colour sets the scale.  A weight of 0
/// gives kNoDeltaE.  Source: CIE 116-1995.
[[nodiscard]] float DeltaE94(const Quadruple& first, const Quadruple& second,
                             const Triple& weights) noexcept;

/// CMC(l:c); the first colour sets the scale.  The cosines are computed in double.
/// Source: BS 6923:1988, ISO 105-J03.
[[nodiscard]] float DeltaECmc(const Quadruple& first, const Quadruple& second, float l,
                              float c) noexcept;

/// CIEDE2000 with the weights kL, kC, kH, in double from the channels, the chromas and the
/// difference of lightness, which are single.  The mean hue is not brought below 360 and no case is
/// made of neutral colours: the results agree with the published ones.  A weight of 0 and a hue
/// that is no number give kNoDeltaE.  Source: ISO/CIE 11664-6.
[[nodiscard]] float DeltaE2000(const Quadruple& first, const Quadruple& second,
                               const Triple& weights) noexcept;

/// FMC II from XYZ, 0..about 100; the first colour sets the scale.  A first colour without light
/// gives kNoDeltaE.  The two polynomials in Y are computed in double.
/// Source: K. D. Chickering, J. Opt. Soc. Am. 57, 537 (1967) and 61, 118 (1971).
[[nodiscard]] float DeltaEFmc2(const Triple& first, const Triple& second) noexcept;

/// Number of the colour family of L*, a*, b*: 0 to 15, as ColorFamilyName tells them.
[[nodiscard]] int ColorFamily(const Triple& lab) noexcept;
/// "Undefined" for 1, which has no name, and for any other number.
[[nodiscard]] const char* ColorFamilyName(int family) noexcept;

}  // namespace Aldermoor::Tristim::Internals

#endif  // ALDERMOOR_TRISTIM_INTERNALS_DELTAEMATH_H
