#include "aldermoor/tristim/internals/filter.h"

#include <algorithm>
#include <cstring>

#include "aldermoor/tristim/internals/weightmath.h"

namespace Aldermoor::Tristim::Internals {

Filter::Filter(const float* values) {
  std::copy_n(values, values_.size(), values_.begin());
  CalculateSum();
}

float Filter::GetFilterSum() {
  if (!sum_valid_) {
    CalculateSum();
  }
  return sum_;
}

void Filter::CalculateSum() {
  sum_ = 0.0F;
  for (const float value : values_) {
    sum_ += value;
  }
  sum_valid_ = true;
}

Filter Filter::FilterXFilter(const Filter& other) const {
  HXSpectrum::Bands product;
  for (std::size_t i = 0; i < product.size(); ++i) {
    product[i] = values_[i] * other.values_[i];
  }
  return Filter(product.data());
}

float Filter::operator*(const HXSpectrum& spectrum) const {
  return DotProduct(values_, spectrum.GetBands());
}

bool Filter::operator==(const Filter& other) const {
  return std::memcmp(values_.data(), other.values_.data(), sizeof values_) == 0;
}

}  // namespace Aldermoor::Tristim::Internals
