// The differences and judgements of TristimCalculator; its colour spaces are in
// tristimcalculator.cpp.

#include <algorithm>
#include <cmath>
#include <cstddef>

#include "aldermoor/tristim/internals/deltaemath.h"
#include "aldermoor/tristim/internals/hxxyz.h"
#include "aldermoor/tristim/internals/tristimcalculator.h"
#include "aldermoor/tristim/internals/tristimfilter.h"
#include "aldermoor/utilities/exceptions/frame.h"

namespace Aldermoor::Tristim::Internals {
namespace {

constexpr int kNoFamily = -1;

using FromSpectrum = bool (*)(const HXSpectrum& spectrum, const HXMeasureConditions& conditions,
                              HXColorVector& out);

/// `difference` of the colours of two spectra.
template <FromSpectrum kColor, class Difference>
float OfSpectra(const HXSpectrum& first, const HXSpectrum& second,
                const HXMeasureConditions& conditions, Difference difference) {
  HXColorVector one;
  HXColorVector other;
  if (!kColor(first, conditions, one) || !kColor(second, conditions, other)) {
    return kNoDeltaE;
  }
  return difference(one.GetChannels(), other.GetChannels());
}

Triple TripleOf(const Quadruple& channels) {
  return {channels[0], channels[1], channels[2]};
}

}  // namespace

float TristimCalculator::GetDeltaE_CIELAB(const HXSpectrum& first, const HXSpectrum& second,
                                          const HXMeasureConditions& conditions) try {
  return OfSpectra<&TristimCalculator::GetVector_CIELab>(first, second, conditions, DeltaE76);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetDeltaE_CIELAB)

float TristimCalculator::GetDeltaE_CIELUV(const HXSpectrum& first, const HXSpectrum& second,
                                          const HXMeasureConditions& conditions) try {
  return OfSpectra<&TristimCalculator::GetVector_CIELuv>(first, second, conditions, DeltaE76);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetDeltaE_CIELUV)

float TristimCalculator::GetDeltaE_hx(const HXSpectrum& first, const HXSpectrum& second,
                                      const HXMeasureConditions& conditions) try {
  return OfSpectra<&TristimCalculator::GetVector_LABhx>(first, second, conditions, DeltaE76);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetDeltaE_hx)

float TristimCalculator::GetDeltaE_FMCII(const HXSpectrum& first, const HXSpectrum& second,
                                         const HXMeasureConditions& conditions) try {
  return OfSpectra<&TristimCalculator::GetVector_CIEXYZ>(
      first, second, conditions, [](const Quadruple& one, const Quadruple& other) {
        return DeltaEFmc2(TripleOf(one), TripleOf(other));
      });
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetDeltaE_FMCII)

float TristimCalculator::GetDeltaE_CMC(const HXSpectrum& first, const HXSpectrum& second,
                                       const HXMeasureConditions& conditions, float l,
                                       float c) try {
  return OfSpectra<&TristimCalculator::GetVector_CIELab>(
      first, second, conditions,
      [l, c](const Quadruple& one, const Quadruple& other) { return DeltaECmc(one, other, l, c); });
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetDeltaE_CMC)

float TristimCalculator::GetDeltaE_94(const HXSpectrum& first, const HXSpectrum& second,
                                      const HXMeasureConditions& conditions, float kL, float kC,
                                      float kH) try {
  return OfSpectra<&TristimCalculator::GetVector_CIELab>(
      first, second, conditions, [&](const Quadruple& one, const Quadruple& other) {
        return DeltaE94(one, other, {kL, kC, kH});
      });
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetDeltaE_94)

float TristimCalculator::GetDeltaE_2000(const HXSpectrum& first, const HXSpectrum& second,
                                        const HXMeasureConditions& conditions, float kL, float kC,
                                        float kH) try {
  return OfSpectra<&TristimCalculator::GetVector_CIELab>(
      first, second, conditions, [&](const Quadruple& one, const Quadruple& other) {
        return DeltaE2000(one, other, {kL, kC, kH});
      });
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetDeltaE_2000)

float TristimCalculator::GetDeltaE_CIELAB(const HXLab& first, const HXLab& second) {
  return DeltaE76(first.GetChannels(), second.GetChannels());
}

float TristimCalculator::GetDeltaE_CMC(const HXLab& first, const HXLab& second, float l, float c) {
  return DeltaECmc(first.GetChannels(), second.GetChannels(), l, c);
}

float TristimCalculator::GetDeltaE_94(const HXLab& first, const HXLab& second, float kL, float kC,
                                      float kH) {
  return DeltaE94(first.GetChannels(), second.GetChannels(), {kL, kC, kH});
}

float TristimCalculator::GetDeltaE_2000(const HXLab& first, const HXLab& second, float kL, float kC,
                                        float kH) {
  return DeltaE2000(first.GetChannels(), second.GetChannels(), {kL, kC, kH});
}

float TristimCalculator::GetDeltaE_CIELAB_SpeedOptimized(const HXLab& lab,
                                                         const float* spectrum) try {
  const HXMeasureConditions& conditions = lab.GetMeasureConditions();
  HXSpectrum::Bands relative;
  const float* values = spectrum;
  if (conditions.GetWhiteBase() == WhiteBase::Paper) {
    std::copy_n(spectrum, relative.size(), relative.begin());
    (void)GetSpecBasedToPapWhite(conditions, relative.data());
    values = relative.data();
  }
  const TristimFilter& filter = TristimFilter::Get();
  const Triple xyz = XyzFromSpectrum({filter[0], filter[1], filter[2]}, values);
  Triple f;
  for (unsigned short i = 0; i < 3; ++i) {
    const double t =
        static_cast<double>(xyz[i] * filter.GetFilterSum(1) / filter.GetFilterSum(i)) / 100.0;
    f[i] = t > 0.008856 ? std::pow(static_cast<float>(t), 0.33333334F)
                        : static_cast<float>(t * 7.787 + 0.13793103448275862);
  }
  const Quadruple color = {116.0F * f[1] - 16.0F, (f[0] - f[1]) * 500.0F, (f[1] - f[2]) * 200.0F,
                           0.0F};
  return DeltaE76(color, lab.GetChannels());
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetDeltaE_CIELAB_SpeedOptimized)

int TristimCalculator::GetColorType(const HXSpectrum& spectrum) try {
  HXLab lab;
  if (!GetVector_CIELab(spectrum, spectrum.GetMeasureConditions(), lab)) {
    return kNoFamily;
  }
  return ColorFamily(TripleOf(lab.GetChannels()));
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetColorType)

float TristimCalculator::GetMetamery(const HXSpectrum& first, const HXSpectrum& second,
                                     const HXMeasureConditions& conditions,
                                     const HXIllumination& illumination) try {
  HXXYZ one;
  HXXYZ other;
  if (!GetVector_CIEXYZ(first, conditions, one) || !GetVector_CIEXYZ(second, conditions, other)) {
    return kNoDeltaE;
  }
  HXColorVector factor;
  for (short i = 0; i < 3; ++i) {
    factor[i] = other[i] == 0.0F ? 1.0F : one[i] / other[i];
  }
  HXMeasureConditions test = conditions;
  test.SetIllumination(illumination);
  if (!GetVector_CIEXYZ(first, test, one) || !GetVector_CIEXYZ(second, test, other)) {
    return kNoDeltaE;
  }
  other *= factor;
  HXLab lab_one;
  HXLab lab_other;
  if (!GetVector_CIELab(one, lab_one) || !GetVector_CIELab(other, lab_other)) {
    return kNoDeltaE;
  }
  return GetDeltaE_CIELAB(lab_one, lab_other);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetMetamery)

}  // namespace Aldermoor::Tristim::Internals
