#ifndef ALDERMOOR_VEXDOC_CONDITIONKEYS_H
#define ALDERMOOR_VEXDOC_CONDITIONKEYS_H

/// The keys and words of the conditions vocabulary that the document model itself looks at.
namespace Aldermoor::Vexdoc::ConditionKeys {

inline constexpr const char* kIllumination = "Colorimetric.Illumination";
inline constexpr const char* kObserver = "Colorimetric.Observer";
inline constexpr const char* kColorSpace = "ColorSpaceDescription.Type";
inline constexpr const char* kWavelengthMin = "Physical.WavelengthSpectrumMin";
inline constexpr const char* kWavelengthMax = "Physical.WavelengthSpectrumMax";
inline constexpr const char* kPointCount = "Physical.NumberOfDataPointsSpectrum";
inline constexpr const char* kSpectrumType = "Physical.SpectrumType";

/// The illumination that refers to the custom illumination of a block.
inline constexpr const char* kUserdefined = "Userdefined";

}  // namespace Aldermoor::Vexdoc::ConditionKeys

#endif  // ALDERMOOR_VEXDOC_CONDITIONKEYS_H
