#ifndef ALDERMOOR_TRISTIM_HXSPECTRUM_H
#define ALDERMOOR_TRISTIM_HXSPECTRUM_H

#include <array>
#include <vector>

#include "aldermoor/tristim/hxmeasureconditions.h"

namespace Aldermoor::Tristim {

/// A spectrum on the measuring grid, with the conditions under which it was measured.
///
/// Grid: band i is 380 + 10·i nm, i = 0..35.  Scale: reflectance, 1 = perfect reflector; the same
/// for transmittance, and any scale for emission.
/// Ownership: value; copying copies the conditions too.
class HXSpectrum {
 public:
  static constexpr unsigned kBands = 36;
  using Bands = std::array<float, kBands>;

  /// Zeros under default conditions.
  HXSpectrum() = default;
  /// Throws: TristimException unless there are 36 values.
  explicit HXSpectrum(const std::vector<float>& values);
  HXSpectrum(const std::vector<float>& values, const HXMeasureConditions& conditions);
  /// From an array of at least 36 values.
  explicit HXSpectrum(const float* values);
  HXSpectrum(const float* values, const HXMeasureConditions& conditions);
  HXSpectrum(const HXSpectrum&) = default;
  HXSpectrum& operator=(const HXSpectrum&) = default;
  ~HXSpectrum() = default;

  /// Values by ==, so that a NaN differs from everything, and conditions.
  bool operator==(const HXSpectrum& other) const;

  /// Not checked; `index` is below 36.
  float& operator[](unsigned int index) { return values_[index]; }
  float operator[](unsigned int index) const { return values_[index]; }

  const HXMeasureConditions& GetMeasureConditions() const { return conditions_; }
  HXMeasureConditions GetPhysMeasCond() const { return conditions_; }
  void SetMeasureConditions(const HXMeasureConditions& conditions) { conditions_ = conditions; }

  std::vector<float> GetValues() const;
  /// The values themselves, without a copy.
  const Bands& GetBands() const { return values_; }

  /// Whether any value is above 0.
  bool IsValid() const;
  unsigned int GetNrOfDataPoints() const { return kBands; }

  /// The band at or below `waveLength` (nm); 0 for a wavelength outside the grid.
  unsigned short GetArrayIndex(unsigned short waveLength) const;
  /// The wavelength of a band, nm; 0 for an index beyond the grid.
  unsigned short GetWaveLength(unsigned short index) const;

 private:
  HXMeasureConditions conditions_;  // first: a copy of it may fail, and then the values stay too
  Bands values_{};
};

}  // namespace Aldermoor::Tristim

#endif  // ALDERMOOR_TRISTIM_HXSPECTRUM_H
