#ifndef ALDERMOOR_PYTHON_REQUEST_H
#define ALDERMOOR_PYTHON_REQUEST_H

#include <array>
#include <cstddef>
#include <optional>
#include <span>
#include <string>
#include <vector>

#include <pybind11/pybind11.h>

#include "aldermoor/vexdoc/conditions.h"
#include "aldermoor/vexdoc/spectrum.h"

/// Conditions from the arguments of Python, whose words are checked here: the library keeps a
/// default for a word that it does not know.
///
/// Conditions under an illuminant of numbers, and all spectra, hold blocks that the process shares:
/// who makes, copies or frees them needs the LibraryLock.  Under an illuminant with a name they
/// touch nothing but themselves.
namespace Aldermoor::Python {

inline constexpr std::size_t kSpectrumBands = 36;
using Bands = std::array<float, kSpectrumBands>;

/// How samples are looked at.
struct Viewing {
  bool HasNamedIlluminant() const { return pybind11::isinstance<pybind11::str>(illuminant); }

  pybind11::object illuminant;  ///< a word, a daylight as "6500K", or 36 numbers
  std::string observer;
};

/// Throws: ValueError that names `argument`, if `word` is not in the tuple `list` of
/// aldermoor._words.
void CheckWord(const char* argument, const std::string& word, const char* list);

/// Throws: ValueError that names `argument`, if a value is NaN or infinite.
void CheckFinite(const char* argument, std::span<const float> values);

/// Throws: TypeError, ValueError.
Bands ReadBands(const char* argument, const pybind11::object& values);
/// Nothing for None.
std::optional<Bands> ReadPaper(const pybind11::object& paper);

/// Throws: ValueError for words that are none, and what ReadBands throws.
Vexdoc::Conditions MakeConditions(const Viewing& viewing);
Vexdoc::Conditions MakeConditions(const Viewing& viewing, const std::string& space);

inline std::size_t CountChannels(const std::string& space) {
  return space == "CMYK" ? 4 : 3;
}
/// The labels of the channels of a colour space.  Needs the LibraryLock.
std::vector<std::string> LabelsOf(const std::string& space);

/// The conditions of a reflectance spectrum of `count` values; the range of wavelengths is there
/// for 36.
Vexdoc::Conditions MakeSpectrumConditions(std::size_t count = kSpectrumBands);
Vexdoc::Spectrum MakeSpectrum(const Bands& values);

}  // namespace Aldermoor::Python

#endif  // ALDERMOOR_PYTHON_REQUEST_H
