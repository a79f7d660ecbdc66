#include "aldermoor/tristim/hxspectrum.h"

#include <algorithm>

#include "aldermoor/tristim/internals/vocabulary.h"
#include "aldermoor/tristim/tristimexception.h"
#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/utilities/tools/lexicalcast.h"

namespace Aldermoor::Tristim {
namespace {

// The text has no closing bracket.
constexpr char kIllegalSize[] =
    "Illegal spectrum size! (only spectral values [380 - 730nm, 10nm resolution] are supported";

/// The measuring grid as the words of the conditions tell it.
struct Grid {
  double min;
  double max;
  int count;

  explicit Grid(const HXMeasureConditions& conditions)
      : min(Read<double>(conditions, Vocabulary::kWavelengthMinKey)),
        max(Read<double>(conditions, Vocabulary::kWavelengthMaxKey)),
        count(Read<int>(conditions, Vocabulary::kNumberOfDataPointsKey)) {}

 private:
  template <class Number>
  static Number Read(const HXMeasureConditions& conditions, const char* key) {
    return Utilities::Tools::lexical_cast<Number>(conditions.GetMeasureCondition(key));
  }
};

}  // namespace

HXSpectrum::HXSpectrum(const std::vector<float>& values) try
    : HXSpectrum(values, HXMeasureConditions()) {}
ALDERMOOR_FRAME(Aldermoor::Tristim::HXSpectrum::HXSpectrum)

HXSpectrum::HXSpectrum(const std::vector<float>& values, const HXMeasureConditions& conditions) try
    : conditions_(conditions) {
  if (values.size() != kBands) {
    throw TristimException(kIllegalSize,
                           ALDERMOOR_HERE(Aldermoor::Tristim::HXSpectrum::HXSpectrum));
  }
  std::copy(values.begin(), values.end(), values_.begin());
}
ALDERMOOR_FRAME(Aldermoor::Tristim::HXSpectrum::HXSpectrum)

HXSpectrum::HXSpectrum(const float* values) try { std::copy_n(values, kBands, values_.begin()); }
ALDERMOOR_FRAME(Aldermoor::Tristim::HXSpectrum::HXSpectrum)

HXSpectrum::HXSpectrum(const float* values, const HXMeasureConditions& conditions) try
    : conditions_(conditions) {
  std::copy_n(values, kBands, values_.begin());
}
ALDERMOOR_FRAME(Aldermoor::Tristim::HXSpectrum::HXSpectrum)

bool HXSpectrum::operator==(const HXSpectrum& other) const try {
  return values_ == other.values_ && conditions_ == other.conditions_;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::HXSpectrum::operator==)

std::vector<float> HXSpectrum::GetValues() const try { return {values_.begin(), values_.end()}; }
ALDERMOOR_FRAME(Aldermoor::Tristim::HXSpectrum::GetValues)

bool HXSpectrum::IsValid() const {
  return std::any_of(values_.begin(), values_.end(),
                     [](float value) { return static_cast<double>(value) > 0.0; });
}

unsigned short HXSpectrum::GetArrayIndex(unsigned short waveLength) const try {
  const Grid grid(conditions_);
  const float step = static_cast<float>(grid.max - grid.min) / static_cast<float>(grid.count - 1);
  const float position = static_cast<float>(waveLength) - static_cast<float>(grid.min);
  const int index = static_cast<int>(position / step);
  return index < 0 || index >= grid.count ? std::uint16_t{0} : static_cast<std::uint16_t>(index);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::HXSpectrum::GetArrayIndex)

unsigned short HXSpectrum::GetWaveLength(unsigned short index) const try {
  const Grid grid(conditions_);
  if (index >= grid.count) {
    return 0;
  }
  return static_cast<unsigned short>(index * (grid.max - grid.min) / (grid.count - 1) + grid.min);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::HXSpectrum::GetWaveLength)

}  // namespace Aldermoor::Tristim
