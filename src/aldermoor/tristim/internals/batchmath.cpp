#include "aldermoor/tristim/internals/batchmath.h"

#include <algorithm>
#include <array>
#include <atomic>
#include <bit>
#include <cmath>
#include <cstdint>
#include <numbers>

#include "aldermoor/tristim/hxspectrum.h"
#include "aldermoor/tristim/internals/deltaemath.h"

// This file compiles itself once for each instruction set; the functions at its end choose.
#undef HWY_TARGET_INCLUDE
#define HWY_TARGET_INCLUDE "aldermoor/tristim/internals/batchmath.cpp"
#include <hwy/foreach_target.h>
// Behind foreach_target.h.
#include <hwy/cache_control.h>
#include <hwy/contrib/math/math-inl.h>
#include <hwy/highway.h>

#ifndef ALDERMOOR_TRISTIM_INTERNALS_BATCHMATH_ROWS
#define ALDERMOOR_TRISTIM_INTERNALS_BATCHMATH_ROWS

namespace Aldermoor::Tristim::Internals::Batch {
namespace {

// One row by the scalar formulas, which say what is right.

void XyzOfRow(const AxisWeights& weights, const float* paper, const float* spectrum, float* xyz) {
  HXSpectrum::Bands relative;
  if (paper != nullptr) {
    std::transform(spectrum, spectrum + HXSpectrum::kBands, paper, relative.begin(),
                   [](float value, float white) { return value / white; });
    spectrum = relative.data();
  }
  const Triple result = XyzFromSpectrum(weights, spectrum);
  std::copy(result.begin(), result.end(), xyz);
}

void LabOfRow(const Triple& white, const float* xyz, float* lab) {
  const Triple result = Internals::LabFromXyz({xyz[0], xyz[1], xyz[2]}, white);
  std::copy(result.begin(), result.end(), lab);
}

void DensitiesOfRow(const DensityWeights& weights, const float* spectrum, float* densities) {
  const Quadruple result = DensitiesOf(weights, spectrum);
  std::copy(result.begin(), result.end(), densities);
}

Quadruple Row(const Colors& colors, std::size_t row) {
  const float* const values = colors.values + (colors.is_single ? 0 : 3 * row);
  return {values[0], values[1], values[2], 0.0F};
}

/// The functions of the header for one instruction set.
struct Kernels {
  decltype(&XyzFromSpectra) xyz_from_spectra;
  decltype(&DensitiesFromSpectra) densities_from_spectra;
  decltype(&LabFromXyz) lab_from_xyz;
  decltype(&DeltaE76) delta_e_76;
  decltype(&DeltaE94) delta_e_94;
  decltype(&DeltaECmc) delta_e_cmc;
  decltype(&DeltaE2000) delta_e_2000;
};

}  // namespace
}  // namespace Aldermoor::Tristim::Internals::Batch

#endif  // ALDERMOOR_TRISTIM_INTERNALS_BATCHMATH_ROWS

HWY_BEFORE_NAMESPACE();
namespace Aldermoor::Tristim::Internals::Batch::HWY_NAMESPACE {
namespace {

#if HWY_TARGET == HWY_SCALAR

// A processor without vectors of four floats: one row at a time.

void XyzFromSpectraImpl(const AxisWeights& weights, const float* paper, const Spectra& spectra,
                        std::size_t count, float* xyz) noexcept {
  for (std::size_t i = 0; i < count; ++i) {
    XyzOfRow(weights, paper, spectra.values + i * spectra.stride, xyz + 3 * i);
  }
}

void LabFromXyzImpl(const Triple& white, const float* xyz, std::size_t count, float* lab) noexcept {
  for (std::size_t i = 0; i < count; ++i) {
    LabOfRow(white, xyz + 3 * i, lab + 3 * i);
  }
}

void DensitiesFromSpectraImpl(const DensityWeights& weights, const Spectra& spectra,
                              std::size_t count, float* out) noexcept {
  for (std::size_t i = 0; i < count; ++i) {
    DensitiesOfRow(weights, spectra.values + i * spectra.stride, out + 4 * i);
  }
}

template <class Formula>
void OverPairs(const Colors& first, const Colors& second, std::size_t count, float* out,
               Formula formula) {
  for (std::size_t i = 0; i < count; ++i) {
    out[i] = formula(Row(first, i), Row(second, i));
  }
}

void DeltaE76Impl(const Colors& first, const Colors& second, std::size_t count,
                  float* out) noexcept {
  OverPairs(first, second, count, out, Internals::DeltaE76);
}

void DeltaE94Impl(const Colors& first, const Colors& second, const Triple& weights,
                  std::size_t count, float* out) noexcept {
  OverPairs(first, second, count, out, [&](const Quadruple& one, const Quadruple& other) {
    return Internals::DeltaE94(one, other, weights);
  });
}

void DeltaECmcImpl(const Colors& first, const Colors& second, float l, float c, std::size_t count,
                   float* out) noexcept {
  OverPairs(first, second, count, out, [=](const Quadruple& one, const Quadruple& other) {
    return Internals::DeltaECmc(one, other, l, c);
  });
}

void DeltaE2000Impl(const Colors& first, const Colors& second, const Triple& weights,
                    std::size_t count, float* out) noexcept {
  OverPairs(first, second, count, out, [&](const Quadruple& one, const Quadruple& other) {
    return Internals::DeltaE2000(one, other, weights);
  });
}

#else

namespace hn = hwy::HWY_NAMESPACE;

using Floats = hn::ScalableTag<float>;
using Doubles = hn::ScalableTag<double>;
using F = hn::VFromD<Floats>;
using D = hn::VFromD<Doubles>;
using FMask = hn::Mask<Floats>;

constexpr Floats kF;
constexpr Doubles kD;
constexpr hn::Half<Floats> kHalf;
constexpr std::size_t kLanes = hn::MaxLanes(kF);
constexpr std::size_t kBands = HXSpectrum::kBands;

/// The two halves of a vector of floats.
struct Wide {
  D lower;
  D upper;
};

HWY_INLINE Wide Widened(F v) {
  return {hn::PromoteTo(kD, hn::LowerHalf(kHalf, v)), hn::PromoteTo(kD, hn::UpperHalf(kHalf, v))};
}

HWY_INLINE F Narrowed(D lower, D upper) {
  return hn::Combine(kF, hn::DemoteTo(kHalf, upper), hn::DemoteTo(kHalf, lower));
}

/// Single results that lie somewhere between two double ones.
struct Interval {
  F low;
  F high;

  /// Also for what is not a number.
  HWY_INLINE FMask IsDoubtful() const { return hn::Not(hn::Eq(low, high)); }
};

HWY_INLINE Interval Certain(F value) {
  return {value, value};
}

/// `count` rows, a vector of them at a time; the last ones by way of a copy that fills the vector.
/// `run(in..., out)` is given rows of the widths that the arrays have.
template <std::size_t kIn, std::size_t kOut, class Run>
HWY_INLINE void OverRows(const float* in, std::size_t count, float* out, Run run) {
  std::size_t i = 0;
  for (; i + kLanes <= count; i += kLanes) {
    run(in + i * kIn, out + i * kOut);
  }
  if (i < count) {
    std::array<float, kLanes * kIn> rest{};
    std::array<float, kLanes * kOut> result;
    std::copy(in + i * kIn, in + count * kIn, rest.begin());
    run(rest.data(), result.data());
    std::copy_n(result.begin(), (count - i) * kOut, out + i * kOut);
  }
}

/// Calls `redo(lane)` for every lane of the mask.
template <class Redo>
HWY_INLINE void ForEachLane(FMask mask, Redo redo) {
  if (HWY_LIKELY(hn::AllFalse(kF, mask))) {
    return;
  }
  std::array<std::uint8_t, 8> bits{};
  hn::StoreMaskBits(kF, mask, bits.data());
  for (std::size_t lane = 0; lane < kLanes; ++lane) {
    if ((bits[lane / 8] >> (lane % 8) & 1) != 0) {
      redo(lane);
    }
  }
}

// --- Sums over bands

/// Blocks of four neighbouring bands from every fourth row, from the first one on.
template <class Tag>
HWY_INLINE hn::VFromD<Tag> LoadBlocks(Tag tag, const float* row, std::size_t stride) {
  if constexpr (hn::MaxLanes(tag) == 4) {
    return hn::LoadU(tag, row);
  } else {
    const hn::Half<Tag> half;
    return hn::Combine(tag, LoadBlocks(half, row + hn::MaxLanes(half) * stride, stride),
                       LoadBlocks(half, row, stride));
  }
}

/// Four neighbouring bands of as many rows as there are lanes, one vector a band.
HWY_INLINE void LoadFourBands(const float* rows, std::size_t stride, F& b0, F& b1, F& b2, F& b3) {
  const F r0 = LoadBlocks(kF, rows, stride);
  const F r1 = LoadBlocks(kF, rows + stride, stride);
  const F r2 = LoadBlocks(kF, rows + 2 * stride, stride);
  const F r3 = LoadBlocks(kF, rows + 3 * stride, stride);
  const F even_low = hn::InterleaveLower(kF, r0, r2);
  const F odd_low = hn::InterleaveLower(kF, r1, r3);
  const F even_high = hn::InterleaveUpper(kF, r0, r2);
  const F odd_high = hn::InterleaveUpper(kF, r1, r3);
  b0 = hn::InterleaveLower(kF, even_low, odd_low);
  b1 = hn::InterleaveUpper(kF, even_low, odd_low);
  b2 = hn::InterleaveLower(kF, even_high, odd_high);
  b3 = hn::InterleaveUpper(kF, even_high, odd_high);
}

struct ThreeSums {
  HWY_INLINE ThreeSums() : x(hn::Zero(kF)), y(hn::Zero(kF)), z(hn::Zero(kF)) {}

  HWY_INLINE void Add(const AxisWeights& weights, std::size_t band, F values) {
    x = hn::Add(x, hn::Mul(hn::Set(kF, weights[0][band]), values));
    y = hn::Add(y, hn::Mul(hn::Set(kF, weights[1][band]), values));
    z = hn::Add(z, hn::Mul(hn::Set(kF, weights[2][band]), values));
  }

  F x, y, z;
};

struct FourSums {
  HWY_INLINE FourSums()
      : black(hn::Zero(kF)), cyan(hn::Zero(kF)), magenta(hn::Zero(kF)), yellow(hn::Zero(kF)) {}

  HWY_INLINE void Add(const DensityWeights& weights, std::size_t band, F values) {
    black = hn::Add(black, hn::Mul(values, hn::Set(kF, weights[0][band])));
    cyan = hn::Add(cyan, hn::Mul(values, hn::Set(kF, weights[1][band])));
    magenta = hn::Add(magenta, hn::Mul(values, hn::Set(kF, weights[2][band])));
    yellow = hn::Add(yellow, hn::Mul(values, hn::Set(kF, weights[3][band])));
  }

  F black, cyan, magenta, yellow;
};

/// Prefetches a ninth of a vector of rows that comes later, another ninth for each four bands:
/// spread over the arithmetic, the requests do not wait for each other.  Behind the last row there
/// may be nothing, which a prefetch does not mind.
HWY_INLINE void PrefetchShare(const float* rows, std::size_t stride, std::size_t band) {
  constexpr std::size_t kRowsAhead = 32;
  constexpr std::size_t kLine = 64 / sizeof(float);
  const std::size_t end = (band + 4) * kLanes / kBands;
  for (std::size_t row = band * kLanes / kBands; row < end; ++row) {
    for (std::size_t i = 0; i < kBands; i += kLine) {
      hwy::Prefetch(rows + (kRowsAhead + row) * stride + i);
    }
  }
}

template <bool kIsRelative, class Sums, class Weights>
HWY_INLINE Sums Accumulate(const Weights& weights, const float* paper, const float* rows,
                           std::size_t stride) {
  Sums sums;
  for (std::size_t band = 0; band < kBands; band += 4) {
    PrefetchShare(rows, stride, band);
    F values[4];
    LoadFourBands(rows + band, stride, values[0], values[1], values[2], values[3]);
    for (std::size_t i = 0; i < 4; ++i) {
      if constexpr (kIsRelative) {
        values[i] = hn::Div(values[i], hn::Set(kF, paper[band + i]));
      }
      sums.Add(weights, band + i, values[i]);
    }
  }
  return sums;
}

template <bool kIsRelative>
void SumXyz(const AxisWeights& weights, const float* paper, const Spectra& spectra,
            std::size_t count, float* xyz) {
  std::size_t i = 0;
  for (; i + kLanes <= count; i += kLanes) {
    const float* const rows = spectra.values + i * spectra.stride;
    const auto sums = Accumulate<kIsRelative, ThreeSums>(weights, paper, rows, spectra.stride);
    hn::StoreInterleaved3(sums.x, sums.y, sums.z, kF, xyz + 3 * i);
    // A sum that is no number carries the payload of an operand; which one, the scalar code says.
    const F all = hn::Add(hn::Add(sums.x, sums.y), sums.z);
    ForEachLane(hn::IsNaN(all), [&](std::size_t lane) {
      XyzOfRow(weights, paper, rows + lane * spectra.stride, xyz + 3 * (i + lane));
    });
  }
  for (; i < count; ++i) {
    XyzOfRow(weights, paper, spectra.values + i * spectra.stride, xyz + 3 * i);
  }
}

void XyzFromSpectraImpl(const AxisWeights& weights, const float* paper, const Spectra& spectra,
                        std::size_t count, float* xyz) noexcept {
  if (paper == nullptr) {
    SumXyz<false>(weights, paper, spectra, count, xyz);
  } else {
    SumXyz<true>(weights, paper, spectra, count, xyz);
  }
}

void DensitiesFromSpectraImpl(const DensityWeights& weights, const Spectra& spectra,
                              std::size_t count, float* out) noexcept {
  std::size_t i = 0;
  for (; i + kLanes <= count; i += kLanes) {
    const auto sums = Accumulate<false, FourSums>(
        weights, nullptr, spectra.values + i * spectra.stride, spectra.stride);
    float* const rows = out + 4 * i;
    hn::StoreInterleaved4(sums.black, sums.cyan, sums.magenta, sums.yellow, kF, rows);
    for (std::size_t k = 0; k < 4 * kLanes; k += 4) {
      const Quadruple densities = DensitiesOfSums({rows[k], rows[k + 1], rows[k + 2], rows[k + 3]});
      std::copy(densities.begin(), densities.end(), rows + k);
    }
  }
  for (; i < count; ++i) {
    DensitiesOfRow(weights, spectra.values + i * spectra.stride, out + 4 * i);
  }
}

// --- L*a*b*

constexpr float kThird = 0.33333334F;

/// Cube roots, good to 2e-5, of normal numbers above 0.
HWY_INLINE F RoughRoot(F t) {
  const hn::RebindToSigned<Floats> integers;
  const F bits = hn::ConvertTo(kF, hn::BitCast(integers, t));
  const F third = hn::MulAdd(bits, hn::Set(kF, 1.0F / 3.0F), hn::Set(kF, 709921077.0F));
  const F y = hn::BitCast(kF, hn::ConvertTo(integers, third));
  const F cube = hn::Mul(hn::Mul(y, y), y);
  return hn::Mul(y, hn::Div(hn::Add(cube, hn::Add(t, t)), hn::Add(hn::Add(cube, cube), t)));
}

/// log2(t), good to 2e-4, of normal numbers above 0.
HWY_INLINE F RoughLog2(F t) {
  const hn::RebindToSigned<Floats> integers;
  const auto bits = hn::BitCast(integers, t);
  const F exponent = hn::ConvertTo(kF, hn::Sub(hn::ShiftRight<23>(bits), hn::Set(integers, 127)));
  const F m = hn::BitCast(
      kF, hn::Or(hn::And(bits, hn::Set(integers, 0x7FFFFF)), hn::Set(integers, 0x3F800000)));
  // The polynomial through the five Chebyshev nodes of [1, 2].
  F log = hn::Set(kF, -0.07844068F);
  log = hn::MulAdd(log, m, hn::Set(kF, 0.6260322F));
  log = hn::MulAdd(log, m, hn::Set(kF, -2.0783352F));
  log = hn::MulAdd(log, m, hn::Set(kF, 4.0292114F));
  log = hn::MulAdd(log, m, hn::Set(kF, -2.4983531F));
  return hn::Add(exponent, log);
}

/// A step of Halley's method from `y`, good to 2e-5, to the cube root of `t`.
HWY_INLINE D RefinedRoot(D t, D y) {
  const D cube = hn::Mul(hn::Mul(y, y), y);
  return hn::Mul(
      y, hn::Div(hn::MulAdd(hn::Set(kD, 2.0), t, cube), hn::MulAdd(hn::Set(kD, 2.0), cube, t)));
}

/// t to the power 0.33333334, the single-precision third; t is a normal number above 0.
///
/// The cube root times t^(kThird - 1/3), to 2^-38.  powf is allowed to be off by 1/256 of its last
/// place, which is more than twice what the C library of GNU reaches.
HWY_INLINE Interval PowerThird(F t) {
  constexpr double kExcess = static_cast<double>(kThird) - 1.0 / 3.0;
  constexpr double kTolerance = 1.0 / 2147483648.0;  // 2^-31
  const Wide wide = Widened(t);
  const Wide rough = Widened(RoughRoot(t));
  const Wide log2 = Widened(RoughLog2(t));
  const D per_log2 = hn::Set(kD, kExcess * std::numbers::ln2);
  const D one = hn::Set(kD, 1.0);
  const D lower =
      hn::Mul(RefinedRoot(wide.lower, rough.lower), hn::MulAdd(per_log2, log2.lower, one));
  const D upper =
      hn::Mul(RefinedRoot(wide.upper, rough.upper), hn::MulAdd(per_log2, log2.upper, one));
  const D below = hn::Set(kD, 1.0 - kTolerance);
  const D above = hn::Set(kD, 1.0 + kTolerance);
  return {Narrowed(hn::Mul(lower, below), hn::Mul(upper, below)),
          Narrowed(hn::Mul(lower, above), hn::Mul(upper, above))};
}

// The greatest float that as a double is not above 0.008856.
constexpr float kLinearUpTo = static_cast<double>(0.008856F) > 0.008856
                                  ? std::bit_cast<float>(std::bit_cast<std::uint32_t>(0.008856F) -
                                                         1)
                                  : 0.008856F;
// Far above it there is nothing to be measured, and nothing was tried.
constexpr float kPowerUpTo = 65536.0F;

HWY_INLINE F LabFunction(F t) {
  const FMask is_linear = hn::Not(hn::Gt(t, hn::Set(kF, kLinearUpTo)));
  const F linear = hn::Add(hn::Mul(hn::Set(kF, 7.787F), t), hn::Set(kF, 0.13793103F));
  const F safe = hn::IfThenElse(is_linear, hn::Set(kF, 1.0F), t);
  const Interval power = PowerThird(safe);
  const FMask is_doubtful = hn::Or(power.IsDoubtful(), hn::Gt(safe, hn::Set(kF, kPowerUpTo)));
  F result = hn::IfThenElse(is_linear, linear, power.low);
  if (HWY_UNLIKELY(!hn::AllFalse(kF, is_doubtful))) {
    HWY_ALIGN std::array<float, kLanes> from;
    HWY_ALIGN std::array<float, kLanes> to;
    hn::Store(t, kF, from.data());
    hn::Store(result, kF, to.data());
    ForEachLane(is_doubtful, [&](std::size_t lane) { to[lane] = std::pow(from[lane], kThird); });
    result = hn::Load(kF, to.data());
  }
  return result;
}

void LabFromXyzImpl(const Triple& white, const float* xyz, std::size_t count, float* lab) noexcept {
  const auto relative = [](F value, float y_white, float own_white) HWY_ATTR {
    return hn::Div(hn::Div(hn::Mul(value, hn::Set(kF, y_white)), hn::Set(kF, own_white)),
                   hn::Set(kF, 100.0F));
  };
  const auto run = [&](const float* in, float* out) HWY_ATTR {
    F x;
    F y;
    F z;
    hn::LoadInterleaved3(kF, in, x, y, z);
    const F fx = LabFunction(relative(x, white[1], white[0]));
    const F fy = LabFunction(relative(y, white[1], white[1]));
    const F fz = LabFunction(relative(z, white[1], white[2]));
    const F signed_l = hn::Sub(hn::Mul(hn::Set(kF, 116.0F), fy), hn::Set(kF, 16.0F));
    const F l = hn::IfThenElse(hn::Lt(signed_l, hn::Zero(kF)), hn::Zero(kF), signed_l);
    const F a = hn::Mul(hn::Sub(fx, fy), hn::Set(kF, 500.0F));
    const F b = hn::Mul(hn::Sub(fy, fz), hn::Set(kF, 200.0F));
    const FMask is_nan = hn::IsNaN(hn::Add(hn::Add(a, b), l));
    if (HWY_UNLIKELY(!hn::AllFalse(kF, is_nan))) {
      std::array<float, 3 * kLanes> former;
      std::copy_n(in, former.size(), former.begin());
      hn::StoreInterleaved3(l, a, b, kF, out);
      ForEachLane(is_nan, [&](std::size_t lane) {
        LabOfRow(white, former.data() + 3 * lane, out + 3 * lane);
      });
      return;
    }
    hn::StoreInterleaved3(l, a, b, kF, out);
  };
  OverRows<3, 3>(xyz, count, lab, run);
}

// --- Differences

struct Lab {
  F l;
  F a;
  F b;
};

HWY_INLINE Lab Load(const Colors& colors, std::size_t row) {
  Lab lab;
  if (colors.is_single) {
    lab = {hn::Set(kF, colors.values[0]), hn::Set(kF, colors.values[1]),
           hn::Set(kF, colors.values[2])};
  } else {
    hn::LoadInterleaved3(kF, colors.values + 3 * row, lab.l, lab.a, lab.b);
  }
  return lab;
}

HWY_INLINE F Squared(F v) {
  return hn::Mul(v, v);
}

HWY_INLINE F Chroma(const Lab& lab) {
  return hn::Sqrt(hn::Add(Squared(lab.a), Squared(lab.b)));
}

HWY_INLINE F SquaredDistance(const Lab& first, const Lab& second) {
  return hn::Add(hn::Add(Squared(hn::Sub(first.l, second.l)), Squared(hn::Sub(first.a, second.a))),
                 Squared(hn::Sub(first.b, second.b)));
}

/// Differences of lightness, chroma and hue, whose sign no formula looks at.
struct Delta {
  HWY_INLINE Delta(const Lab& first, const Lab& second, F first_chroma)
      : lightness(hn::Sub(first.l, second.l)), chroma(hn::Sub(first_chroma, Chroma(second))) {
    const F length = hn::Sqrt(SquaredDistance(first, second));
    hue = hn::Sqrt(hn::Abs(hn::Sub(hn::Sub(Squared(length), Squared(lightness)), Squared(chroma))));
  }

  F lightness;
  F chroma;
  F hue;
};

/// Runs a formula over pairs.  `run(first, second)` gives the interval of a vector of differences;
/// lanes in doubt are done by `redo(first, second)`.
template <class Run, class Redo>
HWY_INLINE void OverPairs(const Colors& first, const Colors& second, std::size_t count, float* out,
                          Run run, Redo redo) {
  std::size_t i = 0;
  for (; i + kLanes <= count; i += kLanes) {
    const Interval result = run(Load(first, i), Load(second, i));
    hn::StoreU(result.low, kF, out + i);
    ForEachLane(result.IsDoubtful(), [&](std::size_t lane) {
      out[i + lane] = redo(Row(first, i + lane), Row(second, i + lane));
    });
  }
  for (; i < count; ++i) {
    out[i] = redo(Row(first, i), Row(second, i));
  }
}

void DeltaE76Impl(const Colors& first, const Colors& second, std::size_t count,
                  float* out) noexcept {
  const auto run = [](const Lab& one, const Lab& other) HWY_ATTR {
    return Certain(hn::Sqrt(SquaredDistance(one, other)));
  };
  OverPairs(first, second, count, out, run, Internals::DeltaE76);
}

void DeltaE94Impl(const Colors& first, const Colors& second, const Triple& weights,
                  std::size_t count, float* out) noexcept {
  const auto run = [&](const Lab& one, const Lab& other) HWY_ATTR {
    const F chroma = Chroma(one);
    const Delta delta(one, other, chroma);
    const F unit = hn::Set(kF, 1.0F);
    const F sc = hn::Add(unit, hn::Mul(hn::Set(kF, 0.045F), chroma));
    const F sh = hn::Add(unit, hn::Mul(hn::Set(kF, 0.015F), chroma));
    const F l = hn::Div(delta.lightness, hn::Set(kF, weights[0]));
    const F c = hn::Div(delta.chroma, hn::Mul(hn::Set(kF, weights[1]), sc));
    const F h = hn::Div(delta.hue, hn::Mul(hn::Set(kF, weights[2]), sh));
    return Certain(hn::Sqrt(hn::Add(hn::Add(Squared(l), Squared(c)), Squared(h))));
  };
  OverPairs(first, second, count, out, run, [&](const Quadruple& one, const Quadruple& other) {
    return Internals::DeltaE94(one, other, weights);
  });
}

HWY_INLINE F Hues(const Lab& lab) {
  HWY_ALIGN std::array<float, kLanes> a;
  HWY_ALIGN std::array<float, kLanes> b;
  hn::Store(lab.a, kF, a.data());
  hn::Store(lab.b, kF, b.data());
  for (std::size_t lane = 0; lane < kLanes; ++lane) {
    a[lane] = HueOf(a[lane], b[lane]);
  }
  return hn::Load(kF, a.data());
}

/// `function` of numbers, NaN of NaN.  The emulated vectors convert a NaN to an integer on the way,
/// which C++ leaves undefined.
template <class Function>
HWY_INLINE D OfNumbers(Function function, D v) {
#if HWY_TARGET == HWY_EMU128
  const auto is_nan = hn::IsNaN(v);
  return hn::IfThenElse(is_nan, v, function(kD, hn::IfThenElse(is_nan, hn::Zero(kD), v)));
#else
  return function(kD, v);
#endif
}

HWY_INLINE D Sine(D v) {
  return OfNumbers([](auto d, D x) HWY_ATTR { return hn::Sin(d, x); }, v);
}

HWY_INLINE D Cosine(D v) {
  return OfNumbers([](auto d, D x) HWY_ATTR { return hn::Cos(d, x); }, v);
}

HWY_INLINE D Exponential(D v) {
  return OfNumbers([](auto d, D x) HWY_ATTR { return hn::Exp(d, x); }, v);
}

/// The wave of CMC in a half of the lanes: base + |amplitude · cos|.
HWY_INLINE D CmcWave(D doubled_degrees, D base, D amplitude) {
  const D angle = hn::Mul(doubled_degrees, hn::Set(kD, std::numbers::pi / 360.0));
  return hn::Add(base, hn::Abs(hn::Mul(amplitude, Cosine(angle))));
}

void DeltaECmcImpl(const Colors& first, const Colors& second, float weight_l, float weight_c,
                   std::size_t count, float* out) noexcept {
  const auto run = [=](const Lab& one, const Lab& other) HWY_ATTR {
    const auto set = [](float value) HWY_ATTR {
      return hn::Set(kF, value);
    };
    const F unit = set(1.0F);
    const F chroma = Chroma(one);
    const F hue = Hues(one);
    const Delta delta(one, other, chroma);
    const F sl = hn::IfThenElse(
        hn::Gt(one.l, set(16.0F)),
        hn::Div(hn::Mul(set(0.040975F), one.l), hn::Add(unit, hn::Mul(set(0.01765F), one.l))),
        set(0.511F));
    const F sc = hn::Add(
        hn::Div(hn::Mul(set(0.0638F), chroma), hn::Add(unit, hn::Mul(set(0.0131F), chroma))),
        set(0.638F));
    const F chroma4 = Squared(Squared(chroma));
    const F f = hn::Sqrt(hn::Div(chroma4, hn::Add(chroma4, set(1900.0F))));
    const FMask is_blue_side = hn::And(hn::Ge(hue, set(164.0F)), hn::Le(hue, set(345.0F)));
    const F shift = hn::IfThenElse(is_blue_side, set(168.0F), set(35.0F));
    const Wide doubled = Widened(hn::Mul(hn::Add(shift, hue), set(2.0F)));
    const Wide amplitude = Widened(hn::IfThenElse(is_blue_side, set(0.2F), set(0.4F)));
    // 0.56 and 0.36 are double; the small rest on top of the single ones brings them there.
    const auto base = [](D of_amplitude) HWY_ATTR {
      return hn::IfThenElse(hn::Lt(of_amplitude, hn::Set(kD, 0.3)), hn::Set(kD, 0.56),
                            hn::Set(kD, 0.36));
    };
    const D lower = CmcWave(doubled.lower, base(amplitude.lower), amplitude.lower);
    const D upper = CmcWave(doubled.upper, base(amplitude.upper), amplitude.upper);
    const D error = hn::Set(kD, 1e-13);
    const Interval t = {Narrowed(hn::Sub(lower, error), hn::Sub(upper, error)),
                        Narrowed(hn::Add(lower, error), hn::Add(upper, error))};
    const F sh = hn::Mul(hn::Sub(hn::Add(hn::Mul(f, t.low), unit), f), sc);
    const F l = hn::Div(delta.lightness, hn::Mul(set(weight_l), sl));
    const F c = hn::Div(delta.chroma, hn::Mul(set(weight_c), sc));
    const F result =
        hn::Sqrt(hn::Add(hn::Add(Squared(l), Squared(c)), Squared(hn::Div(delta.hue, sh))));
    return Interval{result, hn::IfThenElse(t.IsDoubtful(), hn::NaN(kF), result)};
  };
  OverPairs(first, second, count, out, run, [=](const Quadruple& one, const Quadruple& other) {
    return Internals::DeltaECmc(one, other, weight_l, weight_c);
  });
}

HWY_INLINE D SquaredD(D v) {
  return hn::Mul(v, v);
}

/// Radians from -pi to pi; 0 for (0, 0).
HWY_INLINE D Angle(D y, D x) {
  const D ax = hn::Abs(x);
  const D ay = hn::Abs(y);
  const D greater = hn::Max(ax, ay);
  const auto is_origin = hn::Eq(greater, hn::Zero(kD));
  const D slope = hn::Div(hn::Min(ax, ay), hn::IfThenElse(is_origin, hn::Set(kD, 1.0), greater));
  D angle = hn::Atan(kD, slope);
  angle =
      hn::IfThenElse(hn::Gt(ay, ax), hn::Sub(hn::Set(kD, std::numbers::pi / 2.0), angle), angle);
  angle =
      hn::IfThenElse(hn::Lt(x, hn::Zero(kD)), hn::Sub(hn::Set(kD, std::numbers::pi), angle), angle);
  return hn::CopySign(angle, y);
}

/// sqrt(c^7 / (c^7 + 25^7))
HWY_INLINE D ChromaShare(D chroma) {
  const D square = SquaredD(chroma);
  const D power = hn::Mul(hn::Mul(SquaredD(square), square), chroma);
  return hn::Sqrt(hn::Div(power, hn::Add(power, hn::Set(kD, 6103515625.0))));
}

struct LabD {
  D l;
  D a;
  D b;
  D chroma;
};

/// The square of the difference and a bound of its error.
struct Bounded {
  D square;
  D error;
};

HWY_INLINE Bounded SquareOf2000(const LabD& first, const LabD& second, D delta_l,
                                const std::array<double, 3>& weights) {
  const auto set = [](double value) HWY_ATTR {
    return hn::Set(kD, value);
  };
  const D zero = hn::Zero(kD);
  const D half = set(0.5);
  const D unit = set(1.0);
  const D mean_chroma = hn::Mul(hn::Add(first.chroma, second.chroma), half);
  const D stretch = hn::Add(unit, hn::Mul(hn::Sub(unit, ChromaShare(mean_chroma)), half));
  const D a1 = hn::Mul(stretch, first.a);
  const D a2 = hn::Mul(stretch, second.a);
  const D c1 = hn::Sqrt(hn::MulAdd(a1, a1, SquaredD(first.b)));
  const D c2 = hn::Sqrt(hn::MulAdd(a2, a2, SquaredD(second.b)));
  const D turn = set(2.0 * std::numbers::pi);
  const auto hue = [&](D b, D a) HWY_ATTR {
    const D angle = Angle(b, a);
    return hn::IfThenElse(hn::Lt(angle, zero), hn::Add(angle, turn), angle);
  };
  const D h1 = hue(first.b, a1);
  const D h2 = hue(second.b, a2);
  // From -2 pi to 2 pi, then brought to half a turn.
  const D apart = hn::Sub(h2, h1);
  const D pi = set(std::numbers::pi);
  const auto is_over = hn::Gt(hn::Abs(apart), pi);
  const D delta_h = hn::IfThenElse(is_over, hn::Sub(apart, hn::CopySign(turn, apart)), apart);
  // The mean, half a turn further if the short way leads over 0.
  const D h = hn::Add(hn::Mul(hn::Add(h1, h2), half), hn::IfThenElse(is_over, pi, zero));

  const D dh = hn::Mul(hn::Mul(set(2.0), hn::Sqrt(hn::Mul(c1, c2))), Sine(hn::Mul(delta_h, half)));
  const D mean = hn::Mul(hn::Add(c1, c2), half);

  // The four waves from one sine and cosine.
  const D s = Sine(h);
  const D c = Cosine(h);
  const D s_2 = hn::Mul(set(2.0), hn::Mul(s, c));
  const D c_2 = hn::MulSub(hn::Mul(set(2.0), c), c, unit);
  const D s_3 = hn::MulAdd(s_2, c, hn::Mul(c_2, s));
  const D c_3 = hn::MulSub(c_2, c, hn::Mul(s_2, s));
  const D s_4 = hn::Mul(set(2.0), hn::Mul(s_2, c_2));
  const D c_4 = hn::MulSub(hn::Mul(set(2.0), c_2), c_2, unit);
  constexpr double kCos30 = 0.86602540378443864676;
  constexpr double kCos6 = 0.99452189536827333692;
  constexpr double kSin6 = 0.10452846326765347140;
  constexpr double kCos63 = 0.45399049973954679156;
  constexpr double kSin63 = 0.89100652418836786236;
  D t = hn::MulAdd(set(-0.17 * kCos30), c, unit);
  t = hn::MulAdd(set(-0.17 * 0.5), s, t);
  t = hn::MulAdd(set(0.24), c_2, t);
  t = hn::MulAdd(set(0.32 * kCos6), c_3, t);
  t = hn::MulAdd(set(-0.32 * kSin6), s_3, t);
  t = hn::MulAdd(set(-0.2 * kCos63), c_4, t);
  t = hn::MulAdd(set(-0.2 * kSin63), s_4, t);

  const D l = hn::Mul(hn::Add(first.l, second.l), half);
  const D from_grey = SquaredD(hn::Sub(l, set(50.0)));
  const D sl = hn::Add(
      unit, hn::Div(hn::Mul(set(0.015), from_grey), hn::Sqrt(hn::Add(set(20.0), from_grey))));
  const D sc = hn::MulAdd(set(0.045), mean, unit);
  const D sh = hn::MulAdd(hn::Mul(set(0.015), mean), t, unit);
  constexpr double kDegrees = 180.0 / std::numbers::pi;
  const D from_blue = hn::Mul(hn::MulSub(h, set(kDegrees), set(275.0)), set(1.0 / 25.0));
  const D theta = hn::Mul(set(60.0 / kDegrees), Exponential(hn::Neg(SquaredD(from_blue))));
  const D rt = hn::Mul(hn::Neg(Sine(theta)), hn::Mul(set(2.0), ChromaShare(mean)));
  const D x = hn::Div(delta_l, hn::Mul(set(weights[0]), sl));
  const D y = hn::Div(hn::Sub(c2, c1), hn::Mul(set(weights[1]), sc));
  const D z = hn::Div(dh, hn::Mul(set(weights[2]), sh));
  const D squares = hn::MulAdd(z, z, hn::MulAdd(y, y, SquaredD(x)));
  const D square = hn::MulAdd(hn::Mul(rt, y), z, squares);

  // y and z are off by some 1e-15 of the chroma over their weights, also where they are 0 or the
  // scalar formula's are; all taken ten times as much and more.  Beside the jump at half a turn
  // nothing is certain.
  const D off = hn::Div(hn::Mul(set(1e-13), mean),
                        set(std::min({1.0, std::abs(weights[1]), std::abs(weights[2])})));
  const D by_chroma = hn::Mul(off, hn::Add(hn::Add(hn::Abs(y), hn::Abs(z)), off));
  const D by_size = hn::Mul(set(1e-12), squares);
  const auto is_at_jump = hn::Lt(hn::Abs(hn::Sub(hn::Abs(apart), pi)), set(1e-9));
  return {square, hn::IfThenElse(is_at_jump, set(1e300), hn::Add(by_chroma, by_size))};
}

void DeltaE2000Impl(const Colors& first, const Colors& second, const Triple& weights,
                    std::size_t count, float* out) noexcept {
  const std::array<double, 3> wide_weights = {static_cast<double>(weights[0]),
                                              static_cast<double>(weights[1]),
                                              static_cast<double>(weights[2])};
  const auto run = [&](const Lab& one, const Lab& other) HWY_ATTR {
    const Wide l1 = Widened(one.l);
    const Wide a1 = Widened(one.a);
    const Wide b1 = Widened(one.b);
    const Wide c1 = Widened(Chroma(one));
    const Wide l2 = Widened(other.l);
    const Wide a2 = Widened(other.a);
    const Wide b2 = Widened(other.b);
    const Wide c2 = Widened(Chroma(other));
    const Wide dl = Widened(hn::Sub(one.l, other.l));
    const Bounded lower =
        SquareOf2000({l1.lower, a1.lower, b1.lower, c1.lower},
                     {l2.lower, a2.lower, b2.lower, c2.lower}, dl.lower, wide_weights);
    const Bounded upper =
        SquareOf2000({l1.upper, a1.upper, b1.upper, c1.upper},
                     {l2.upper, a2.upper, b2.upper, c2.upper}, dl.upper, wide_weights);
    const auto low = [](const Bounded& b) HWY_ATTR {
      return hn::Sqrt(hn::Sub(b.square, b.error));
    };
    const auto high = [](const Bounded& b) HWY_ATTR {
      return hn::Sqrt(hn::Add(b.square, b.error));
    };
    const Interval difference = {Narrowed(low(lower), low(upper)),
                                 Narrowed(high(lower), high(upper))};
    // Equal colours differ by 0, whatever the bound says.
    const FMask is_equal =
        hn::And(hn::Eq(one.l, other.l), hn::And(hn::Eq(one.a, other.a), hn::Eq(one.b, other.b)));
    const FMask is_number = hn::Eq(hn::Sub(difference.high, difference.high), hn::Zero(kF));
    const FMask is_zero = hn::And(is_equal, is_number);
    return Interval{hn::IfThenZeroElse(is_zero, difference.low),
                    hn::IfThenZeroElse(is_zero, difference.high)};
  };
  OverPairs(first, second, count, out, run, [&](const Quadruple& one, const Quadruple& other) {
    return Internals::DeltaE2000(one, other, weights);
  });
}

#endif  // HWY_SCALAR

constexpr Kernels kKernels = {
    &XyzFromSpectraImpl, &DensitiesFromSpectraImpl, &LabFromXyzImpl, &DeltaE76Impl, &DeltaE94Impl,
    &DeltaECmcImpl,      &DeltaE2000Impl,
};

}  // namespace
}  // namespace Aldermoor::Tristim::Internals::Batch::HWY_NAMESPACE
HWY_AFTER_NAMESPACE();

#if HWY_ONCE

namespace Aldermoor::Tristim::Internals::Batch {
namespace {

struct Compiled {
  InstructionSet set;
  const Kernels* kernels;
};

// The widest first.
constexpr Compiled kCompiled[] = {
#if HWY_TARGETS & HWY_AVX3
    {InstructionSet::kAvx512, &N_AVX3::kKernels},
#endif
#if HWY_TARGETS & HWY_AVX2
    {InstructionSet::kAvx2, &N_AVX2::kKernels},
#endif
#if HWY_TARGETS & HWY_SSE4
    {InstructionSet::kSse4, &N_SSE4::kKernels},
#endif
#if HWY_TARGETS & HWY_SSSE3
    {InstructionSet::kSsse3, &N_SSSE3::kKernels},
#endif
    {InstructionSet::kBaseline, &HWY_STATIC_DISPATCH(kKernels)},
};

std::atomic<const Kernels*> in_use = nullptr;

const Kernels& Use(const Kernels& kernels) noexcept {
  in_use.store(&kernels, std::memory_order_relaxed);  // a constant: there is nothing to wait for
  return kernels;
}

const Kernels& InUse() noexcept {
  const Kernels* const kernels = in_use.load(std::memory_order_relaxed);
  if (HWY_LIKELY(kernels != nullptr)) {
    return *kernels;
  }
  const Compiled* const widest =
      std::find_if(std::begin(kCompiled), std::end(kCompiled) - 1,
                   [](const Compiled& compiled) { return IsOfProcessor(compiled.set); });
  return Use(*widest->kernels);
}

}  // namespace

bool UseInstructionSet(InstructionSet set) noexcept {
  for (const Compiled& compiled : kCompiled) {
    if (compiled.set == set && IsOfProcessor(set)) {
      Use(*compiled.kernels);
      return true;
    }
  }
  return false;
}

void XyzFromSpectra(const AxisWeights& weights, const float* paper, const Spectra& spectra,
                    std::size_t count, float* xyz) noexcept {
  InUse().xyz_from_spectra(weights, paper, spectra, count, xyz);
}

void DensitiesFromSpectra(const DensityWeights& weights, const Spectra& spectra, std::size_t count,
                          float* densities) noexcept {
  InUse().densities_from_spectra(weights, spectra, count, densities);
}

void LabFromXyz(const Triple& white, const float* xyz, std::size_t count, float* lab) noexcept {
  InUse().lab_from_xyz(white, xyz, count, lab);
}

void DeltaE76(const Colors& first, const Colors& second, std::size_t count,
              float* differences) noexcept {
  InUse().delta_e_76(first, second, count, differences);
}

void DeltaE94(const Colors& first, const Colors& second, const Triple& weights, std::size_t count,
              float* differences) noexcept {
  InUse().delta_e_94(first, second, weights, count, differences);
}

void DeltaECmc(const Colors& first, const Colors& second, float l, float c, std::size_t count,
               float* differences) noexcept {
  InUse().delta_e_cmc(first, second, l, c, count, differences);
}

void DeltaE2000(const Colors& first, const Colors& second, const Triple& weights, std::size_t count,
                float* differences) noexcept {
  InUse().delta_e_2000(first, second, weights, count, differences);
}

}  // namespace Aldermoor::Tristim::Internals::Batch

#endif  // HWY_ONCE
