#include "aldermoor/vexdoc/internals/faulttext.h"

#include <array>
#include <charconv>
#include <cmath>
#include <system_error>

namespace Aldermoor::Vexdoc::Internals {

namespace {

constexpr std::size_t kLongestQuote = 60;
constexpr const char* kBlanks = " \t\n\v\f\r";

}  // namespace

std::string Quoted(std::string_view text) {
  std::string quoted = "'";
  quoted += text.substr(0, kLongestQuote);
  quoted += text.size() > kLongestQuote ? "...'" : "'";
  return quoted;
}

std::string Counted(std::size_t number, const char* noun) {
  return std::to_string(number) + " " + noun + (number == 1 ? "" : "s");
}

std::string NumberText(float value) {
  std::array<char, 32> digits;
  // The sign of a NaN says nothing.
  return {digits.data(), std::to_chars(digits.data(), digits.data() + digits.size(),
                                       std::isnan(value) ? std::abs(value) : value)
                             .ptr};
}

std::string NumberFault(std::string_view text) {
  const std::size_t begin = text.find_first_not_of(kBlanks);
  if (begin == std::string_view::npos) {
    return "there is no number";
  }
  std::string_view number = text.substr(begin, text.find_last_not_of(kBlanks) + 1 - begin);
  if (number.starts_with('+') && !number.starts_with("+-")) {
    number.remove_prefix(1);  // a stream takes it, std::from_chars does not
  }
  float value = 0.0F;
  const char* const end = number.data() + number.size();
  const auto [stopped, error] = std::from_chars(number.data(), end, value);
  // The words for what is no number do not count as one in a document.
  if (error == std::errc::invalid_argument || stopped != end ||
      number.find_first_of("0123456789") == std::string_view::npos) {
    return Quoted(text) + " is no number";
  }
  return error == std::errc::result_out_of_range ? Quoted(text) + " is out of the range of a float"
                                                 : "";
}

std::string PlaceText(const std::string& set, const std::string& sample,
                      const std::string& attribute) {
  std::string text;
  if (!set.empty() || !sample.empty() || !attribute.empty()) {
    text += "set '" + set + "'";
  }
  if (!sample.empty() || !attribute.empty()) {
    text += ", sample '" + sample + "'";
  }
  if (!attribute.empty()) {
    text += ", " + attribute;
  }
  return text.empty() ? text : text + ": ";
}

}  // namespace Aldermoor::Vexdoc::Internals
