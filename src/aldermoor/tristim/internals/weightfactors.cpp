#include "aldermoor/tristim/internals/weightfactors.h"

#include <algorithm>
#include <cmath>
#include <span>

#include "aldermoor/tristim/internals/tristimfilter.h"
#include "aldermoor/tristim/internals/vocabulary.h"
#include "aldermoor/tristim/tristimexception.h"
#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/utilities/tools/lexicalcast.h"

namespace Aldermoor::Tristim::Internals {
namespace {

constexpr char kInvalidAxis[] = "Invalid Axis";

constexpr float kEmissionFactor = 0.683F;

int Read(const HXMeasureConditions& conditions, const char* key) {
  return Utilities::Tools::lexical_cast<int>(conditions.GetMeasureCondition(key));
}

StandardFilter IlluminantOf(const HXMeasureConditions& conditions) {
  const HXIllumination& illumination = conditions.GetIllumination();
  StandardFilter filter;
  switch (illumination.GetIlluminationType()) {
    case IlluminationType::kUserdefined:
      filter.SetUserIllumination(conditions);
      break;
    case IlluminationType::kDaylight:
      filter.SetDxxIllumination(conditions);
      break;
    default:
      filter = TristimFilter::GetIlluFilter(illumination);
  }
  return filter;
}

}  // namespace

Weightfactors::Weightfactors(const HXMeasureConditions& conditions) try {
  SetInstrumentData(conditions);
  SetObserver(static_cast<int>(conditions.GetObserver()));
  if (!emission_) {
    InterpolateIllumination(conditions);
  }
  SetKFactor();
  CalculateWeightfactors();
  CalculateSum();
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::Weightfactors::Weightfactors)

const float* Weightfactors::operator[](unsigned short axis) const try {
  if (axis >= kAxes) {
    throw TristimException(
        kInvalidAxis, ALDERMOOR_HERE(Aldermoor::Tristim::Internals::Weightfactors::operator[]));
  }
  return weights_[axis].data();
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::Weightfactors::operator[])

float Weightfactors::GetFilterSum(unsigned short axis) const {
  return axis < kAxes ? filter_sum_[axis] : 0.0F;
}

void Weightfactors::SetInstrumentData(const HXMeasureConditions& conditions) try {
  const int count = Read(conditions, Vocabulary::kNumberOfDataPointsKey);
  const int max = Read(conditions, Vocabulary::kWavelengthMaxKey);
  const int min = Read(conditions, Vocabulary::kWavelengthMinKey);
  emission_ = conditions.GetIllumination().GetIlluminationType() == IlluminationType::kEmission;
  grid_ = MakeMeasureGrid(count, max, min);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::Weightfactors::SetInstrumentData)

void Weightfactors::SetObserver(const int& observer) try {
  for (unsigned short axis = 0; axis < kAxes; ++axis) {
    observer_[axis] = AdjustObserverVector(TristimFilter::GetObserverFilter(observer, axis));
  }
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::Weightfactors::SetObserver)

void Weightfactors::InterpolateIllumination(const HXMeasureConditions& conditions) try {
  const StandardFilter filter = IlluminantOf(conditions);
  illumination_ = InterpolateTo1nm(AdjustIlluminationVector(filter), filter.GetStepSize());
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::Weightfactors::InterpolateIllumination)

void Weightfactors::SetKFactor() {
  // The point at 780 nm takes no part here nor in the weights, so that Y of the perfect reflector
  // is 100 all the same.
  k_factor_ = emission_ ? kEmissionFactor
                        : 100.0F / DotProduct(std::span(illumination_).first(kInternalCount - 1),
                                              observer_[1]);
}

void Weightfactors::CalculateWeightfactors() try {
  std::vector<float> product(kInternalCount);
  for (std::size_t axis = 0; axis < kAxes; ++axis) {
    for (std::size_t i = 0; i < kInternalCount; ++i) {
      product[i] = emission_ ? observer_[axis][i] * k_factor_
                             : illumination_[i] * observer_[axis][i] * k_factor_;
    }
    weights_[axis] = TransferToBands(FoldOntoNodes(product, grid_.step), grid_);
  }
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::Weightfactors::CalculateWeightfactors)

void Weightfactors::CalculateSum() {
  for (std::size_t axis = 0; axis < kAxes; ++axis) {
    float sum = 0.0F;
    for (const float weight : weights_[axis]) {
      sum += weight;
    }
    filter_sum_[axis] = sum;
  }
  filter_sum_[1] = 100.0F;  // by definition; the weights add up to it within rounding
}

QuadraticCoefficients Weightfactors::GetLagrange2Coeff(unsigned short step,
                                                       unsigned short offset) try {
  return LagrangeQuadratic(step, offset);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::Weightfactors::GetLagrange2Coeff)

CubicCoefficients Weightfactors::GetLagrange3Coeff(unsigned short step, unsigned short offset) try {
  return LagrangeCubic(step, offset);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::Weightfactors::GetLagrange3Coeff)

std::vector<float> Weightfactors::AdjustIlluminationVector(const StandardFilter& filter) try {
  std::vector<float> nodes;
  for (int at = kInternalMin; at <= kInternalMax; at += filter.GetStepSize()) {
    const int inside = std::clamp<int>(at, filter.GetMinWavelength(), filter.GetMaxWavelength());
    nodes.push_back(
        filter.GetFilter()[(inside - filter.GetMinWavelength()) / filter.GetStepSize()]);
  }
  return nodes;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::Weightfactors::AdjustIlluminationVector)

std::vector<float> Weightfactors::AdjustObserverVector(const StandardFilter& filter) try {
  std::vector<float> curve(kInternalCount);
  for (int at = kInternalMin; at <= kInternalMax; ++at) {
    const bool inside = at >= filter.GetMinWavelength() && at <= filter.GetMaxWavelength();
    curve[static_cast<std::size_t>(at - kInternalMin)] =
        inside ? filter.GetFilter()[at - filter.GetMinWavelength()] : 0.0F;
  }
  return curve;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::Weightfactors::AdjustObserverVector)

void Weightfactors::BandpassCorrection() try {
  for (std::vector<float>& weights : weights_) {
    if (weights.size() < 2) {
      continue;  // nothing calculated yet
    }
    const std::vector<float> o = weights;
    const std::size_t last = o.size() - 1;
    for (std::size_t i = 1; i < last; ++i) {
      weights[i] = o[i] * 1.166F - o[i - 1] * 0.083F - o[i + 1] * 0.083F;
    }
    weights[0] = o[0] * 1.083F - o[1] * 0.083F;
    weights[last] = o[last] * 1.083F - o[last - 1] * 0.083F;
  }
}
ALDERMOOR_FRAME(Aldermoor::Tristim::Internals::Weightfactors::BandpassCorrection)

Weightfactors& Weightfactors::Round() {
  for (std::vector<float>& weights : weights_) {
    for (float& weight : weights) {
      weight = std::floor(weight * 1000.0F + 0.5F) / 1000.0F;
    }
  }
  return *this;
}

}  // namespace Aldermoor::Tristim::Internals
