#include "aldermoor/measure/density.h"

#include <algorithm>
#include <cstddef>
#include <string_view>

#include "aldermoor/measure/densitysupport.h"
#include "aldermoor/measure/words.h"
#include "aldermoor/tristim/internals/densitycalculator.h"
#include "aldermoor/tristim/internals/vocabulary.h"

namespace Aldermoor::Measure {

using Tristim::HXMeasureConditions;
using Tristim::Internals::DensityCalculator;
using Tristim::Internals::DensityFilter;
using Tristim::Internals::HXDensity;
using Vexdoc::Spectrum;
namespace Vocabulary = Tristim::Vocabulary;

namespace {

/// The values of the enumerations are the places of their words.
template <class Enum>
Enum ValueOf(std::string_view key, const std::string& word) {
  const auto words = WordsOf(key);
  const auto found = std::ranges::find(words, std::string_view(word));
  if (found == words.end()) {
    throw MeasureException(NoSuchWord(key, word, words), ALDERMOOR_HERE(Aldermoor::Measure));
  }
  return static_cast<Enum>(found - words.begin());
}

template <class Enum>
int NumberUpTo(Enum last, Enum value, const char* what) {
  const int number = static_cast<int>(value);
  if (number < 0 || number > static_cast<int>(last)) {
    throw MeasureException(
        std::string("there is no density ") + what + " " + std::to_string(number),
        ALDERMOOR_HERE(Aldermoor::Measure));
  }
  return number;
}

int FilterOf(const std::string& word) {
  CheckWord(Vocabulary::kFilterKey, word);
  HXMeasureConditions conditions;
  conditions.SetMeasureCondition(Vocabulary::kFilterKey, word);
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

int NumberOf(DensityStandard standard) {
  return NumberUpTo(DensityStandard::User, standard, "standard");
}

int NumberOf(DensityMode mode) {
  return NumberUpTo(DensityMode::Auto, mode, "filter mode");
}

int NumberOf(DensityChannel channel) {
  return NumberUpTo(DensityChannel::Yellow, channel, "channel");
}

DensityStandard DensityStandardOf(const std::string& word) try {
  return ValueOf<DensityStandard>(Vocabulary::kDensityStandardKey, word);
}
ALDERMOOR_FRAME(Aldermoor::Measure::DensityStandardOf)

DensityMode DensityModeOf(const std::string& word) try {
  return ValueOf<DensityMode>(Vocabulary::kDensityFilterModeKey, word);
}
ALDERMOOR_FRAME(Aldermoor::Measure::DensityModeOf)

const char* NameOf(DensityChannel channel) try {
  const auto words = WordsOf(Vocabulary::kDensityFilterModeKey);
  return words[static_cast<std::size_t>(NumberOf(channel))].data();  // of a literal
}
ALDERMOOR_FRAME(Aldermoor::Measure::NameOf)

float Densities::Of(DensityChannel channel) const try {
  return ToArray(*this)[static_cast<std::size_t>(NumberOf(channel))];
}
ALDERMOOR_FRAME(Aldermoor::Measure::Densities::Of)

Densities DensitiesOf(const Spectrum& spectrum, const DensityOptions& options) try {
  CheckFilter(spectrum);
  return Measured(DensityCalculator::GetDensityVectorWithSlope, spectrum, options);
}
ALDERMOOR_FRAME(Aldermoor::Measure::DensitiesOf)

Densities UncalibratedDensitiesOf(const Spectrum& spectrum, const DensityOptions& options) try {
  return Measured(DensityCalculator::GetDensityVector, spectrum, options);
}
ALDERMOOR_FRAME(Aldermoor::Measure::UncalibratedDensitiesOf)

ChannelDensity DensityOf(const Spectrum& spectrum, DensityMode mode,
                         const DensityOptions& options) try {
  CheckFilter(spectrum);
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
  std::copy_n(DensityFilter::GetUserDefinedFilter(NumberOf(channel)), curve.size(), curve.begin());
  return curve;
}
ALDERMOOR_FRAME(Aldermoor::Measure::GetUserDensityCurve)

void SetUserDensityCurve(DensityChannel channel, std::span<const float, 36> curve) try {
  DensityFilter::SetUserDefinedFilter(curve.data(), NumberOf(channel));
  ForgetActiveFilter();
}
ALDERMOOR_FRAME(Aldermoor::Measure::SetUserDensityCurve)

void ResetUserDensityCurves() try {
  DensityFilter::SetUserDensityStandardToDefault();
  ForgetActiveFilter();
}
ALDERMOOR_FRAME(Aldermoor::Measure::ResetUserDensityCurves)

}  // namespace Aldermoor::Measure
