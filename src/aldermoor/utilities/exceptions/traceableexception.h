#ifndef ALDERMOOR_UTILITIES_EXCEPTIONS_TRACEABLEEXCEPTION_H
#define ALDERMOOR_UTILITIES_EXCEPTIONS_TRACEABLEEXCEPTION_H

#include <exception>
#include <iosfwd>
#include <list>
#include <string>
#include <typeinfo>

#include "aldermoor/export.h"

namespace Aldermoor::Utilities::Exceptions {

/// What an exception was caused by: type, message and trace of another exception, by value.
class ALDERMOOR_EXPORT Cause : public std::exception {
 public:
  /// No cause.
  Cause();
  /// Records `causing`; its location list comes along if it is a TraceableException.
  explicit Cause(const std::exception& causing);
  Cause(const Cause&) = default;
  Cause& operator=(const Cause&) = default;
  ~Cause() override;

  /// The message of the causing exception.
  const char* what() const noexcept override;

  bool IsEmpty() const { return empty_; }
  /// The name of the causing exception's type, in the form of Tools::TypeName.
  std::string GetTypeName() const;
  const std::list<std::string>& where() const { return where_; }

 private:
  const std::type_info* type_;  // not owned; lives as long as the program
  std::list<std::string> where_;
  std::string text_;
  bool empty_;
};

/// The side of every exception of this library that carries where it came from: a list of code
/// locations, innermost first, to which each frame that the exception passes appends its own.
///
/// Shared state: the flag of use_implicite_stack_trace, for the whole process and without a lock.
class ALDERMOOR_EXPORT TraceableException {
 public:
  /// The list holds `location` as its one entry, also when it is empty.
  explicit TraceableException(const std::string& location = "");
  /// The same, and `cause` is recorded.
  TraceableException(const std::exception& cause, const std::string& location);
  TraceableException(const TraceableException&) = default;
  TraceableException& operator=(const TraceableException&) = default;
  virtual ~TraceableException();

  /// The message; with use_implicite_stack_trace(true), the trace behind it.
  virtual const char* what() const noexcept = 0;

  /// Puts `context` in front of the message of this very object, so that who catches it to say
  /// where it happened can throw it on as what it is.  No effect on types that carry no text.
  virtual void prepend(const std::string& context);

  std::list<std::string>& where() { return where_; }
  const std::list<std::string>& where() const { return where_; }

  /// What this exception was caused by, if it was built from another one.
  const Cause& cause() const { return cause_; }

  /// Writes the locations, a line and a tab each, and then the cause with its own.  Empty
  /// locations are skipped.  Returns `out`.
  std::ostream& print_stack_trace(std::ostream& out) const;

  /// Whether what() of every exception ends in its trace.  False at load.
  static void use_implicite_stack_trace(bool use);
  static bool use_implicite_stack_trace();

 private:
  std::list<std::string> where_;
  Cause cause_;
};

}  // namespace Aldermoor::Utilities::Exceptions

#endif  // ALDERMOOR_UTILITIES_EXCEPTIONS_TRACEABLEEXCEPTION_H
