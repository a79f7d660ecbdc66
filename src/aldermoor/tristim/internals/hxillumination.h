#ifndef ALDERMOOR_TRISTIM_INTERNALS_HXILLUMINATION_H
#define ALDERMOOR_TRISTIM_INTERNALS_HXILLUMINATION_H

#include <cstdint>

namespace Aldermoor::Tristim {

/// Numbers of the illumination types.
namespace IlluminationType {
inline constexpr int kUndefined = -1;
inline constexpr int kA = 0;
inline constexpr int kB = 1;
inline constexpr int kC = 2;
inline constexpr int kD75 = 3;
inline constexpr int kD65 = 4;
inline constexpr int kD55 = 5;
inline constexpr int kD50 = 6;
inline constexpr int kDaylight = 7;  ///< of the colour temperature that is held beside it
inline constexpr int kF2 = 8;
inline constexpr int kF7 = 9;
inline constexpr int kF11 = 10;
inline constexpr int kFluorescent = 11;  ///< of the F number that is held beside it
inline constexpr int kUserdefined = 12;
inline constexpr int kEmission = 13;
inline constexpr int kDaylightS0 = 14;  ///< components of daylight; these three have no word
inline constexpr int kDaylightS1 = 15;
inline constexpr int kDaylightS2 = 16;
}  // namespace IlluminationType

/// Names an illuminant: a type of IlluminationType, the kelvin of a daylight of any colour
/// temperature, and the number of a fluorescent illuminant.
///
/// Ownership: value.  The temperature counts for type 7 only, the number for type 11 only, but
/// both take part in every comparison.
class HXIllumination {
 public:
  HXIllumination() = default;
  explicit HXIllumination(int type) : illumination_type_(type) {}

  bool operator!=(const HXIllumination& other) const {
    return illumination_type_ != other.illumination_type_ || fluorescence_ != other.fluorescence_ ||
           color_temperature_ != other.color_temperature_;
  }
  bool operator==(const HXIllumination& other) const { return !(*this != other); }

  int GetIlluminationType() const { return illumination_type_; }
  void SetIlluminationType(int type) { illumination_type_ = type; }

  /// Kelvin.
  std::int16_t GetColorTemperature() const { return color_temperature_; }
  void SetColorTemperature(std::int16_t temperature) { color_temperature_ = temperature; }

  /// 1 for F1 up to 12 for F12.
  std::uint8_t GetFluorescence() const { return fluorescence_; }
  void SetFluorescence(std::uint8_t number) { fluorescence_ = number; }

 private:
  std::uint8_t fluorescence_ = 0;
  std::int16_t color_temperature_ = 0;
  std::int32_t illumination_type_ = IlluminationType::kUndefined;
};

}  // namespace Aldermoor::Tristim

#endif  // ALDERMOOR_TRISTIM_INTERNALS_HXILLUMINATION_H
