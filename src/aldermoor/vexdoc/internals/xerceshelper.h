#ifndef ALDERMOOR_VEXDOC_INTERNALS_XERCESHELPER_H
#define ALDERMOOR_VEXDOC_INTERNALS_XERCESHELPER_H

#include <string>

#include <xercesc/util/XercesDefs.hpp>

#include "aldermoor/vexdoc/vexexception.h"

namespace Aldermoor::Vexdoc::Internals {

/// Throws: VexException if the application has not initialised the XML platform.
void RequireXMLPlatform();

/// What the XML library refuses.
class XMLFailure : public VexException {
 public:
  using VexException::VexException;
};

/// A string in the parser's characters, made from one of the model's and freed with this object.
class XMLChBuffer {
 public:
  explicit XMLChBuffer(const char* text);
  explicit XMLChBuffer(const std::string& text) : XMLChBuffer(text.c_str()) {}
  XMLChBuffer(const XMLChBuffer&) = delete;
  XMLChBuffer& operator=(const XMLChBuffer&) = delete;
  ~XMLChBuffer();

  const XMLCh* Get() const { return text_; }

 private:
  XMLCh* text_;
};

/// A string of the model, made from one in the parser's characters and freed with this object.
class NativeBuffer {
 public:
  explicit NativeBuffer(const XMLCh* text);
  NativeBuffer(const NativeBuffer&) = delete;
  NativeBuffer& operator=(const NativeBuffer&) = delete;
  ~NativeBuffer();

  std::string Get() const { return text_ == nullptr ? "" : text_; }

 private:
  char* text_;
};

/// Text in the parser's characters, in memory that is used again for the next one.
class XMLChText {
 public:
  /// The three forms give a pointer that is good until the next call.
  /// Throws: VexException if `text` holds a zero byte or is not in the local code page; XMLFailure
  /// if it holds a character that XML does not have.
  const XMLCh* Set(const std::string& text);
  /// Six significant digits, as a stream writes them.
  const XMLCh* Set(float value);
  const XMLCh* Set(unsigned int value);

 private:
  const XMLCh* SetAscii(const char* begin, const char* end);

  std::u16string text_;
};

/// A string of the model from the parser's characters; empty for null.
std::string ToNativeString(const XMLCh* text);

/// The float at the beginning of a text as a stream reads it: leading white space is skipped, text
/// behind the number is ignored, text without one gives 0, a number beyond the range of a float
/// gives the greatest float.
float ReadFloat(const XMLCh* text);

/// The whole number at the beginning of a text.
/// Throws: std::invalid_argument if there is none, or it does not fit.
unsigned int ReadUnsigned(const XMLCh* text);

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_XERCESHELPER_H
