#ifndef ALDERMOOR_UTILITIES_TOOLS_STRINGTOKENIZER_H
#define ALDERMOOR_UTILITIES_TOOLS_STRINGTOKENIZER_H

#include <string>
#include <vector>

namespace Aldermoor::Utilities::Tools {

/// Splits a text at one character.  The tokens are the maximal runs of other characters, so none
/// is empty and delimiters side by side count as one.
class StringTokenizer {
 public:
  StringTokenizer(const std::string& text, char delimiter);

  const std::vector<std::string>& GetTokens() const { return tokens_; }

 private:
  std::vector<std::string> tokens_;
};

}  // namespace Aldermoor::Utilities::Tools

#endif  // ALDERMOOR_UTILITIES_TOOLS_STRINGTOKENIZER_H
