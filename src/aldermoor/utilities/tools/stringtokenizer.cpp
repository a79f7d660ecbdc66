#include "aldermoor/utilities/tools/stringtokenizer.h"

#include "aldermoor/utilities/exceptions/frame.h"

namespace Aldermoor::Utilities::Tools {

StringTokenizer::StringTokenizer(const std::string& text, char delimiter) try {
  auto begin = text.find_first_not_of(delimiter);
  while (begin != std::string::npos) {
    const auto end = text.find(delimiter, begin);
    tokens_.push_back(text.substr(begin, end - begin));
    begin = text.find_first_not_of(delimiter, end);
  }
}
ALDERMOOR_FRAME(Aldermoor::Utilities::Tools::StringTokenizer::StringTokenizer)

}  // namespace Aldermoor::Utilities::Tools
