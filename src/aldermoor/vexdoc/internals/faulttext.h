#ifndef ALDERMOOR_VEXDOC_INTERNALS_FAULTTEXT_H
#define ALDERMOOR_VEXDOC_INTERNALS_FAULTTEXT_H

#include <cstddef>
#include <string>
#include <string_view>

/// The words of faults and dumps.
namespace Aldermoor::Vexdoc::Internals {

/// A text of a file in quotes, cut if it is long.
std::string Quoted(std::string_view text);

/// "1 sample", "2 samples".
std::string Counted(std::size_t number, const char* noun);

/// The shortest text that reads back to the same float: "nan", "inf" where it is no number.
std::string NumberText(float value);

/// What keeps a text of a document from being read as the number that it means; empty if nothing
/// does.
std::string NumberFault(std::string_view text);

/// "set 'x', sample 'y', Spectrum 1: ", as far as it goes; empty for the document itself.
std::string PlaceText(const std::string& set, const std::string& sample,
                      const std::string& attribute);

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_FAULTTEXT_H
