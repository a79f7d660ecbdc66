#include "text.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <iterator>
#include <system_error>

#include <fmt/format.h>
#include <nlohmann/json.hpp>

namespace Aldermoor::Tool {
namespace {

struct Range {
  char32_t first;
  char32_t last;
};

// Combining marks, zero-width characters and variation selectors.
constexpr Range kNoWidth[] = {
    {0x0300, 0x036F}, {0x1AB0, 0x1AFF}, {0x1DC0, 0x1DFF}, {0x200B, 0x200F},
    {0x20D0, 0x20FF}, {0xFE00, 0xFE0F}, {0xFE20, 0xFE2F}, {0xFEFF, 0xFEFF},
};

// The blocks of East Asian width W and F.  Source: Unicode Standard Annex #11.
constexpr Range kDoubleWidth[] = {
    {0x1100, 0x115F}, {0x2E80, 0x303E}, {0x3041, 0xA4CF}, {0xAC00, 0xD7A3},   {0xF900, 0xFAFF},
    {0xFE30, 0xFE6F}, {0xFF00, 0xFF60}, {0xFFE0, 0xFFE6}, {0x1F300, 0x1FAFF}, {0x20000, 0x3FFFD},
};

template <std::size_t kSize>
bool IsIn(const Range (&ranges)[kSize], char32_t c) {
  return std::any_of(std::begin(ranges), std::end(ranges),
                     [c](const Range& range) { return c >= range.first && c <= range.last; });
}

bool IsContinuation(unsigned char byte) {
  return (byte & 0xC0U) == 0x80U;
}

// The character at the head of `text`, which is not empty, and removes it there.  A stray byte
// counts as a character.
char32_t TakeCharacter(std::string_view& text) {
  const auto lead = static_cast<unsigned char>(text.front());
  text.remove_prefix(1);
  int following = 0;
  char32_t c = lead;
  if (lead >= 0xF0) {
    following = 3;
    c = lead & 0x07U;
  } else if (lead >= 0xE0) {
    following = 2;
    c = lead & 0x0FU;
  } else if (lead >= 0xC0) {
    following = 1;
    c = lead & 0x1FU;
  }
  for (; following > 0 && !text.empty() && IsContinuation(static_cast<unsigned char>(text.front()));
       --following) {
    c = c << 6U | (static_cast<unsigned char>(text.front()) & 0x3FU);
    text.remove_prefix(1);
  }
  return c;
}

bool IsControl(char32_t c) {
  return c < 0x20 || (c >= 0x7F && c < 0xA0);
}

}  // namespace

std::size_t DisplayWidth(std::string_view text) {
  std::size_t width = 0;
  while (!text.empty()) {
    const char32_t c = TakeCharacter(text);
    width += IsIn(kNoWidth, c) ? 0U : IsIn(kDoubleWidth, c) ? 2U : 1U;
  }
  return width;
}

std::string OnOneLine(std::string_view text) {
  std::string line;
  line.reserve(text.size());
  bool after_control = false;
  while (!text.empty()) {
    const char* const begin = text.data();
    const char32_t c = TakeCharacter(text);
    if (IsControl(c)) {
      after_control = true;
      continue;
    }
    if (after_control && c == U' ') {
      continue;
    }
    if (after_control && !line.empty() && line.back() != ' ') {
      line += ' ';
    }
    after_control = false;
    line.append(begin, text.data());
  }
  return line;
}

void AppendNumber(std::string& out, float value) {
  // The sign of a NaN says nothing.
  fmt::format_to(std::back_inserter(out), "{}", std::isnan(value) ? std::abs(value) : value);
}

void AppendCsvField(std::string& out, std::string_view text) {
  if (text.find_first_of("\",\r\n") == std::string_view::npos) {
    out += text;
    return;
  }
  out += '"';
  for (const char c : text) {
    if (c == '"') {
      out += '"';
    }
    out += c;
  }
  out += '"';
}

void AppendJsonString(std::string& out, std::string_view text) {
  using nlohmann::json;
  out += json(text).dump(-1, ' ', false, json::error_handler_t::replace);
}

void AppendJsonNumber(std::string& out, float value) {
  if (std::isfinite(value)) {
    AppendNumber(out, value);
  } else {
    out += "null";
  }
}

std::vector<std::string_view> SplitAtCommas(std::string_view list) {
  std::vector<std::string_view> parts;
  while (true) {
    const std::size_t length = std::min(list.find(','), list.size());
    parts.push_back(list.substr(0, length));
    if (length == list.size()) {
      return parts;
    }
    list.remove_prefix(length + 1);
  }
}

std::optional<std::vector<float>> ParseNumbers(std::string_view list) {
  std::vector<float> numbers;
  for (const std::string_view part : SplitAtCommas(list)) {
    float number = 0.0F;
    const char* const end = part.data() + part.size();
    const auto [parsed, error] = std::from_chars(part.data(), end, number);
    if (parsed != end || error != std::errc() || !std::isfinite(number)) {
      return std::nullopt;
    }
    numbers.push_back(number);
  }
  return numbers;
}

}  // namespace Aldermoor::Tool
