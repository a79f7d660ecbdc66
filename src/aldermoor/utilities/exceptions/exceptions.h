#ifndef ALDERMOOR_UTILITIES_EXCEPTIONS_EXCEPTIONS_H
#define ALDERMOOR_UTILITIES_EXCEPTIONS_EXCEPTIONS_H

#include <string>

#include "aldermoor/export.h"
#include "aldermoor/utilities/exceptions/exceptionadapter.h"
#include "aldermoor/utilities/exceptions/location.h"
#include "aldermoor/utilities/tools/typename.h"

/// The exceptions of the library, each built from (message, location).
namespace Aldermoor::Utilities::Exceptions {

class ALDERMOOR_EXPORT LogicException : public ExceptionAdapter<std::logic_error> {
 public:
  using ExceptionAdapter::ExceptionAdapter;
};

class ALDERMOOR_EXPORT DomainException : public ExceptionAdapter<std::domain_error> {
 public:
  using ExceptionAdapter::ExceptionAdapter;
};

class ALDERMOOR_EXPORT InvalidArgumentException : public ExceptionAdapter<std::invalid_argument> {
 public:
  using ExceptionAdapter::ExceptionAdapter;
};

class ALDERMOOR_EXPORT LengthException : public ExceptionAdapter<std::length_error> {
 public:
  using ExceptionAdapter::ExceptionAdapter;
};

class ALDERMOOR_EXPORT OutOfRangeException : public ExceptionAdapter<std::out_of_range> {
 public:
  using ExceptionAdapter::ExceptionAdapter;
};

class ALDERMOOR_EXPORT RuntimeException : public ExceptionAdapter<std::runtime_error> {
 public:
  using ExceptionAdapter::ExceptionAdapter;
};

class ALDERMOOR_EXPORT OverflowException : public ExceptionAdapter<std::overflow_error> {
 public:
  using ExceptionAdapter::ExceptionAdapter;
};

class ALDERMOOR_EXPORT UnderflowException : public ExceptionAdapter<std::underflow_error> {
 public:
  using ExceptionAdapter::ExceptionAdapter;
};

class ALDERMOOR_EXPORT RangeException : public ExceptionAdapter<std::range_error> {
 public:
  using ExceptionAdapter::ExceptionAdapter;
};

/// The message is ignored: what() is always "bad allocation".
class ALDERMOOR_EXPORT BadAllocException : public ExceptionAdapter<std::bad_alloc> {
 public:
  using ExceptionAdapter::ExceptionAdapter;
};

/// The message is ignored: what() is always "bad cast".
class ALDERMOOR_EXPORT BadCastException : public ExceptionAdapter<std::bad_cast> {
 public:
  using ExceptionAdapter::ExceptionAdapter;
};

/// The message is ignored: what() is always "bad typeid".
class ALDERMOOR_EXPORT BadTypeidException : public ExceptionAdapter<std::bad_typeid> {
 public:
  using ExceptionAdapter::ExceptionAdapter;
};

/// Something outside the call, or a named thing inside a document, is at fault.
class ALDERMOOR_EXPORT ResourceException : public RuntimeException {
 public:
  using RuntimeException::RuntimeException;
};

/// A look-up found nothing, or a file or directory is not there.
class ALDERMOOR_EXPORT ResourceNotAvailableException : public ResourceException {
 public:
  using ResourceException::ResourceException;
};

/// An empty pointer was used; the message names the type that it points to.
class ALDERMOOR_EXPORT NullPointerException : public RuntimeException {
 public:
  /// The pointer only tells the type.
  template <class T>
  NullPointerException(const T*, const std::string& location)
      : RuntimeException("accessed null pointer (" + Tools::TypeName<T>() + ")", location) {}
};

}  // namespace Aldermoor::Utilities::Exceptions

#endif  // ALDERMOOR_UTILITIES_EXCEPTIONS_EXCEPTIONS_H
