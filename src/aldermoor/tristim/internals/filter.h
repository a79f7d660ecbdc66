#ifndef ALDERMOOR_TRISTIM_INTERNALS_FILTER_H
#define ALDERMOOR_TRISTIM_INTERNALS_FILTER_H

#include "aldermoor/tristim/hxspectrum.h"

namespace Aldermoor::Tristim::Internals {

/// A weighting curve on the measuring grid, with its sum cached.
///
/// Grid: band i is 380 + 10·i nm, i = 0..35.  Scale: dimensionless.
/// Ownership: value, without an allocation.  Precision: single, summed from band 0 upward.
class Filter {
 public:
  Filter() = default;
  /// From an array of at least 36 values.
  explicit Filter(const float* values);

  /// Adds the values up first if one was written since the last time.
  float GetFilterSum();
  void CalculateSum();

  /// The 36 values.
  const float* GetFilterSpectrum() const { return values_.data(); }
  /// Not checked; `index` is 0..35.
  float operator[](int index) const { return values_[static_cast<unsigned>(index)]; }
  /// Write access, which makes the sum stale.
  float& operator[](int index) {
    sum_valid_ = false;
    return values_[static_cast<unsigned>(index)];
  }

  /// The product band by band, with its sum.
  Filter FilterXFilter(const Filter& other) const;
  /// Dot product, accumulated from band 0 upward.
  float operator*(const HXSpectrum& spectrum) const;

  /// Bit for bit, so that -0 differs from 0; the sum takes no part.
  bool operator==(const Filter& other) const;

 private:
  bool sum_valid_ = false;
  float sum_ = 0.0F;
  HXSpectrum::Bands values_{};
};

}  // namespace Aldermoor::Tristim::Internals

#endif  // ALDERMOOR_TRISTIM_INTERNALS_FILTER_H
