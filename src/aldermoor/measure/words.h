#ifndef ALDERMOOR_MEASURE_WORDS_H
#define ALDERMOOR_MEASURE_WORDS_H

#include <span>
#include <string>
#include <string_view>

#include "aldermoor/export.h"

/// The words that the conditions of a document may hold, for whoever shows or checks them.
///
/// Words are compared exactly, case included.  Requests of the document classes keep their default
/// for a word that is none; what stands in this folder refuses it.
namespace Aldermoor::Measure {

/// Between these, kelvin, daylight is defined.  Outside, its formulas go on and mean less: the
/// white of 1000 K has a negative Z.  Source: CIE 15:2004, 3.1.
inline constexpr int kColdestDaylight = 4000;
inline constexpr int kHottestDaylight = 25000;

/// Every key that has a list of words, such as "Colorimetric.Observer".
ALDERMOOR_EXPORT std::span<const std::string_view> WordKeys();

/// The words for `key`, in the order in which they are shown; none for a key without a list.
///
/// Besides, every key takes "Undefined" for no value, "Colorimetric.Illumination" a daylight as
/// "Dxx, Temperature:6500", and "Physical.SpectrumType" any text.
ALDERMOOR_EXPORT std::span<const std::string_view> WordsOf(std::string_view key);

/// The one of `words` that was probably meant by `word`, which is none of them; empty if none is
/// near.
ALDERMOOR_EXPORT std::string_view NearestWord(std::string_view word,
                                              std::span<const std::string_view> words);

/// The message for a `word` that is none of `words`: `what` it was given for, the words and
/// `others`, which describe further ones, and the nearest word.
ALDERMOOR_EXPORT std::string NoSuchWord(std::string_view what, std::string_view word,
                                        std::span<const std::string_view> words,
                                        std::span<const std::string_view> others = {});

/// Whether colorimetry computes with `word` under `key`, and does not put a default in its place.
/// A key without a list takes everything.
ALDERMOOR_EXPORT bool IsWordOf(std::string_view key, std::string_view word);

/// Throws: MeasureException with key, word, and the words that would do, unless IsWordOf.
ALDERMOOR_EXPORT void CheckWord(std::string_view key, std::string_view word);

}  // namespace Aldermoor::Measure

#endif  // ALDERMOOR_MEASURE_WORDS_H
