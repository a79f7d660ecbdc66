#ifndef ALDERMOOR_MEASURE_SUPPORT_H
#define ALDERMOOR_MEASURE_SUPPORT_H

#include <initializer_list>
#include <string>
#include <string_view>

#include "aldermoor/measure/measureexception.h"
#include "aldermoor/tristim/tristimexception.h"
#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/conditions.h"
#include "aldermoor/vexdoc/spectrum.h"

/// What the functions of this folder share; not installed.
namespace Aldermoor::Measure {

/// Throws: MeasureException if one of `keys` has a word in `conditions` that colorimetry does not
/// know, and for which it would put its default.
void CheckWords(const Vexdoc::Conditions& conditions, std::initializer_list<std::string_view> keys);

/// The same for illumination, observer and white base, and for an illumination "Userdefined"
/// without a curve of 36 values.
void CheckViewing(const Vexdoc::Conditions& conditions);

/// The same for what decides how `spectrum` is read: whether it is an emission.
void CheckKind(const Vexdoc::Spectrum& spectrum);

/// The same for all that a colour refers to, with its colour space.
void CheckColor(const Vexdoc::ColorVector& color);

/// Why a colour under `conditions` cannot be computed.
std::string ReasonOfFailure(const Vexdoc::Conditions& conditions, const std::string& what);

inline constexpr const char* kNoPaperWhite = "there is no paper white";

/// Why what is relative to paper has no value.
inline std::string NoPaperWhite() {
  return std::string("the white base is \"Paper\" and ") + kNoPaperWhite;
}

/// Runs `compute` and turns a failure of colorimetry into a MeasureException.  A text that begins
/// with its name says nothing of the cause, so `reason()` does.
template <class Compute, class Reason>
auto Computed(Compute compute, Reason reason) {
  try {
    return compute();
  } catch (const Tristim::TristimException& e) {
    constexpr const char* kName = "TristimCalculator";
    const std::string text = e.what();
    MeasureException failure(text.starts_with(kName) ? reason() : text, "");
    failure.where() = e.where();
    throw failure;
  }
}

}  // namespace Aldermoor::Measure

#endif  // ALDERMOOR_MEASURE_SUPPORT_H
