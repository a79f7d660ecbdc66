#ifndef ALDERMOOR_TRISTIM_INTERNALS_MEASURECONDITIONGETSTRINGS_H
#define ALDERMOOR_TRISTIM_INTERNALS_MEASURECONDITIONGETSTRINGS_H

#include <string>

#include "aldermoor/tristim/hxmeasureconditions.h"

namespace Aldermoor::Tristim::Internals {

/// Turns the words of measuring conditions into typed values and back.  It accepts a few words
/// that the lists of supported values do not show ("Undefined", "ANSIE", an F number ...).
///
/// Shared state: none.
/// Throws: TristimException, the word and what it is not, for a word outside the table.  ToString
/// never fails; a number outside its table is "Undefined".
class MeasureConditionTranslator {
 public:
  static WhiteBase GetWhiteBase(const std::string& value);
  static Observer GetObserver(const std::string& value);
  static DensityStandard GetDensityStandard(const std::string& value);
  static DensityFilterMode GetDensityFilterMode(const std::string& value);
  static PhysicalFilter GetPhysicalFilter(const std::string& value);

  /// Besides plain words: "F" and a number, and "Dxx, Temperature:" and whole kelvin, of which
  /// the first 17 characters may be anything that starts with a "D".
  /// Throws: besides TristimException, std::invalid_argument if no number can be read at its
  /// place, and std::out_of_range for a "D" word of less than 17 characters.
  static HXIllumination GetIllumination(const std::string& value);

  /// These three hand a valid word back as it is.
  static const std::string& GetRelativeOrAbsoluteVector(const std::string& value);
  static const std::string& GetColorSpace(const std::string& value);
  static const std::string& GetDeltaEFormula(const std::string& value);

  static std::string ToString(WhiteBase value);
  static std::string ToString(Observer value);
  static std::string ToString(DensityStandard value);
  static std::string ToString(DensityFilterMode value);
  static std::string ToString(PhysicalFilter value);
  static std::string ToString(const HXIllumination& value);
};

}  // namespace Aldermoor::Tristim::Internals

#endif  // ALDERMOOR_TRISTIM_INTERNALS_MEASURECONDITIONGETSTRINGS_H
