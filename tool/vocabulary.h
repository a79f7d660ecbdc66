#ifndef ALDERMOOR_TOOL_VOCABULARY_H
#define ALDERMOOR_TOOL_VOCABULARY_H

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

/// The words of the conditions, from the library.  A request of a sample keeps its default for a
/// word that is none, so a misspelt one is found here or never.
namespace Aldermoor::Tool {

/// The number of values in the spectra of which colours and densities are computed.
inline constexpr std::size_t kBands = 36;

inline const std::string kTypeKey = "ColorSpaceDescription.Type";
inline const std::string kIlluminationKey = "Colorimetric.Illumination";
inline const std::string kObserverKey = "Colorimetric.Observer";
inline const std::string kWhiteBaseKey = "Colorimetric.WhiteBase";
inline const std::string kCustomKey = "CustomCondition";
inline const std::string kEnable = "Enable";
inline const std::string kUserdefined = "Userdefined";
inline const std::string kEmission = "Emission";

/// The words of a list that is separated by blanks.
std::vector<std::string_view> SplitWords(std::string_view list);

/// Throws: UsageError that names `what`, lists `words` and `others`, which describe further ones,
/// and proposes the nearest, if `word` is none of `words`.
void CheckWord(const std::string& what, const std::string& word,
               const std::vector<std::string_view>& words,
               const std::vector<std::string_view>& others = {});

/// The words for `key`; none for a key outside the vocabulary.  The illuminants are those without
/// a form of their own.
std::vector<std::string_view> WordsFor(const std::string& key);
inline bool IsKey(const std::string& key) {
  return !WordsFor(key).empty();
}
/// The same with blanks between them, for a help.
std::string ShownWords(const std::string& key);
/// Every key of the vocabulary.
std::vector<std::string_view> AllKeys();

/// The value of "Colorimetric.Illumination" for a word: itself, or that of a daylight as "6500K"
/// or "Dxx, Temperature:6500".  A temperature for which daylight is not defined is reported.
/// Throws: UsageError, with `what` in the text.
std::string IlluminationValue(const std::string& what, const std::string& word);

/// Checks `value` against the words of `key`, which belongs to the vocabulary, and returns it in
/// the form that the library reads.  Throws: UsageError.
std::string ConditionValue(const std::string& what, const std::string& key,
                           const std::string& value);

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TOOL_VOCABULARY_H
