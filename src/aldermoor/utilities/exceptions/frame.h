#ifndef ALDERMOOR_UTILITIES_EXCEPTIONS_FRAME_H
#define ALDERMOOR_UTILITIES_EXCEPTIONS_FRAME_H

#include <exception>
#include <string>

#include "aldermoor/export.h"
#include "aldermoor/utilities/exceptions/location.h"

namespace Aldermoor::Utilities::Exceptions {

/// Throws the traceable counterpart of a plain standard exception.
class ALDERMOOR_EXPORT ExceptionTranslator {
 public:
  explicit ExceptionTranslator(const std::string& location);

  /// Throws the exception of this library for the exact type of `e`, with its message and the
  /// location held here.  A type without a counterpart becomes a RuntimeException whose message
  /// begins with the name of that type.
  [[noreturn]] void Rethrow(const std::exception& e) const;

 private:
  std::string location_;
};

/// The one clause of every frame; call it inside a `catch (...)` only.
///
/// A TraceableException gets the location appended and goes on as the same object; a standard
/// exception becomes its traceable counterpart; anything else becomes a RuntimeException.
[[noreturn]] ALDERMOOR_EXPORT void AddLocation(const char* function, const char* file,
                                               unsigned int line);
/// The same for templates, whose name is put together only when it is needed.
[[noreturn]] ALDERMOOR_EXPORT void AddLocation(const std::string& function, const char* file,
                                               unsigned int line);

}  // namespace Aldermoor::Utilities::Exceptions

/// Closes a function-try-block: `void A::B() try { ... } ALDERMOOR_FRAME(A::B)`.
/// The good path pays nothing for it.
#define ALDERMOOR_FRAME(...)                                                           \
  catch (...) {                                                                        \
    ::Aldermoor::Utilities::Exceptions::AddLocation(#__VA_ARGS__, __FILE__, __LINE__); \
  }

/// The frame of a template member; `function` is a std::string expression that gives the
/// qualified name with its arguments spelled out.  It is evaluated on failure only.
#define ALDERMOOR_TEMPLATE_FRAME(function)                                           \
  catch (...) {                                                                      \
    ::Aldermoor::Utilities::Exceptions::AddLocation((function), __FILE__, __LINE__); \
  }

#endif  // ALDERMOOR_UTILITIES_EXCEPTIONS_FRAME_H
