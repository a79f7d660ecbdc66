#include "aldermoor/tristim/internals/tristimfilter.h"

#include <array>
#include <memory>
#include <span>
#include <utility>
#include <vector>

#include "aldermoor/tristim/internals/data/daylightdata.h"
#include "aldermoor/tristim/internals/data/fluorescentdata.h"
#include "aldermoor/tristim/internals/data/illuminantdata.h"
#include "aldermoor/tristim/internals/data/observer10degdata.h"
#include "aldermoor/tristim/internals/data/observer2degdata.h"
#include "aldermoor/tristim/internals/neverdestroyed.h"
#include "aldermoor/tristim/tristimexception.h"
#include "aldermoor/utilities/exceptions/frame.h"

namespace Aldermoor::Tristim::Internals {
namespace {

using Utilities::Tools::SmartPointer;

constexpr char kUnsupportedIllumination[] = "Unsupported Illumination type";
constexpr char kUnsupportedObserver[] = "Unsupported Observer type";

/// A table without values stands for a type that has none.
struct Table {
  unsigned short step;
  unsigned short max;
  unsigned short min;
  std::span<const float> values;

  StandardFilter ToFilter() const {
    return {step, max, min, std::vector<float>(values.begin(), values.end())};
  }
};

constexpr Table kNone = {0, 0, 0, {}};

// Index: illumination type.
constinit const std::array<Table, 17> kIlluminants = {{{1, 830, 300, Data::kIlluminantA},
                                                       {5, 770, 320, Data::kIlluminantB},
                                                       {5, 780, 300, Data::kIlluminantC},
                                                       {5, 830, 300, Data::kIlluminantD75},
                                                       {1, 830, 300, Data::kIlluminantD65},
                                                       {5, 830, 300, Data::kIlluminantD55},
                                                       {5, 830, 300, Data::kIlluminantD50},
                                                       kNone,
                                                       {5, 780, 380, Data::kIlluminantF2},
                                                       {5, 780, 380, Data::kIlluminantF7},
                                                       {5, 780, 380, Data::kIlluminantF11},
                                                       kNone,
                                                       kNone,
                                                       kNone,
                                                       {5, 830, 300, Data::kDaylightS0},
                                                       {5, 830, 300, Data::kDaylightS1},
                                                       {5, 830, 300, Data::kDaylightS2}}};

// Index: number of the fluorescent illuminant - 1.
constinit const std::array<Table, 12> kFluorescents = {{{5, 780, 380, Data::kIlluminantF1},
                                                        {5, 780, 380, Data::kIlluminantF2},
                                                        {5, 780, 380, Data::kIlluminantF3},
                                                        {5, 780, 380, Data::kIlluminantF4},
                                                        {5, 780, 380, Data::kIlluminantF5},
                                                        {5, 780, 380, Data::kIlluminantF6},
                                                        {5, 780, 380, Data::kIlluminantF7},
                                                        {5, 780, 380, Data::kIlluminantF8},
                                                        {5, 780, 380, Data::kIlluminantF9},
                                                        {5, 780, 380, Data::kIlluminantF10},
                                                        {5, 780, 380, Data::kIlluminantF11},
                                                        {5, 780, 380, Data::kIlluminantF12}}};

// Index: observer, axis.  The z functions stop where they have reached 0.
constinit const std::array<std::array<Table, 3>, 2> kObservers = {
    {{{{1, 830, 360, Data::kTwoDegreeX},
       {1, 830, 360, Data::kTwoDegreeY},
       {1, 650, 360, Data::kTwoDegreeZ}}},
     {{{1, 830, 360, Data::kTenDegreeX},
       {1, 830, 360, Data::kTenDegreeY},
       {1, 560, 360, Data::kTenDegreeZ}}}}};

const Table& IlluminantOf(const HXIllumination& illumination) {
  if (illumination.GetIlluminationType() == IlluminationType::kFluorescent) {
    const std::size_t number = illumination.GetFluorescence();
    return number >= 1 && number <= kFluorescents.size() ? kFluorescents[number - 1] : kNone;
  }
  const auto type = static_cast<std::size_t>(illumination.GetIlluminationType());
  return type < kIlluminants.size() ? kIlluminants[type] : kNone;
}

}  // namespace

TristimFilter& TristimFilter::Get() {
  static NeverDestroyed<TristimFilter> instance;
  return instance.Get();
}

void TristimFilter::SetMeasuringConditions(const HXMeasureConditions& conditions) try {
  if (weightfactors_ && conditions_->GetIllumination() == conditions.GetIllumination() &&
      conditions_->GetObserver() == conditions.GetObserver() &&
      conditions_->SharesUserdefinedIllumination(conditions)) {
    return;
  }
  // Both are made before either is kept: weights beside the conditions of others would be taken
  // for theirs the next time.
  SmartPointer<Weightfactors> weightfactors(std::make_unique<Weightfactors>(conditions).release());
  SmartPointer<HXMeasureConditions> kept(
      std::make_unique<HXMeasureConditions>(conditions).release());
  weightfactors_ = std::move(weightfactors);
  conditions_ = std::move(kept);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimFilter::SetMeasuringConditions)

float TristimFilter::GetFilterSum(unsigned short axis) const {
  return weightfactors_ ? weightfactors_->GetFilterSum(axis) : 0.0F;
}

const float* TristimFilter::operator[](unsigned short axis) const try {
  return (*weightfactors_)[axis];
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimFilter::operator[])

StandardFilter TristimFilter::GetIlluFilter(const HXIllumination& illumination) try {
  const Table& table = IlluminantOf(illumination);
  if (table.values.empty()) {
    throw TristimException(
        kUnsupportedIllumination,
        ALDERMOOR_HERE(Aldermoor::Tristim::Internals::TristimFilter::GetIlluFilter));
  }
  return table.ToFilter();
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimFilter::GetIlluFilter)

StandardFilter TristimFilter::GetObserverFilter(const int& observer, unsigned short axis) try {
  const auto row = static_cast<std::size_t>(observer);
  if (row >= kObservers.size() || axis >= kObservers[row].size()) {
    throw TristimException(
        kUnsupportedObserver,
        ALDERMOOR_HERE(Aldermoor::Tristim::Internals::TristimFilter::GetObserverFilter));
  }
  return kObservers[row][axis].ToFilter();
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::TristimFilter::GetObserverFilter)

}  // namespace Aldermoor::Tristim::Internals
