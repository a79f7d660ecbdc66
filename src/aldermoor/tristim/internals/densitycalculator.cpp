#include "aldermoor/tristim/internals/densitycalculator.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <cstddef>
#include <cstdlib>

#include "aldermoor/tristim/internals/initialisator.h"
#include "aldermoor/tristim/internals/neverdestroyed.h"
#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/exceptions/frame.h"

namespace Aldermoor::Tristim::Internals {
namespace {

constexpr int kMaxMode = static_cast<int>(DensityFilterMode::Max);
constexpr int kNoChannel = -1;

constexpr std::size_t kPhysicalFilters = 13;
constexpr std::size_t kStandards = 8;
using CalibrationTable = std::array<std::array<Quadruple, kStandards>, kPhysicalFilters>;

constexpr Quadruple kNeutralSlope = {1.0F, 1.0F, 1.0F, 1.0F};
constexpr Quadruple kNeutralOffset = {};

constinit CalibrationTable slopes{};
constinit CalibrationTable offsets{};

Quadruple& Entry(CalibrationTable& table, int physicalFilter, int standard) {
  const auto filter = static_cast<std::size_t>(physicalFilter);
  const auto row = static_cast<std::size_t>(standard);
  if (filter >= kPhysicalFilters || row >= kStandards) {
    throw Utilities::Exceptions::OutOfRangeException(
        "no density calibration for physical filter " + std::to_string(physicalFilter) +
            " and standard " + std::to_string(standard),
        ALDERMOOR_HERE(Aldermoor::Tristim::Internals::DensityCalculator));
  }
  return table[filter][row];
}

// The tables are set up with the conditions; before that they would be overwritten once more.
Quadruple& Calibration(CalibrationTable& table, int physicalFilter, int standard) {
  Initialisator::Get();
  return Entry(table, physicalFilter, standard);
}

[[nodiscard]] bool GetDensities(const HXSpectrum& spectrum, int standard, bool paperRelative,
                                bool withSlope, HXDensity& density) {
  return withSlope
             ? DensityCalculator::GetDensityVectorWithSlope(spectrum, standard, paperRelative,
                                                            density)
             : DensityCalculator::GetDensityVector(spectrum, standard, paperRelative, density);
}

/// The densities of several fields at the band where the densest of one of them lies.
template <std::size_t kCount>
[[nodiscard]] bool AtDensestBand(const HXSpectrum& solid, bool paperRelative,
                                 const std::array<const HXSpectrum*, kCount>& fields,
                                 float& densest, std::array<float, kCount>& at_band) {
  std::array<HXSpectrum::Bands, kCount> densities{};
  for (std::size_t i = 0; i < kCount; ++i) {
    if (!DensityCalculator::GetDensitySpectrum(*fields[i], paperRelative, densities[i].data())) {
      return false;
    }
  }
  unsigned short wavelength = 0;
  if (!DensityCalculator::GetMaxDensity(solid, true, densest, wavelength)) {
    return false;
  }
  const std::size_t band = solid.GetArrayIndex(wavelength);
  for (std::size_t i = 0; i < kCount; ++i) {
    at_band[i] = densities[i][band];
  }
  return true;
}

/// Densities of a solid and of a tint by a mode.
struct SolidAndTint {
  float solid = 0.0F;
  float tint = 0.0F;
};

[[nodiscard]] bool GetSolidAndTint(const HXSpectrum& solid, const HXSpectrum& tint, int standard,
                                   bool paperRelative, int mode, bool withSlope,
                                   SolidAndTint& result) {
  if (mode == kMaxMode) {
    std::array<float, 1> at_band{};
    if (!AtDensestBand<1>(solid, paperRelative, {&tint}, result.solid, at_band)) {
      return false;
    }
    result.tint = at_band[0];
    return true;
  }
  HXDensity of_solid;
  HXDensity of_tint;
  if (!GetDensities(solid, standard, paperRelative, withSlope, of_solid) ||
      !GetDensities(tint, standard, paperRelative, withSlope, of_tint)) {
    return false;
  }
  result = {of_solid.ByMode(mode), of_tint.ByMode(mode)};
  return true;
}

int LowestColor(const HXDensity& density) {
  int channel = 0;
  float lowest = 100.0F;
  for (int c = 1; c < 4; ++c) {
    if (density.ByChannel(c) < lowest) {
      lowest = density.ByChannel(c);
      channel = c;
    }
  }
  return channel;
}

int HighestColor(const HXDensity& density) {
  int channel = 0;
  float highest = -100.0F;
  for (int c = 1; c < 4; ++c) {
    if (density.ByChannel(c) > highest) {
      highest = density.ByChannel(c);
      channel = c;
    }
  }
  return channel;
}

constexpr int kSolidField = 16;

int OverprintField(int lowest_channel) {
  return lowest_channel == 1 || lowest_channel == 2 ? 12 + lowest_channel : 15;
}

}  // namespace

void DensityCalculator::InitializeDensityCalibration() try {
  for (int filter = 0; filter < static_cast<int>(kPhysicalFilters); ++filter) {
    for (int standard = 0; standard < static_cast<int>(kStandards); ++standard) {
      Entry(slopes, filter, standard) = kNeutralSlope;
      Entry(offsets, filter, standard) = kNeutralOffset;
    }
  }
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::DensityCalculator::InitializeDensityCalibration)

void DensityCalculator::ResetDensityCalibration(int physicalFilter, const int& standard) try {
  Calibration(slopes, physicalFilter, standard) = kNeutralSlope;
  Calibration(offsets, physicalFilter, standard) = kNeutralOffset;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::DensityCalculator::ResetDensityCalibration)

float* DensityCalculator::GetDensitySlope(int physicalFilter, int standard) try {
  return Calibration(slopes, physicalFilter, standard).data();
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::DensityCalculator::GetDensitySlope)

void DensityCalculator::GetDensitySlope(int physicalFilter, int standard, float out[4]) try {
  std::copy_n(GetDensitySlope(physicalFilter, standard), 4, out);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::DensityCalculator::GetDensitySlope)

void DensityCalculator::SetDensitySlope(int physicalFilter, int standard, const float in[4]) try {
  std::copy_n(in, 4, GetDensitySlope(physicalFilter, standard));
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::DensityCalculator::SetDensitySlope)

float* DensityCalculator::GetDensityOffset(int physicalFilter, int standard) try {
  return Calibration(offsets, physicalFilter, standard).data();
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::DensityCalculator::GetDensityOffset)

void DensityCalculator::GetDensityOffset(int physicalFilter, int standard, float out[4]) try {
  std::copy_n(GetDensityOffset(physicalFilter, standard), 4, out);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::DensityCalculator::GetDensityOffset)

void DensityCalculator::SetDensityOffset(int physicalFilter, int standard, const float in[4]) try {
  std::copy_n(in, 4, GetDensityOffset(physicalFilter, standard));
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::DensityCalculator::SetDensityOffset)

DensityFilter& DensityCalculator::GetActDensityStdFilter() {
  static NeverDestroyed<DensityFilter> active;
  return active.Get();
}

bool DensityCalculator::GetDensityVector(const HXSpectrum& spectrum, int standard,
                                         bool paperRelative, HXDensity& density) try {
  DensityFilter& filter = GetActDensityStdFilter();
  filter.SetDensityStandard(standard);
  density.SetAll(DensitiesOf(filter.GetWeights(), spectrum.GetBands().data()));
  if (!paperRelative) {
    return true;
  }
  const HXMeasureConditions& conditions = spectrum.GetMeasureConditions();
  HXSpectrum paper;
  HXDensity of_paper;
  if (!IsPaperWhiteValid(conditions) || !GetPaperWhite().GetSpectrum(conditions, paper) ||
      !GetDensityVector(paper, standard, false, of_paper)) {
    return false;
  }
  Quadruple relative = density.GetAll();
  for (std::size_t c = 0; c < relative.size(); ++c) {
    relative[c] -= of_paper.GetAll()[c];
  }
  density.SetAll(relative);
  return true;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::DensityCalculator::GetDensityVector)

bool DensityCalculator::GetDensityVectorWithSlope(const HXSpectrum& spectrum, int standard,
                                                  bool paperRelative, HXDensity& density) try {
  const auto physical_filter =
      static_cast<int>(spectrum.GetMeasureConditions().GetPhysicalFilter());
  const Quadruple& slope = Calibration(slopes, physical_filter, standard);
  const Quadruple& offset = Calibration(offsets, physical_filter, standard);
  if (!GetDensityVector(spectrum, standard, paperRelative, density)) {
    return false;
  }
  Quadruple calibrated = density.GetAll();
  for (std::size_t c = 0; c < calibrated.size(); ++c) {
    calibrated[c] = calibrated[c] * slope[c] + (paperRelative ? 0.0F : offset[c]);
  }
  density.SetAll(calibrated);
  return true;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::DensityCalculator::GetDensityVectorWithSlope)

int DensityCalculator::GetDensityFilter(const HXDensity& density) {
  return StrongestChannel(density.GetAll());
}

bool DensityCalculator::GetDensity(const HXSpectrum& spectrum, int standard, bool paperRelative,
                                   float& value, int& channel, bool automatic) try {
  HXDensity density;
  if (!GetDensityVectorWithSlope(spectrum, standard, paperRelative, density)) {
    value = kGreatestDensity;
    channel = kNoChannel;
    return false;
  }
  if (automatic) {
    channel = GetDensityFilter(density);
  }
  value = density.ByChannel(channel);
  return true;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::DensityCalculator::GetDensity)

bool DensityCalculator::GetDensitySpectrum(const HXSpectrum& spectrum, bool paperRelative,
                                           float* densities) try {
  HXSpectrum::Bands values = spectrum.GetBands();
  if (paperRelative && !GetSpecBasedToPapWhite(spectrum.GetMeasureConditions(), values.data())) {
    return false;
  }
  std::transform(values.begin(), values.end(), densities, DensityOf);
  return true;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::DensityCalculator::GetDensitySpectrum)

bool DensityCalculator::GetMaxDensity(const HXSpectrum& spectrum, bool paperRelative,
                                      float& maxDensity, unsigned short& wavelength) try {
  constexpr unsigned short kFrom = 410;
  constexpr unsigned short kTo = 700;
  constexpr int kMiddle = static_cast<int>(HXSpectrum::kBands) / 2 - 1;
  HXSpectrum::Bands values = spectrum.GetBands();
  const bool is_done =
      !paperRelative || GetSpecBasedToPapWhite(spectrum.GetMeasureConditions(), values.data());
  float lowest = 9999.0F;
  int index = 0;
  for (int i = spectrum.GetArrayIndex(kFrom); i <= spectrum.GetArrayIndex(kTo); ++i) {
    const float value = values[static_cast<std::size_t>(i)];
    if (lowest > value || (lowest == value && std::abs(i - kMiddle) < std::abs(index - kMiddle))) {
      lowest = value;
      index = i;
    }
  }
  maxDensity = DensityOf(lowest);
  wavelength = spectrum.GetWaveLength(static_cast<unsigned short>(index));
  return is_done;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::DensityCalculator::GetMaxDensity)

void DensityCalculator::SortColorDensities(const HXDensity& density, float sorted[3]) {
  const Triple colors = SortedColors(density.GetAll());
  std::copy(colors.begin(), colors.end(), sorted);
}

bool DensityCalculator::GetDotArea(const HXSpectrum& solid, const HXSpectrum& tint, int standard,
                                   int mode, float& dotArea) try {
  return GetDotArea(solid, tint, standard, mode, 1.0F, dotArea);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::DensityCalculator::GetDotArea)

bool DensityCalculator::GetDotArea(const HXSpectrum& solid, const HXSpectrum& tint, int standard,
                                   int mode, float n, float& dotArea) try {
  SolidAndTint densities;
  if (!GetSolidAndTint(solid, tint, standard, true, mode, false, densities)) {
    return false;
  }
  dotArea = DotArea(densities.solid, densities.tint, n);
  return true;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::DensityCalculator::GetDotArea)

bool DensityCalculator::GetContrast(const HXSpectrum& solid, const HXSpectrum& tint, int standard,
                                    bool paperRelative, int mode, float& contrast) try {
  SolidAndTint densities;
  if (!GetSolidAndTint(solid, tint, standard, paperRelative, mode, true, densities)) {
    return false;
  }
  contrast = Contrast(densities.solid, densities.tint);
  return true;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::DensityCalculator::GetContrast)

bool DensityCalculator::GetTrapping(const HXSpectrum& first, const HXSpectrum& second,
                                    const HXSpectrum& overprint, int standard, int mode,
                                    float& trapping) try {
  if (mode == kMaxMode) {
    float of_second = 0.0F;
    std::array<float, 3> at_band{};
    if (!AtDensestBand<3>(second, true, {&first, &second, &overprint}, of_second, at_band)) {
      return false;
    }
    trapping = Trapping(at_band[0], of_second, at_band[2]);
    return true;
  }
  HXDensity of_first;
  HXDensity of_second;
  HXDensity of_overprint;
  return GetDensityVector(first, standard, true, of_first) &&
         GetDensityVector(second, standard, true, of_second) &&
         GetDensityVector(overprint, standard, true, of_overprint) &&
         GetTrapping(of_first, of_second, of_overprint, mode, trapping);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::DensityCalculator::GetTrapping)

bool DensityCalculator::GetTrapping(const HXDensity& first, const HXDensity& second,
                                    const HXDensity& overprint, int mode, float& trapping) {
  trapping = Trapping(first.ByMode(mode), second.ByMode(mode), overprint.ByMode(mode));
  return true;
}

bool DensityCalculator::GetGreyness(const HXSpectrum& spectrum, int standard, bool paperRelative,
                                    float& greyness, bool withSlope) try {
  HXDensity density;
  if (!GetDensities(spectrum, standard, paperRelative, withSlope, density)) {
    return false;
  }
  greyness = Greyness(SortedColors(density.GetAll()));
  return true;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::DensityCalculator::GetGreyness)

bool DensityCalculator::GetHueError(const HXSpectrum& spectrum, int standard, bool paperRelative,
                                    float& hueError, bool withSlope) try {
  HXDensity density;
  if (!GetDensities(spectrum, standard, paperRelative, withSlope, density)) {
    return false;
  }
  hueError = HueError(SortedColors(density.GetAll()));
  return true;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::DensityCalculator::GetHueError)

bool DensityCalculator::RecognizeColorField(const HXDensity solids[4], const HXSpectrum& spectrum,
                                            int standard, const float tones[4], int& field,
                                            int& color, HXDensity& density,
                                            ColorFieldResult results[12]) try {
  constexpr float kNeutral = 0.7F;
  constexpr float kMixed = 0.25F;
  constexpr float kLeastSolid = 0.01F;
  field = -1;
  color = kNoChannel;
  if (!GetDensityVector(spectrum, standard, true, density)) {
    return false;
  }
  const Quadruple reference = {solids[0].ByChannel(0), solids[1].ByChannel(1),
                               solids[2].ByChannel(2), solids[3].ByChannel(3)};
  float grey = 0.0F;
  float hue = 0.0F;
  if (!GetGreyness(spectrum, standard, true, grey, false) ||
      !GetHueError(spectrum, standard, true, hue, false)) {
    return false;
  }
  int channel = HighestColor(density);
  if (grey > kNeutral) {
    channel = 0;
  } else if ((hue > kNeutral || grey > kMixed) && SortedColors(reference)[0] > kLeastSolid) {
    field = OverprintField(LowestColor(density));
    return true;
  }
  field = kSolidField + channel;
  color = channel;
  const auto sorted = SortedTones({Tone{tones[3], 3}, Tone{tones[2], 2}, Tone{tones[1], 1}});
  const float solid = reference[static_cast<std::size_t>(channel)];
  if (sorted[2].value == 0.0F || solid == 0.0F) {
    return true;  // there are no tints
  }
  const float measured = ToneValue(solid, density.ByChannel(channel));
  const int tone = MatchTone(sorted, measured);
  if (tone == 0) {
    field = 0;
  } else if (tone > 0) {
    field = channel + 4 * tone - 3;
    results[field - 1] = {measured - tones[tone], true};
  }
  return true;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::DensityCalculator::RecognizeColorField)

}  // namespace Aldermoor::Tristim::Internals
