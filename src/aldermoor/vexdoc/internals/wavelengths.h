#ifndef ALDERMOOR_VEXDOC_INTERNALS_WAVELENGTHS_H
#define ALDERMOOR_VEXDOC_INTERNALS_WAVELENGTHS_H

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "aldermoor/vexdoc/conditions.h"

/// The wavelengths of spectra in XML, and those that conditions stand for.  A document keeps the
/// conditions only, so where the two differ a load moves the values to other wavelengths.
namespace Aldermoor::Vexdoc::Internals {

/// Different wavelengths of one spectrum, nm, ascending.
using Wavelengths = std::vector<unsigned int>;

/// The wavelengths of one spectrum as a file has them.
struct Ruler {
  Wavelengths points;
  /// The first whose text says something else than its number, in words; empty if there is none.
  std::string misread;
};

/// The whole number of nm at the beginning of a condition such as "380nm", -32768 to 32767, with or
/// without blanks, sign and zeros in front; nothing if there is none.
std::optional<std::int16_t> ReadWavelength(const std::string& text);

/// Whether `text`, which begins with a whole number, says something else than that: "400.5nm",
/// "4e2". "400.0 nm" does not.
bool SaysOtherThanItsNumber(const std::string& text);

/// Whether nothing but a fraction and "nm" stands behind the whole number with which `text` begins:
/// "0.38um" is of another unit.
bool IsInNanometres(const std::string& text);

/// SaysOtherThanItsNumber of a condition, and whether a number is read from it at all.
bool IsWavelengthMisread(const std::string& text);

/// Whether `points` are those that a save would write for as many values under `conditions`: from
/// the minimum on in whole steps.  Without a readable range, it is 380 to 730 nm.
bool AreOfConditions(const Wavelengths& points, const Conditions& conditions);

/// Whether `points` are those at which the illuminant of a block with `conditions` may stand: it is
/// read as 380 to 730 nm, but written with the wavelengths of the block.
bool AreOfIllumination(const Wavelengths& points, const Conditions& conditions);

/// Whether `points` have one step, so that their first, last and number say all of them.
bool AreRegular(const Wavelengths& points);

/// Makes minimum, maximum and number of `conditions` those of `points`, which are regular.
void TakeRange(const Wavelengths& points, Conditions& conditions);

/// "31 points at 400, 410, 420 ... 700 nm, but the conditions say from '380nm' to '680nm'".
std::string ContradictionText(const Wavelengths& points, const Conditions& conditions);

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_WAVELENGTHS_H
