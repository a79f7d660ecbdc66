#include "aldermoor/tristim/hxcolorvector.h"

#include <algorithm>
#include <cmath>

#include "aldermoor/utilities/exceptions/frame.h"

namespace Aldermoor::Tristim {

HXColorVector::HXColorVector(const std::vector<float>& values,
                             const HXMeasureConditions& conditions) try
    : conditions_(conditions) {
  std::copy_n(values.begin(), std::min(values.size(), values_.size()), values_.begin());
}
ALDERMOOR_FRAME(Aldermoor::Tristim::HXColorVector::HXColorVector)

HXColorVector::HXColorVector(float first, float second, float third,
                             const HXMeasureConditions& conditions) try
    : conditions_(conditions), values_{first, second, third, 0.0F} {}
ALDERMOOR_FRAME(Aldermoor::Tristim::HXColorVector::HXColorVector)

bool HXColorVector::operator==(const HXColorVector& other) const try {
  return values_ == other.values_ && conditions_ == other.conditions_;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::HXColorVector::operator==)

HXColorVector& HXColorVector::operator-=(const HXColorVector& other) {
  for (std::size_t i = 0; i < values_.size(); ++i) {
    values_[i] -= other.values_[i];
  }
  return *this;
}

HXColorVector& HXColorVector::operator*=(const HXColorVector& other) {
  for (std::size_t i = 0; i < values_.size(); ++i) {
    values_[i] *= other.values_[i];
  }
  return *this;
}

float HXColorVector::Length() const {
  float sum = 0.0F;
  for (const float value : values_) {
    sum += value * value;
  }
  return std::sqrt(sum);
}

void HXColorVector::SetMeasureConditions(const HXMeasureConditions& physical,
                                         const HXMeasureConditions& conditions) try {
  conditions_ = conditions;
  conditions_.SetPhysMeasCond(physical);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::HXColorVector::SetMeasureConditions)

}  // namespace Aldermoor::Tristim
