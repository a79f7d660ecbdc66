#ifndef ALDERMOOR_UTILITIES_EXCEPTIONS_LOCATION_H
#define ALDERMOOR_UTILITIES_EXCEPTIONS_LOCATION_H

#include <string>

#include "aldermoor/export.h"

namespace Aldermoor::Utilities::Exceptions {

/// The text of one place in the code: `prefix`, "::", `function`, "(): ", the path of `file` from
/// its last "/src/" (or "\src\") on, ":" and `line`.  A path without that part stays whole.
ALDERMOOR_EXPORT std::string MakeLocation(const char* prefix, const char* function,
                                          const char* file, unsigned int line);

/// Replaces every `token` in `text` and returns `text`.
///
/// The search goes on behind the replacement, so that a token inside it stays as it is.  Behind a
/// shorter replacement it goes on by the token's own length, and passes over a token that begins
/// inside that stretch.
ALDERMOOR_EXPORT std::string& ReplaceAll(const std::string& token, const std::string& replacement,
                                         std::string& text);

/// `pattern` with "%NAME%" (or whatever `token` says) filled in; for one-line use of ReplaceAll.
ALDERMOOR_EXPORT std::string Filled(std::string pattern, const std::string& token,
                                    const std::string& replacement);

}  // namespace Aldermoor::Utilities::Exceptions

/// The location of the line where it stands, inside the function of that qualified name.
#define ALDERMOOR_HERE(...) \
  ::Aldermoor::Utilities::Exceptions::MakeLocation("", #__VA_ARGS__, __FILE__, __LINE__)

#endif  // ALDERMOOR_UTILITIES_EXCEPTIONS_LOCATION_H
