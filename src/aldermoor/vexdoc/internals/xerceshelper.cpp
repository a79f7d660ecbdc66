#include "aldermoor/vexdoc/internals/xerceshelper.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <locale>
#include <sstream>
#include <system_error>

#include <xercesc/util/PlatformUtils.hpp>
#include <xercesc/util/XMLString.hpp>

#include "aldermoor/utilities/tools/lexicalcast.h"

namespace Aldermoor::Vexdoc::Internals {

using xercesc::XMLPlatformUtils;
using xercesc::XMLString;

namespace {

bool IsSpace(XMLCh c) {
  return c == u' ' || (c >= u'\t' && c <= u'\r');
}

bool IsDigit(XMLCh c) {
  return c >= u'0' && c <= u'9';
}

// Halves of pairs too: the transcoder makes whole ones.
bool IsXMLCharacter(XMLCh c) {
  return (c >= u' ' && c < 0xFFFE) || c == u'\t' || c == u'\n' || c == u'\r';
}

bool IsPartOfNumber(XMLCh c) {
  return IsDigit(c) || c == u'.' || c == u'-' || c == u'+' || c == u'e' || c == u'E';
}

}  // namespace

void RequireXMLPlatform() {
  if (XMLPlatformUtils::fgMemoryManager == nullptr) {
    throw VexException("The XML platform is not initialised",
                       ALDERMOOR_HERE(Aldermoor::Vexdoc::Internals::RequireXMLPlatform));
  }
}

XMLChBuffer::XMLChBuffer(const char* text)
    : text_(XMLString::transcode(text, XMLPlatformUtils::fgMemoryManager)) {}

XMLChBuffer::~XMLChBuffer() {
  XMLString::release(&text_, XMLPlatformUtils::fgMemoryManager);
}

NativeBuffer::NativeBuffer(const XMLCh* text)
    : text_(XMLString::transcode(text, XMLPlatformUtils::fgMemoryManager)) {}

NativeBuffer::~NativeBuffer() {
  XMLString::release(&text_, XMLPlatformUtils::fgMemoryManager);
}

const XMLCh* XMLChText::Set(const std::string& text) {
  // Nearly all text is ASCII, which is the same in both; the rest goes through the transcoder.
  const auto is_plain = [](char c) {
    return c >= ' ' || c == '\n' || c == '\t' || c == '\r';
  };
  if (std::all_of(text.begin(), text.end(), is_plain)) {
    return SetAscii(text.data(), text.data() + text.size());
  }
  text_ = XMLChBuffer(text).Get();
  // The transcoder puts a substitute for what it does not know.
  if (ToNativeString(text_.c_str()) != text) {
    throw VexException("XML cannot carry the text '" + text + "'",
                       ALDERMOOR_HERE(Aldermoor::Vexdoc::Internals::XMLChText::Set));
  }
  // Not left to the serialiser, which does not know whose text it is.
  if (!std::all_of(text_.begin(), text_.end(), IsXMLCharacter)) {
    throw XMLFailure("XML has no such character: '" + text + "'",
                     ALDERMOOR_HERE(Aldermoor::Vexdoc::Internals::XMLChText::Set));
  }
  return text_.c_str();
}

const XMLCh* XMLChText::Set(float value) {
  constexpr int kSignificantDigits = 6;
  std::array<char, 32> digits;
  return SetAscii(digits.data(), std::to_chars(digits.data(), digits.data() + digits.size(), value,
                                               std::chars_format::general, kSignificantDigits)
                                     .ptr);
}

const XMLCh* XMLChText::Set(unsigned int value) {
  std::array<char, 16> digits;
  return SetAscii(digits.data(),
                  std::to_chars(digits.data(), digits.data() + digits.size(), value).ptr);
}

const XMLCh* XMLChText::SetAscii(const char* begin, const char* end) {
  text_.assign(begin, end);
  return text_.c_str();
}

std::string ToNativeString(const XMLCh* text) {
  if (text == nullptr) {
    return "";
  }
  // Nearly all text is ASCII, which is the same in both; the rest goes through the transcoder.
  std::string native;
  for (const XMLCh* c = text; *c != 0; ++c) {
    if (*c > 0x7F) {
      return NativeBuffer(text).Get();
    }
    native.push_back(static_cast<char>(*c));
  }
  return native;
}

float ReadFloat(const XMLCh* text) {
  const XMLCh* c = text;
  while (IsSpace(*c)) {
    ++c;
  }
  // The common forms without a stream; whatever is unusual about a number is left to one.
  std::array<char, 32> number{};
  std::size_t length = 0;
  for (; length < number.size() && IsPartOfNumber(*c); ++c) {
    number[length++] = static_cast<char>(*c);
  }
  if (length > 0 && (*c == 0 || IsSpace(*c))) {
    float value = 0.0F;
    const char* const end = number.data() + length;
    const auto [stopped, error] = std::from_chars(number.data(), end, value);
    if (error == std::errc() && stopped == end) {
      return value;
    }
  }
  std::istringstream stream(ToNativeString(text));
  stream.imbue(std::locale::classic());  // a file means the same whatever locale is in force
  float value = 0.0F;
  stream >> value;
  return value;
}

unsigned int ReadUnsigned(const XMLCh* text) {
  constexpr int kDigitsThatFit = 9;
  unsigned int value = 0;
  int digits = 0;
  while (digits < kDigitsThatFit && IsDigit(text[digits])) {
    value = value * 10 + static_cast<unsigned int>(text[digits] - u'0');
    ++digits;
  }
  if (digits > 0 && text[digits] == 0) {
    return value;
  }
  return Utilities::Tools::lexical_cast<unsigned int>(ToNativeString(text));
}

}  // namespace Aldermoor::Vexdoc::Internals
