#ifndef ALDERMOOR_TRISTIM_HXMEASURECONDITIONS_H
#define ALDERMOOR_TRISTIM_HXMEASURECONDITIONS_H

#include <array>
#include <cstddef>
#include <cstdint>
#include <map>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "aldermoor/tristim/internals/hxillumination.h"
#include "aldermoor/tristim/internals/initialisator.h"
#include "aldermoor/utilities/tools/smartpointer.h"

namespace Aldermoor::Tristim {

class HXSpectrum;

/// Filter in the instrument.
enum class PhysicalFilter : std::int32_t {
  Undefined = 0,
  No = 1,
  Polarizer = 2,
  D65 = 3,
  UVCut = 4,
  LastSelectable = 5,
  Custom = 10,
  CalibrationCheck = 11,
  ND0 = 12
};

enum class Observer : std::int32_t { Undefined = -1, TwoDegree = 0, TenDegree = 1 };

/// What counts as white: the perfect reflector, or the paper white of BaseCalculator.
enum class WhiteBase : std::int32_t { Undefined = -1, Absolute = 0, Paper = 1, Automatic = 2 };

enum class DensityStandard : std::int32_t {
  Undefined = -1,
  DIN = 0,
  DINNB = 1,
  ANSIA = 2,
  ANSIE = 3,
  ANSII = 4,
  ANSIT = 5,
  SPI = 6,
  User = 7
};

enum class DensityFilterMode : std::int32_t {
  Undefined = -1,
  Black = 0,
  Cyan = 1,
  Magenta = 2,
  Yellow = 3,
  Max = 4,
  Auto = 5
};

/// What a colorimetric value refers to: illuminant, observer, white, colour space and so on.  The
/// typed twin of the conditions of a document, whose keys and words it speaks.
///
/// Defaults: D65, two-degree, white base automatic, CIELab, absolute vector, no filter.
/// Grid: always 36 points from 380 nm to 730 nm; the three keys of the grid can be read, and
/// writing them does nothing.
/// Ownership: value; a user-defined illuminant curve is shared between copies.
/// Shared state: the table of supported values, which the first object builds.
class HXMeasureConditions : public Internals::GlobalStringInitialisator {
 public:
  static constexpr std::size_t kKeyCount = 13;
  using KeyedWords = std::array<std::pair<std::string_view, std::string>, kKeyCount>;

  HXMeasureConditions();
  HXMeasureConditions(const HXMeasureConditions& other);
  /// Nothing has changed if memory runs out.
  HXMeasureConditions& operator=(const HXMeasureConditions& other);
  HXMeasureConditions& operator=(HXMeasureConditions&& other) noexcept;
  virtual ~HXMeasureConditions();

  /// Custom conditions take no part.  Curves are equal if they are one object, or as spectra.
  bool operator==(const HXMeasureConditions& other) const;

  /// Writes a condition by its words.  Other keys than those of the vocabulary are accepted once
  /// "CustomCondition" holds the word "Enable".
  /// Throws: TristimException for a bad word or key, and then nothing has changed.
  void SetMeasureCondition(std::string_view key, const std::string& value);
  /// All of them in map order; a failure leaves the ones before it applied.
  void SetMeasureConditions(const std::map<std::string, std::string>& conditions);
  /// The word of a condition; "Undefined" for a key without a value, which is no failure.
  [[nodiscard]] std::string GetMeasureCondition(std::string_view key) const;
  /// The keys of the vocabulary in ascending order, each with its word.
  [[nodiscard]] KeyedWords GetMeasureConditions() const;

  /// The words that `key` can take, or the channel labels of a colour space.  An unknown key gives
  /// an empty list.
  static const std::vector<std::string>& GetSupportedValues(std::string_view key);
  /// The label of a channel in the colour space and kind of vector held here.  `index` is 0..2, and
  /// 0..3 for absolute "CMYK".
  [[nodiscard]] std::string GetElementName(unsigned short index) const;

  const HXIllumination& GetIllumination() const { return illumination_; }
  /// Drops the user-defined curve, unless the new illumination is "Userdefined".
  void SetIllumination(const HXIllumination& illumination);

  /// The curve that goes with the illumination "Userdefined".
  /// Throws: NullPointerException if there is none.
  const HXSpectrum& GetUserdefinedIllumination() const;
  /// Keeps a copy of `spectrum` and sets the illumination to "Userdefined".
  void SetUserdefinedIllumination(const HXSpectrum& spectrum);
  /// Whether both refer to the same curve object, or both to none.
  bool SharesUserdefinedIllumination(const HXMeasureConditions& other) const;

  PhysicalFilter GetPhysicalFilter() const { return physical_filter_; }
  /// Takes the physical filter of `other` and nothing else.
  void SetPhysMeasCond(const HXMeasureConditions& other);

  Observer GetObserver() const { return observer_; }
  void SetObserver(Observer observer) { observer_ = observer; }
  WhiteBase GetWhiteBase() const { return white_base_; }
  void SetWhiteBase(WhiteBase white_base) { white_base_ = white_base; }
  DensityStandard GetDensityStandard() const { return density_standard_; }
  DensityFilterMode GetDensityFilterMode() const { return density_filter_mode_; }

  /// The same as reading the key, without a look-up or a copy.
  const std::string& GetColorSpace() const { return color_space_; }
  const std::string& GetDeltaEFormula() const { return delta_e_formula_; }

 private:
  struct Key;
  static const Key* FindKey(std::string_view name);
  bool IsCustomEnabled() const;

  HXIllumination illumination_{IlluminationType::kD65};
  PhysicalFilter physical_filter_ = PhysicalFilter::No;
  Observer observer_ = Observer::TwoDegree;
  WhiteBase white_base_ = WhiteBase::Automatic;
  DensityStandard density_standard_ = DensityStandard::DIN;
  DensityFilterMode density_filter_mode_ = DensityFilterMode::Auto;
  std::string color_space_;
  std::string delta_e_formula_;
  std::string vector_kind_;
  // Without the entry "CustomCondition" custom conditions are off, so a default object, of which
  // every spectrum and vector has one, allocates nothing.
  std::map<std::string, std::string, std::less<>> custom_conditions_;
  std::string spectrum_type_;
  Utilities::Tools::SmartPointer<HXSpectrum> userdefined_illumination_;
};

}  // namespace Aldermoor::Tristim

#endif  // ALDERMOOR_TRISTIM_HXMEASURECONDITIONS_H
