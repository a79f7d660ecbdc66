#include "aldermoor/tristim/internals/standardfilter.h"

#include <cmath>
#include <utility>

#include "aldermoor/tristim/hxspectrum.h"
#include "aldermoor/tristim/internals/tristimfilter.h"
#include "aldermoor/tristim/internals/vocabulary.h"
#include "aldermoor/tristim/tristimexception.h"
#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/utilities/tools/lexicalcast.h"

namespace Aldermoor::Tristim::Internals {
namespace {

constexpr char kUnsupportedIllumination[] = "Unsupported Illumination type";

unsigned short Read(const HXMeasureConditions& conditions, const char* key) {
  return Utilities::Tools::lexical_cast<unsigned short>(conditions.GetMeasureCondition(key));
}

double ToThreeDecimals(double value) {
  return std::floor(value * 1000.0 + 0.5) / 1000.0;
}

}  // namespace

Daylight DaylightOf(double temperature) noexcept {
  const double t = temperature;
  const double t2 = t * t;
  const double t3 = t * t2;
  Daylight day{};
  day.x = t < 7000.0 ? -4.607e9 / t3 + 2.9678e6 / t2 + 99.11 / t + 0.244063
                     : -2.0064e9 / t3 + 1.9018e6 / t2 + 247.48 / t + 0.23704;
  day.y = -3.0 * day.x * day.x + 2.87 * day.x - 0.275;
  const double m = 0.0241 + 0.2562 * day.x - 0.7341 * day.y;
  day.m1 = ToThreeDecimals((-1.3515 - 1.7703 * day.x + 5.9114 * day.y) / m);
  day.m2 = ToThreeDecimals((0.03 - 31.4424 * day.x + 30.0717 * day.y) / m);
  return day;
}

StandardFilter::StandardFilter(unsigned short step, unsigned short max_wavelength,
                               unsigned short min_wavelength, std::vector<float> values)
    : step_(step),
      max_wavelength_(max_wavelength),
      min_wavelength_(min_wavelength),
      values_(std::move(values)) {}

void StandardFilter::SetUserIllumination(const HXMeasureConditions& conditions) try {
  const HXSpectrum& curve = conditions.GetUserdefinedIllumination();
  const HXMeasureConditions& grid = curve.GetMeasureConditions();
  min_wavelength_ = Read(grid, Vocabulary::kWavelengthMinKey);
  max_wavelength_ = Read(grid, Vocabulary::kWavelengthMaxKey);
  const unsigned short count = Read(grid, Vocabulary::kNumberOfDataPointsKey);
  step_ = static_cast<unsigned short>((max_wavelength_ - min_wavelength_) / (count - 1));
  values_ = curve.GetValues();
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::StandardFilter::SetUserIllumination)

void StandardFilter::SetDxxIllumination(const HXMeasureConditions& conditions) try {
  const double nominal = conditions.GetIllumination().GetColorTemperature();
  if (nominal <= 0.0) {
    throw TristimException(
        kUnsupportedIllumination,
        ALDERMOOR_HERE(Aldermoor::Tristim::Internals::StandardFilter::SetDxxIllumination));
  }
  // The recommended values of c2 changed after the D series had been named.
  const Daylight day = DaylightOf(nominal * 1.4388 / 1.438);
  const auto component = [](int type) {
    return TristimFilter::GetIlluFilter(HXIllumination(type));
  };
  const StandardFilter s1 = component(IlluminationType::kDaylightS1);
  const StandardFilter s2 = component(IlluminationType::kDaylightS2);
  *this = component(IlluminationType::kDaylightS0);

  std::vector<double> sum(values_.begin(), values_.end());
  for (std::size_t i = 0; i < sum.size(); ++i) {
    sum[i] = sum[i] + static_cast<double>(s1.values_[i]) * day.m1;
    sum[i] = sum[i] + static_cast<double>(s2.values_[i]) * day.m2;
  }
  const double factor = 100.0 / sum[static_cast<std::size_t>((560 - min_wavelength_) / step_)];
  for (std::size_t i = 0; i < sum.size(); ++i) {
    values_[i] = static_cast<float>(sum[i] * factor);
  }
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::StandardFilter::SetDxxIllumination)

}  // namespace Aldermoor::Tristim::Internals
