#include "aldermoor/tristim/internals/tristimcalculator.h"

#include <numbers>

#include "aldermoor/tristim/internals/colormath.h"
#include "aldermoor/tristim/internals/hxlab.h"
#include "aldermoor/tristim/internals/hxlch.h"
#include "aldermoor/tristim/internals/hxxyz.h"
#include "aldermoor/tristim/internals/tristimfilter.h"
#include "aldermoor/tristim/internals/vocabulary.h"
#include "aldermoor/utilities/exceptions/frame.h"

namespace Aldermoor::Tristim::Internals {
namespace {

namespace Words = Vocabulary;

using std::numbers::pi;

Triple TripleOf(const HXColorVector& vector) {
  return {vector[0], vector[1], vector[2]};
}

void Assign(const Triple& values, HXColorVector& out) {
  out[0] = values[0];
  out[1] = values[1];
  out[2] = values[2];
}

Triple CurrentWhite() {
  const TristimFilter& filter = TristimFilter::Get();
  return {filter.GetFilterSum(0), filter.GetFilterSum(1), filter.GetFilterSum(2)};
}

void SetColorSpace(const char* color_space, HXColorVector& vector) {
  HXMeasureConditions conditions = vector.GetMeasureConditions();
  conditions.SetMeasureCondition(Words::kColorSpaceKey, color_space);
  vector.SetMeasureConditions(conditions);
}

/// Sets what the values of the fixed conversions from and to RGB refer to.
void SetFixedWhite(const char* color_space, HXColorVector& vector) {
  HXMeasureConditions conditions = vector.GetMeasureConditions();
  conditions.SetMeasureCondition(Words::kColorSpaceKey, color_space);
  conditions.SetMeasureCondition(Words::kIlluminationKey, "D50");
  conditions.SetMeasureCondition(Words::kObserverKey, "TwoDegree");
  conditions.SetMeasureCondition(Words::kWhiteBaseKey, "Absolute");
  vector.SetMeasureConditions(conditions);
}

/// XYZ of 36 bare values under conditions in which everything is decided.
void Weigh(const float* values, const HXMeasureConditions& physical,
           const HXMeasureConditions& conditions, HXColorVector& out) {
  TristimFilter& filter = TristimFilter::Get();
  filter.SetMeasuringConditions(conditions);
  out.SetMeasureConditions(physical, conditions);
  Assign(XyzFromSpectrum({filter[0], filter[1], filter[2]}, values), out);
}

HXSpectrum AlmostBlack(const HXMeasureConditions& conditions) {
  HXSpectrum::Bands values;
  values.fill(kAlmostBlack);
  return HXSpectrum(values.data(), conditions);
}

}  // namespace

bool TristimCalculator::GetVector_CIEXYZ(const HXSpectrum& spectrum,
                                         const HXMeasureConditions& conditions,
                                         HXColorVector& out) try {
  const HXMeasureConditions& own = spectrum.GetMeasureConditions();
  if (own.GetIllumination().GetIlluminationType() == IlluminationType::kEmission) {
    HXMeasureConditions emission = conditions;
    emission.SetIllumination(HXIllumination(IlluminationType::kEmission));
    Weigh(spectrum.GetBands().data(), own, emission, out);
    return true;
  }
  if (conditions.GetWhiteBase() != WhiteBase::Paper) {
    Weigh(spectrum.GetBands().data(), own, conditions, out);
    return true;
  }
  HXSpectrum::Bands relative = spectrum.GetBands();
  if (!GetSpecBasedToPapWhite(own, relative.data())) {
    return false;
  }
  Weigh(relative.data(), own, conditions, out);
  return true;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetVector_CIEXYZ)

bool TristimCalculator::GetVector_CIELab(const HXSpectrum& spectrum,
                                         const HXMeasureConditions& conditions,
                                         HXColorVector& out) try {
  HXXYZ xyz;
  return GetVector_CIEXYZ(spectrum, conditions, xyz) && GetVector_CIELab(xyz, out);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetVector_CIELab)

bool TristimCalculator::GetVector_CIELCh_ab(const HXSpectrum& spectrum,
                                            const HXMeasureConditions& conditions,
                                            HXColorVector& out) try {
  HXLab lab;
  return GetVector_CIELab(spectrum, conditions, lab) && GetVector_CIELCh_ab(lab, out);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetVector_CIELCh_ab)

bool TristimCalculator::GetVector_CIExyY(const HXSpectrum& spectrum,
                                         const HXMeasureConditions& conditions,
                                         HXColorVector& out) try {
  HXXYZ xyz;
  return GetVector_CIEXYZ(spectrum, conditions, xyz) && GetVector_CIExyY(xyz, out);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetVector_CIExyY)

bool TristimCalculator::GetVector_CIELuv(const HXSpectrum& spectrum,
                                         const HXMeasureConditions& conditions,
                                         HXColorVector& out) try {
  HXXYZ xyz;
  HXLab lab;
  if (!GetVector_CIEXYZ(spectrum, conditions, xyz) || !GetVector_CIELab(xyz, lab)) {
    return false;
  }
  HXXYZ visible = xyz;
  if (UvDivisor(TripleOf(xyz)) == 0.0F &&
      !GetVector_CIEXYZ(AlmostBlack(xyz.GetMeasureConditions()), conditions, visible)) {
    return false;
  }
  out.SetMeasureConditions(xyz.GetMeasureConditions());
  Assign(LuvFromXyz(lab[0], TripleOf(visible)), out);
  return true;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetVector_CIELuv)

bool TristimCalculator::GetVector_CIELCh_uv(const HXSpectrum& spectrum,
                                            const HXMeasureConditions& conditions,
                                            HXColorVector& out) try {
  HXColorVector luv;
  return GetVector_CIELuv(spectrum, conditions, luv) && GetVector_CIELCh_ab(luv, out);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetVector_CIELCh_uv)

bool TristimCalculator::GetVector_HunterLab(const HXSpectrum& spectrum,
                                            const HXMeasureConditions& conditions,
                                            HXColorVector& out) try {
  HXXYZ xyz;
  HXXYZ white;
  if (!GetVector_CIEXYZ(spectrum, conditions, xyz) || !GetNormValence(conditions, white)) {
    return false;
  }
  out.SetMeasureConditions(xyz.GetMeasureConditions());
  Assign(HunterLabFromXyz(TripleOf(xyz), TripleOf(white)), out);
  return true;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetVector_HunterLab)

bool TristimCalculator::GetVector_RxRyRz(const HXSpectrum& spectrum,
                                         const HXMeasureConditions& conditions,
                                         HXColorVector& out) try {
  HXXYZ xyz;
  HXXYZ white;
  if (!GetVector_CIEXYZ(spectrum, conditions, xyz) || !GetNormValence(conditions, white)) {
    return false;
  }
  out.SetMeasureConditions(xyz.GetMeasureConditions());
  // The weights are those of the white, which for an emission are not those of the spectrum.
  const float share = ShortWaveShare(TristimFilter::Get()[0]);
  Assign(RxRyRzFromXyz(TripleOf(xyz), TripleOf(white), share), out);
  return true;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetVector_RxRyRz)

bool TristimCalculator::GetVector_LCHhx(const HXSpectrum& spectrum,
                                        const HXMeasureConditions& conditions,
                                        HXColorVector& out) try {
  HXLCh lch;
  if (!GetVector_CIELCh_ab(spectrum, conditions, lch)) {
    return false;
  }
  out.SetMeasureConditions(lch.GetMeasureConditions());
  Assign(LchHxFromLch(TripleOf(lch)), out);
  return true;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetVector_LCHhx)

bool TristimCalculator::GetVector_LABhx(const HXSpectrum& spectrum,
                                        const HXMeasureConditions& conditions,
                                        HXColorVector& out) try {
  HXLCh lch;
  if (!GetVector_LCHhx(spectrum, conditions, lch)) {
    return false;
  }
  out.SetMeasureConditions(lch.GetMeasureConditions());
  Assign(LabHxFromLchHx(TripleOf(lch)), out);
  return true;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetVector_LABhx)

bool TristimCalculator::GetVector_RGB(const HXSpectrum& spectrum,
                                      const HXMeasureConditions& conditions,
                                      HXColorVector& out) try {
  HXMeasureConditions as_lab = conditions;
  as_lab.SetMeasureCondition(Words::kColorSpaceKey, Words::kCIELab);
  HXLab lab;
  return GetVector_CIELab(spectrum, as_lab, lab) && GetVector_CIELab_RGB(lab, out);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetVector_RGB)

bool TristimCalculator::GetVector_CIELab(const HXColorVector& xyz, HXColorVector& out) try {
  TristimFilter::Get().SetMeasuringConditions(xyz.GetMeasureConditions());
  out.SetMeasureConditions(xyz.GetMeasureConditions());
  Assign(LabFromXyz(TripleOf(xyz), CurrentWhite()), out);
  return true;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetVector_CIELab)

bool TristimCalculator::GetVector_CIEXYZ(const HXColorVector& lab, HXColorVector& out) try {
  TristimFilter::Get().SetMeasuringConditions(lab.GetMeasureConditions());
  out.SetMeasureConditions(lab.GetMeasureConditions());
  Assign(XyzFromLab(TripleOf(lab), CurrentWhite()), out);
  return true;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetVector_CIEXYZ)

bool TristimCalculator::GetVector_CIELCh_ab(const HXColorVector& in, HXColorVector& out) try {
  out.SetMeasureConditions(in.GetMeasureConditions());
  Assign(PolarFromRectangular(TripleOf(in)), out);
  return true;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetVector_CIELCh_ab)

bool TristimCalculator::GetVector_CIExyY(const HXColorVector& xyz, HXColorVector& out) try {
  const Triple values = TripleOf(xyz);
  HXXYZ visible = xyz;
  if (values[0] + values[1] + values[2] == 0.0F) {
    const HXMeasureConditions& conditions = xyz.GetMeasureConditions();
    if (!GetVector_CIEXYZ(AlmostBlack(conditions), conditions, visible)) {
      return false;
    }
  }
  out.SetMeasureConditions(xyz.GetMeasureConditions());
  const Triple chromaticity = XyYFromXyz(TripleOf(visible));
  Assign({chromaticity[0], chromaticity[1], values[1]}, out);
  return true;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetVector_CIExyY)

bool TristimCalculator::GetVector_CIEuvY1976(const HXColorVector& in, HXColorVector& out) try {
  const bool is_xyz = in.GetMeasureConditions().GetColorSpace() == Words::kCIEXYZ;
  if (!is_xyz && in.GetMeasureConditions().GetColorSpace() != Words::kCIExyY) {
    return false;
  }
  const Triple values = TripleOf(in);
  out.SetMeasureConditions(in.GetMeasureConditions());
  SetColorSpace(Words::kCIEuvY1976, out);
  Assign(is_xyz ? UvY1976FromXyz(values) : UvY1976FromXyY(values), out);
  return true;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetVector_CIEuvY1976)

bool TristimCalculator::GetVector_CIEuvY1960(const HXColorVector& in, HXColorVector& out) try {
  if (!GetVector_CIEuvY1976(in, out)) {
    return false;
  }
  SetColorSpace(Words::kCIEuvY1960, out);
  Assign(UvY1960FromUvY1976(TripleOf(out)), out);
  return true;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetVector_CIEuvY1960)

bool TristimCalculator::GetVector_CIELab_RGB(const HXColorVector& lab, HXColorVector& out) try {
  HXXYZ xyz;
  if (!GetVector_CIEXYZ(lab, xyz)) {
    return false;
  }
  Assign(RgbFromXyz(TripleOf(xyz)), out);
  SetColorSpace(Words::kRGB, out);
  return true;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetVector_CIELab_RGB)

bool TristimCalculator::GetVector_RGB_CIEXYZ(const HXColorVector& rgb, HXColorVector& out) try {
  Assign(XyzFromRgb(TripleOf(rgb)), out);
  SetFixedWhite(Words::kCIEXYZ, out);
  return true;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetVector_RGB_CIEXYZ)

bool TristimCalculator::GetVector_CMYK_RGB(const HXColorVector& cmyk, HXColorVector& out) try {
  Assign(RgbFromCmyk(cmyk.GetChannels()), out);
  SetFixedWhite(Words::kRGB, out);
  return true;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetVector_CMYK_RGB)

bool TristimCalculator::GetVector_DeltaCIELCH_ab(const HXColorVector& first,
                                                 const HXColorVector& second,
                                                 HXColorVector& out) try {
  const Triple delta = DeltaLch(first.GetChannels(), second.GetChannels());
  out.SetMeasureConditions(first.GetMeasureConditions());
  Assign(delta, out);
  return true;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetVector_DeltaCIELCH_ab)

bool TristimCalculator::GetVector_CIELCH_uv(const HXColorVector& first, const HXColorVector& second,
                                            HXColorVector& out) try {
  return GetVector_DeltaCIELCH_ab(first, second, out);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetVector_CIELCH_uv)

bool TristimCalculator::GetVector_LCHhx_delta(const HXColorVector& first,
                                              const HXColorVector& second, HXColorVector& out) try {
  return GetVector_DeltaCIELCH_ab(first, second, out);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetVector_LCHhx_delta)

bool TristimCalculator::GetNormValence(const HXMeasureConditions& conditions,
                                       HXColorVector& out) try {
  TristimFilter::Get().SetMeasuringConditions(conditions);
  out.SetMeasureConditions(HXMeasureConditions(), conditions);
  const Triple white = CurrentWhite();
  const float scale = white[1] / 100.0F;
  Assign({scale * white[0], scale * white[1], scale * white[2]}, out);
  return true;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimCalculator::GetNormValence)

double TristimCalculator::DegToRad(double degrees) {
  return degrees / 360.0 * 2.0 * pi;
}

double TristimCalculator::RadToDeg(double radians) {
  return radians * 360.0 / (2.0 * pi);
}

}  // namespace Aldermoor::Tristim::Internals
