#ifndef ALDERMOOR_TRISTIM_INTERNALS_VOCABULARY_H
#define ALDERMOOR_TRISTIM_INTERNALS_VOCABULARY_H

#include <array>
#include <string_view>

/// The words of measuring conditions: the keys under which a document stores them, and the values.
/// All comparisons are exact, case included.
namespace Aldermoor::Tristim::Vocabulary {

/// Keys: a group, a dot and a name; "CustomCondition" stands alone.
inline constexpr char kFilterKey[] = "Physical.Filter";
inline constexpr char kNumberOfDataPointsKey[] = "Physical.NumberOfDataPointsSpectrum";
inline constexpr char kWavelengthMaxKey[] = "Physical.WavelengthSpectrumMax";
inline constexpr char kWavelengthMinKey[] = "Physical.WavelengthSpectrumMin";
inline constexpr char kSpectrumTypeKey[] = "Physical.SpectrumType";
inline constexpr char kIlluminationKey[] = "Colorimetric.Illumination";
inline constexpr char kObserverKey[] = "Colorimetric.Observer";
inline constexpr char kWhiteBaseKey[] = "Colorimetric.WhiteBase";
inline constexpr char kDensityStandardKey[] = "Colorimetric.DensityStandard";
inline constexpr char kDensityFilterModeKey[] = "Colorimetric.DensityFilterMode";
inline constexpr char kColorSpaceKey[] = "ColorSpaceDescription.Type";
inline constexpr char kVectorKindKey[] = "ColorSpaceDescription.AbsoluteOrDeltaVector";
inline constexpr char kDeltaEFormulaKey[] = "ColorSpaceDescription.DeltaEFormula";
inline constexpr char kCustomConditionKey[] = "CustomCondition";

/// In front of a colour-space word: the key of its channel labels.
inline constexpr char kChannelLabelsPrefix[] = "ColorSpaceDescription.";

/// No value; also the end mark of every list below.
inline constexpr char kUndefined[] = "Undefined";

/// The measuring grid is the same for all conditions; these three cannot be changed.
inline constexpr char kNumberOfDataPoints[] = "36";
inline constexpr char kWavelengthMax[] = "730nm";
inline constexpr char kWavelengthMin[] = "380nm";

inline constexpr char kCIELab[] = "CIELab";
inline constexpr char kCIELCh[] = "CIELCh";
inline constexpr char kCIELuv[] = "CIELuv";
inline constexpr char kCIELChuv[] = "CIELChuv";
inline constexpr char kCIEuvY1960[] = "CIEuvY1960";
inline constexpr char kCIEuvY1976[] = "CIEuvY1976";
inline constexpr char kCIEXYZ[] = "CIEXYZ";
inline constexpr char kCIExyY[] = "CIExyY";
inline constexpr char kHunterLab[] = "HunterLab";
inline constexpr char kRxRyRz[] = "RxRyRz";
inline constexpr char kLABhx[] = "LABhx";
inline constexpr char kLCHhx[] = "LCHhx";
inline constexpr char kRGB[] = "RGB";
inline constexpr char kCMYK[] = "CMYK";

/// Formula words that are no colour spaces.
inline constexpr char kFMCII[] = "FMCII";
inline constexpr char kCMC[] = "CMC";
inline constexpr char k94[] = "94";
inline constexpr char k2000[] = "2000";

inline constexpr char kAbsoluteVector[] = "AbsoluteVector";
inline constexpr char kDeltaVector[] = "DeltaVector";

inline constexpr char kRemission[] = "Remission";

inline constexpr char kUserdefined[] = "Userdefined";
inline constexpr char kEmission[] = "Emission";
/// Daylight of any colour temperature: this text and whole kelvin behind it.
inline constexpr char kDaylightPrefix[] = "Dxx, Temperature:";

inline constexpr char kEnable[] = "Enable";

/// Lists of supported values, each closed by "Undefined", which is accepted but not listed.
inline constexpr auto kColorSpaces = std::to_array<std::string_view>(
    {kCIELab, kCIELCh, kCIELuv, kCIELChuv, kCIEuvY1960, kCIEuvY1976, kCIEXYZ, kCIExyY, kHunterLab,
     kRxRyRz, kLABhx, kLCHhx, kRGB, kCMYK, kUndefined});
inline constexpr auto kDeltaEFormulas = std::to_array<std::string_view>(
    {kCIELab, kCIELuv, kLABhx, kFMCII, kCMC, k94, k2000, kUndefined});
inline constexpr auto kVectorKinds =
    std::to_array<std::string_view>({kAbsoluteVector, kDeltaVector, kUndefined});

}  // namespace Aldermoor::Tristim::Vocabulary

#endif  // ALDERMOOR_TRISTIM_INTERNALS_VOCABULARY_H
