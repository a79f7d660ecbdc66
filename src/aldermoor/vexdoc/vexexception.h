#ifndef ALDERMOOR_VEXDOC_VEXEXCEPTION_H
#define ALDERMOOR_VEXDOC_VEXEXCEPTION_H

#include <string>

#include "aldermoor/export.h"
#include "aldermoor/utilities/exceptions/exceptions.h"

namespace Aldermoor::Vexdoc {

/// A failure of the document model or of reading and writing it.
class ALDERMOOR_EXPORT VexException : public Utilities::Exceptions::RuntimeException {
 public:
  using RuntimeException::RuntimeException;
};

/// A sample attribute was built under conditions that lack a mandatory key.
class ALDERMOOR_EXPORT MissingConditionException : public VexException {
 public:
  using VexException::VexException;
};

/// The content of a document breaks a rule of its format.
class ALDERMOOR_EXPORT VexParseException : public VexException {
 public:
  using VexException::VexException;
};

/// The wavelengths of spectra in a document are not those of their conditions.  The text names set,
/// sample, points and conditions, a line each.
class ALDERMOOR_EXPORT WavelengthException : public VexParseException {
 public:
  WavelengthException(const std::string& message, const std::string& location, bool can_complete)
      : VexParseException(message, location), can_complete_(can_complete) {}

  /// Whether a load with WavelengthUse::kComplete would get past what this one refuses.
  bool CanComplete() const { return can_complete_; }

 private:
  bool can_complete_;
};

/// The text of a document is not well-formed XML.
class ALDERMOOR_EXPORT VexXMLParseException : public VexParseException {
 public:
  VexXMLParseException(const std::string& message, const std::string& file, unsigned int line,
                       unsigned int column, const std::string& location)
      : VexParseException(message, location), file_(file), line_(line), column_(column) {}

  /// The path of the file, or "VEX" for a stream.
  const std::string& GetFile() const { return file_; }
  /// Counted from 1.
  unsigned int GetLine() const { return line_; }
  /// Counted from 1.
  unsigned int GetColumn() const { return column_; }

 private:
  std::string file_;
  unsigned int line_;
  unsigned int column_;
};

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_VEXEXCEPTION_H
