#ifndef ALDERMOOR_UTILITIES_EXCEPTIONS_EXCEPTIONADAPTER_H
#define ALDERMOOR_UTILITIES_EXCEPTIONS_EXCEPTIONADAPTER_H

#include <exception>
#include <new>
#include <sstream>
#include <stdexcept>
#include <string>
#include <type_traits>
#include <typeinfo>

#include "aldermoor/export.h"
#include "aldermoor/utilities/exceptions/traceableexception.h"

namespace Aldermoor::Utilities::Exceptions {

/// The traceable half of an exception: what() goes to the operation that the whole provides.
class ALDERMOOR_EXPORT TraceableExceptionAdapter : public TraceableException {
 public:
  explicit TraceableExceptionAdapter(const std::string& location) : TraceableException(location) {}
  TraceableExceptionAdapter(const TraceableExceptionAdapter&) = default;
  TraceableExceptionAdapter& operator=(const TraceableExceptionAdapter&) = default;
  ~TraceableExceptionAdapter() override = default;

  const char* what() const noexcept override { return traceable_what(); }
  /// The bare message, whether or not what() ends in the trace.
  virtual const char* traceable_what() const noexcept = 0;
};

/// The standard half of an exception; `E` is the standard type that it can be caught as.
template <class E>
class ALDERMOOR_EXPORT StdExceptionAdapter : public E {
 public:
  explicit StdExceptionAdapter([[maybe_unused]] const std::string& message) requires
      std::is_constructible_v<E, const std::string&> : E(message) {}
  explicit StdExceptionAdapter(const std::string&) requires(
      !std::is_constructible_v<E, const std::string&>) {}
  StdExceptionAdapter(const StdExceptionAdapter&) = default;
  StdExceptionAdapter& operator=(const StdExceptionAdapter&) = default;
  ~StdExceptionAdapter() override = default;

  const char* what() const noexcept override { return adapted_what(); }
  virtual const char* adapted_what() const noexcept = 0;
};

/// Joins a standard exception type with the trace.  Every exception of the library derives from
/// one of these, so that it can be caught as `E`, as std::exception and as TraceableException.
///
/// what() is the bare message, or with TraceableException::use_implicite_stack_trace(true) the
/// message, a newline and the trace.  The pointer is valid until the next what() on the object.
/// The standard types that carry no text (std::bad_alloc, std::bad_cast, std::bad_typeid) have a
/// fixed one here, since the texts of the standard libraries differ.
template <class E>
class ALDERMOOR_EXPORT ExceptionAdapter : public StdExceptionAdapter<E>,
                                          public TraceableExceptionAdapter {
 public:
  ExceptionAdapter(const std::string& message, const std::string& location)
      : StdExceptionAdapter<E>(message), TraceableExceptionAdapter(location) {}
  ExceptionAdapter(const ExceptionAdapter&) = default;
  ExceptionAdapter& operator=(const ExceptionAdapter&) = default;
  ~ExceptionAdapter() override = default;

  const char* what() const noexcept override;
  const char* adapted_what() const noexcept override { return what(); }
  const char* traceable_what() const noexcept override;
  void prepend(const std::string& context) override;

 private:
  mutable std::string text_;
};

template <class E>
const char* ExceptionAdapter<E>::what() const noexcept {
  if (!TraceableException::use_implicite_stack_trace()) {
    return traceable_what();
  }
  try {
    std::ostringstream trace;
    this->print_stack_trace(trace);
    text_ = traceable_what();
    if (const std::string lines = trace.str(); !lines.empty()) {
      text_.append("\n").append(lines);
    }
    return text_.c_str();
  } catch (...) {
    return traceable_what();  // no memory for the trace: the message is worth more
  }
}

template <class E>
const char* ExceptionAdapter<E>::traceable_what() const noexcept {
  if constexpr (std::is_same_v<E, std::bad_alloc>) {
    return "bad allocation";
  } else if constexpr (std::is_same_v<E, std::bad_cast>) {
    return "bad cast";
  } else if constexpr (std::is_same_v<E, std::bad_typeid>) {
    return "bad typeid";
  } else {
    return E::what();
  }
}

template <class E>
void ExceptionAdapter<E>::prepend(const std::string& context) {
  if constexpr (std::is_constructible_v<E, const std::string&>) {
    E::operator=(E(context + E::what()));
  }
}

}  // namespace Aldermoor::Utilities::Exceptions

#endif  // ALDERMOOR_UTILITIES_EXCEPTIONS_EXCEPTIONADAPTER_H
