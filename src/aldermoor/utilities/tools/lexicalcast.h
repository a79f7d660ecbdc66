#ifndef ALDERMOOR_UTILITIES_TOOLS_LEXICALCAST_H
#define ALDERMOOR_UTILITIES_TOOLS_LEXICALCAST_H

#include <sstream>
#include <stdexcept>

#include "aldermoor/utilities/tools/typename.h"

namespace Aldermoor::Utilities::Tools {

/// Writes `value` to a stream and reads it back as a `To`.  Floats become text of six digits, and
/// of a text only the number at its beginning counts ("380nm" is 380).
///
/// Throws: std::invalid_argument if no value of type `To` can be read from the beginning.
template <class To, class From>
To lexical_cast(const From& value) {
  std::stringstream stream;
  stream << value;
  To result;
  stream >> result;
  if (stream.fail()) {
    std::ostringstream text;
    text << value;
    throw std::invalid_argument("lexical_cast(): fail to convert '" + text.str() + "' from " +
                                TypeName<From>() + " to " + TypeName<To>());
  }
  return result;
}

}  // namespace Aldermoor::Utilities::Tools

#endif  // ALDERMOOR_UTILITIES_TOOLS_LEXICALCAST_H
