#include "aldermoor/tristim/internals/densityfilter.h"

#include <algorithm>
#include <cstddef>
#include <span>

#include "aldermoor/tristim/internals/data/densitydata.h"
#include "aldermoor/utilities/exceptions/frame.h"

namespace Aldermoor::Tristim::Internals {
namespace {

constexpr std::size_t kChannels = 4;
constexpr int kUser = static_cast<int>(DensityStandard::User);

constinit std::array<HXSpectrum::Bands, kChannels> user_curves{};

/// A part of a curve from a wavelength on; all the rest is 0.
struct Part {
  int from = 0;  // nm
  std::span<const float> values;
};

constexpr float kOne[] = {1.0F};

struct Table {
  Part cyan;
  Part magenta;
  Part yellow;
};

constexpr Part kVisual = {400, Data::kDensityVisual};

// Index: standard.
constexpr Table kTables[] = {
    {{590, Data::kDensityDin}, {500, Data::kDensityDin}, {400, Data::kDensityDin}},
    {{620, kOne}, {530, kOne}, {430, kOne}},
    {{580, Data::kDensityAnsiaCyan},
     {480, Data::kDensityAnsiaMagenta},
     {400, Data::kDensityAnsiaYellow}},
    {{540, Data::kDensityAnsieCyan},
     {460, Data::kDensityAnsieMagenta},
     {380, Data::kDensityAnsieYellow}},
    {{600, Data::kDensityAnsiiCyan},
     {510, Data::kDensityAnsiiMagenta},
     {400, Data::kDensityAnsiiYellow}},
    {{540, Data::kDensityAnsieCyan},
     {460, Data::kDensityAnsitMagenta},
     {380, Data::kDensityAnsitYellow}},
    {{590, Data::kDensitySpiCyan}, {500, Data::kDensitySpiMagenta}, {390, Data::kDensitySpiYellow}},
};

Filter FilterOf(const Part& part) {
  HXSpectrum::Bands values{};
  std::copy(part.values.begin(), part.values.end(), values.begin() + (part.from - 380) / 10);
  return Filter(values.data());
}

}  // namespace

void DensityFilter::SetDensityStandard(int standard) try {
  if (standard != standard_) {
    SetFilterTables(standard);
  }
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::DensityFilter::SetDensityStandard)

void DensityFilter::SetFilterTables(int standard) {
  standard_ = standard;
  filters_ = {};
  if (standard == kUser) {
    for (std::size_t channel = 0; channel < kChannels; ++channel) {
      filters_[channel] = Filter(user_curves[channel].data());
    }
  } else if (standard >= 0 && standard < kUser) {
    const Table& table = kTables[standard];
    filters_ = {FilterOf(kVisual), FilterOf(table.cyan), FilterOf(table.magenta),
                FilterOf(table.yellow)};
  }
}

DensityWeights DensityFilter::GetWeights() const {
  return {filters_[0].GetFilterSpectrum(), filters_[1].GetFilterSpectrum(),
          filters_[2].GetFilterSpectrum(), filters_[3].GetFilterSpectrum()};
}

void DensityFilter::SetUserDensityStandardToDefault() {
  for (HXSpectrum::Bands& curve : user_curves) {
    curve.fill(1.0F);
  }
}

const float* DensityFilter::GetUserDefinedFilter(int channel) {
  return user_curves[static_cast<unsigned>(channel)].data();
}

void DensityFilter::SetUserDefinedFilter(const float* values, int channel) {
  std::copy_n(values, HXSpectrum::kBands, user_curves[static_cast<unsigned>(channel)].begin());
}

}  // namespace Aldermoor::Tristim::Internals
