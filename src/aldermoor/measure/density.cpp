#include "aldermoor/measure/density.h"

#include <algorithm>
#include <cstddef>
#include <string_view>

#include "aldermoor/measure/densitysupport.h"
#include "aldermoor/tristim/internals/densitycalculator.h"

namespace Aldermoor::Measure {

using Tristim::HXMeasureConditions;
using Tristim::Internals::DensityCalculator;
using Tristim::Internals::DensityFilter;
using Tristim::Internals::HXDensity;
using Vexdoc::Spectrum;

namespace {

// Index: value of the enumeration.
constexpr const char* kStandards[] = {"DIN",   "DINNB", "ANSIA", "ANSIE",
                                      "ANSII", "ANSIT", "SPI",   "User"};
constexpr const char* kModes[] = {"Black", "Cyan", "Magenta", "Yellow", "Max", "Auto"};

template <class Enum, std::size_t kCount>
Enum ValueOf(const char* const (&words)[kCount], const std::string& word, const char* what) {
  const auto* const found = std::find(std::begin(words), std::end(words), std::string_view(word));
  if (found == std::end(words)) {
    throw MeasureException("'" + word + "' is no density " + what,
                           ALDERMOOR_HERE(Aldermoor::Measure));
  }
  return static_cast<Enum>(found - std::begin(words));
}

int FilterOf(const std::string& word) {
  HXMeasureConditions conditions;
  Computed([&] { conditions.SetMeasureCondition("Physical.Filter", word); },
           [] { return std::string(); });
  return static_cast<int>(conditions.GetPhysicalFilter());
}

Densities FromArray(const float* values) {
  return {values[0], values[1], values[2], values[3]};
}

std::array<float, 4> ToArray(const Densities& densities) {
  return {densities.black, densities.cyan, densities.magenta, densities.yellow};
}

using DensityFunction = bool (*)(const Tristim::HXSpectrum& spectrum, int standard,
                                 bool paper_relative, HXDensity& density);

Densities Measured(DensityFunction measure, const Spectrum& spectrum,
                   const DensityOptions& options) {
  HXDensity density;
  Require([&] {
    return measure(Vexdoc::ToHXSpectrum(spectrum), NumberOf(options.standard),
                   options.paper_relative, density);
  });
  return FromArray(density.GetAll().data());
}

}  // namespace

DensityStandard DensityStandardOf(const std::string& word) try {
  return ValueOf<DensityStandard>(kStandards, word, "standard");
}
ALDERMOOR_FRAME(Aldermoor::Measure::DensityStandardOf)

DensityMode DensityModeOf(const std::string& word) try {
  return ValueOf<DensityMode>(kModes, word, "filter mode");
}
ALDERMOOR_FRAME(Aldermoor::Measure::DensityModeOf)

const char* NameOf(DensityChannel channel) {
  return kModes[static_cast<std::size_t>(channel)];
}

Densities DensitiesOf(const Spectrum& spectrum, const DensityOptions& options) try {
  return Measured(DensityCalculator::GetDensityVectorWithSlope, spectrum, options);
}
ALDERMOOR_FRAME(Aldermoor::Measure::DensitiesOf)

Densities UncalibratedDensitiesOf(const Spectrum& spectrum, const DensityOptions& options) try {
  return Measured(DensityCalculator::GetDensityVector, spectrum, options);
}
ALDERMOOR_FRAME(Aldermoor::Measure::UncalibratedDensitiesOf)

ChannelDensity DensityOf(const Spectrum& spectrum, DensityMode mode,
                         const DensityOptions& options) try {
  if (mode == DensityMode::Max) {
    throw MeasureException("the densest band belongs to no channel",
                           ALDERMOOR_HERE(Aldermoor::Measure::DensityOf));
  }
  const bool automatic = mode == DensityMode::Auto;
  int channel = automatic ? 0 : NumberOf(mode);
  float value = 0.0F;
  Require([&] {
    return DensityCalculator::GetDensity(Vexdoc::ToHXSpectrum(spectrum), NumberOf(options.standard),
                                         options.paper_relative, value, channel, automatic);
  });
  return {value, static_cast<DensityChannel>(channel)};
}
ALDERMOOR_FRAME(Aldermoor::Measure::DensityOf)

std::array<float, 36> DensitySpectrumOf(const Spectrum& spectrum, bool paper_relative) try {
  std::array<float, 36> densities{};
  Require([&] {
    return DensityCalculator::GetDensitySpectrum(Vexdoc::ToHXSpectrum(spectrum), paper_relative,
                                                 densities.data());
  });
  return densities;
}
ALDERMOOR_FRAME(Aldermoor::Measure::DensitySpectrumOf)

MaximumDensity MaximumDensityOf(const Spectrum& spectrum, bool paper_relative) try {
  MaximumDensity result;
  unsigned short wavelength = 0;
  Require([&] {
    return DensityCalculator::GetMaxDensity(Vexdoc::ToHXSpectrum(spectrum), paper_relative,
                                            result.value, wavelength);
  });
  result.wavelength = wavelength;
  return result;
}
ALDERMOOR_FRAME(Aldermoor::Measure::MaximumDensityOf)

DensityCalibration GetDensityCalibration(const std::string& physical_filter,
                                         DensityStandard standard) try {
  const int filter = FilterOf(physical_filter);
  return {FromArray(DensityCalculator::GetDensitySlope(filter, NumberOf(standard))),
          FromArray(DensityCalculator::GetDensityOffset(filter, NumberOf(standard)))};
}
ALDERMOOR_FRAME(Aldermoor::Measure::GetDensityCalibration)

void SetDensityCalibration(const std::string& physical_filter, DensityStandard standard,
                           const DensityCalibration& calibration) try {
  const int filter = FilterOf(physical_filter);
  DensityCalculator::SetDensitySlope(filter, NumberOf(standard), ToArray(calibration.slope).data());
  DensityCalculator::SetDensityOffset(filter, NumberOf(standard),
                                      ToArray(calibration.offset).data());
}
ALDERMOOR_FRAME(Aldermoor::Measure::SetDensityCalibration)

std::array<float, 36> GetUserDensityCurve(DensityChannel channel) try {
  std::array<float, 36> curve;
  std::copy_n(DensityFilter::GetUserDefinedFilter(static_cast<int>(channel)), curve.size(),
              curve.begin());
  return curve;
}
ALDERMOOR_FRAME(Aldermoor::Measure::GetUserDensityCurve)

void SetUserDensityCurve(DensityChannel channel, std::span<const float, 36> curve) try {
  DensityFilter::SetUserDefinedFilter(curve.data(), static_cast<int>(channel));
  ForgetActiveFilter();
}
ALDERMOOR_FRAME(Aldermoor::Measure::SetUserDensityCurve)

void ResetUserDensityCurves() try {
  DensityFilter::SetUserDensityStandardToDefault();
  ForgetActiveFilter();
}
ALDERMOOR_FRAME(Aldermoor::Measure::ResetUserDensityCurves)

}  // namespace Aldermoor::Measure
