#ifndef ALDERMOOR_TRISTIM_HXCOLORVECTOR_H
#define ALDERMOOR_TRISTIM_HXCOLORVECTOR_H

#include <array>
#include <vector>

#include "aldermoor/tristim/hxmeasureconditions.h"

namespace Aldermoor::Tristim {

/// Up to four colour values with the conditions that say what they are.
///
/// Channels: in the order of the colour space; the fourth is 0 for all but "CMYK".
/// Ownership: value.  Precision: single.
class HXColorVector {
 public:
  using Channels = std::array<float, 4>;

  /// Zeros under default conditions.
  HXColorVector() = default;
  /// The first four of `values`; zeros for what is missing.
  HXColorVector(const std::vector<float>& values, const HXMeasureConditions& conditions);
  HXColorVector(float first, float second, float third, const HXMeasureConditions& conditions);
  HXColorVector(const HXColorVector&) = default;
  HXColorVector& operator=(const HXColorVector&) = default;
  ~HXColorVector() = default;

  /// All four values by ==, and conditions.
  bool operator==(const HXColorVector& other) const;

  /// Element by element over all four values; the conditions stay.
  HXColorVector& operator-=(const HXColorVector& other);
  HXColorVector& operator*=(const HXColorVector& other);

  /// Root of the sum of the squares of all four values, summed from the first.
  float Length() const;

  /// Not checked; `index` is 0..3.
  float& operator[](short index) { return values_[static_cast<unsigned short>(index)]; }
  const float& operator[](short index) const { return values_[static_cast<unsigned short>(index)]; }
  const Channels& GetChannels() const { return values_; }

  const HXMeasureConditions& GetMeasureConditions() const { return conditions_; }
  void SetMeasureConditions(const HXMeasureConditions& conditions) { conditions_ = conditions; }
  /// `conditions`, but with the physical filter of `physical`.
  void SetMeasureConditions(const HXMeasureConditions& physical,
                            const HXMeasureConditions& conditions);

 private:
  HXMeasureConditions conditions_;  // first: a copy of it may fail, and then the values stay too
  Channels values_{};
};

}  // namespace Aldermoor::Tristim

#endif  // ALDERMOOR_TRISTIM_HXCOLORVECTOR_H
