#include "aldermoor/vexdoc/internals/cachedump.h"

#include <algorithm>
#include <bit>
#include <ostream>

#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/vexdoc/internals/binaryformat.h"
#include "aldermoor/vexdoc/internals/faulttext.h"

namespace Aldermoor::Vexdoc::Internals {

namespace {

using Kind = CacheField::Kind;

constexpr std::size_t kBytesPerLine = 16;
using BinaryFormat::kNumberSize;
constexpr std::size_t kLongestText = 64;
constexpr unsigned int kOffsetDigits = 8;
constexpr unsigned int kByteDigits = 2;

void AppendHex(std::string& out, std::uint64_t value, unsigned int least_digits) {
  constexpr const char* kDigits = "0123456789abcdef";
  constexpr unsigned int kBitsPerDigit = 4;
  unsigned int digits = least_digits;
  while (digits * kBitsPerDigit < 64 && value >> (digits * kBitsPerDigit) != 0) {
    ++digits;
  }
  while (digits > 0) {
    --digits;
    out += kDigits[value >> (digits * kBitsPerDigit) & 0xFU];
  }
}

// A text in double quotes; what could steer a terminal is shown as its byte.
std::string Shown(std::string_view text) {
  std::string shown = "\"";
  for (const char c : text.substr(0, kLongestText)) {
    if (c == '\n') {
      shown += "\\n";
    } else if (c == '"' || c == '\\') {
      shown += {'\\', c};
    } else if (c >= ' ' && c < '\x7F') {
      shown += c;
    } else {
      shown += "\\x";
      AppendHex(shown, static_cast<unsigned char>(c), kByteDigits);
    }
  }
  return shown + (text.size() > kLongestText ? "\"..." : "\"");
}

std::uint32_t NumberAt(std::string_view bytes, std::size_t offset) {
  BinaryFormat::Bytes number;
  std::copy_n(bytes.data() + offset, number.size(), number.begin());
  return BinaryFormat::FromLittleEndian(number);
}

}  // namespace

bool CacheDump::Write() try {
  CacheWalker walker(bytes_);
  walker.Walk([this](const CacheField& field) { WriteField(field); });
  const auto& end = walker.GetEnd();
  if (end) {
    std::string line;
    AppendHex(line, end->offset, kOffsetDigits);
    out_ << line << "  fault: " << end->text << '\n';
  }
  return !end;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::CacheDump::Write)

void CacheDump::WriteField(const CacheField& field) {
  for (std::size_t begin = 0; begin < field.size && out_; begin += kBytesPerLine) {
    std::string line;
    AppendHex(line, field.offset + begin, kOffsetDigits);
    line += ' ';
    const std::size_t end = std::min(field.size, begin + kBytesPerLine);
    for (std::size_t i = begin; i < end; ++i) {
      line += ' ';
      AppendHex(line, static_cast<unsigned char>(bytes_[field.offset + i]), kByteDigits);
    }
    if (const std::string meaning = Meaning(field, begin); !meaning.empty()) {
      line.append((begin + kBytesPerLine - end) * (kByteDigits + 1) + 2 + 2UL * field.depth, ' ');
      line += meaning;
    }
    out_ << line << '\n';
  }
}

std::string CacheDump::Meaning(const CacheField& field, std::size_t begin) const {
  if (field.kind == Kind::kFloats) {
    return Values(field, begin);
  }
  if (begin > 0) {
    return "";
  }
  const std::string label = field.label;
  switch (field.kind) {
    case Kind::kNumber:
      return label + " " + std::to_string(NumberAt(bytes_, field.offset));
    case Kind::kCount:
      return Counted(NumberAt(bytes_, field.offset), field.label);
    case Kind::kText:
      return label + " " +
             Shown(bytes_.substr(field.offset + kNumberSize, field.size - kNumberSize));
    default:
      return label;
  }
}

std::string CacheDump::Values(const CacheField& field, std::size_t begin) const {
  const std::size_t end = std::min(field.size, begin + kBytesPerLine);
  std::string text = field.label;
  if (field.size > kNumberSize) {
    text += " " + std::to_string(begin / kNumberSize) + " to " +
            std::to_string(end / kNumberSize - 1) + ":";
  }
  for (std::size_t i = begin; i < end; i += kNumberSize) {
    text += " " + NumberText(std::bit_cast<float>(NumberAt(bytes_, field.offset + i)));
  }
  return text;
}

}  // namespace Aldermoor::Vexdoc::Internals
