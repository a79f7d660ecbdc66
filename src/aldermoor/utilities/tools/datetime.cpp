#include "aldermoor/utilities/tools/datetime.h"

#include <array>
#include <cstddef>
#include <ctime>
#include <sstream>
#include <vector>

#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/utilities/tools/stringtokenizer.h"

namespace Aldermoor::Utilities::Tools {
namespace {

constexpr std::size_t kLongestText = 64;

// The leading numbers of exactly three parts; false if there are fewer or one has none.
bool ReadThree(const std::string& text, char delimiter, std::array<int, 3>& numbers) {
  const StringTokenizer tokenizer(text, delimiter);
  const std::vector<std::string>& parts = tokenizer.GetTokens();
  if (parts.size() < numbers.size()) {
    return false;
  }
  for (std::size_t i = 0; i < numbers.size(); ++i) {
    std::istringstream stream(parts[i]);
    long number = 0;
    if (!(stream >> number)) {
      return false;
    }
    // Far beyond what a calendar field holds; mktime carries what is left.
    constexpr long kLimit = 1'000'000'000;
    if (number > kLimit || number < -kLimit) {
      return false;
    }
    numbers[i] = static_cast<int>(number);
  }
  return true;
}

}  // namespace

DateTime::DateTime() try { SetNow(); }
ALDERMOOR_FRAME(Aldermoor::Utilities::Tools::DateTime::DateTime)

DateTime::DateTime(const std::string& text) try { SetDateTime(text); }
ALDERMOOR_FRAME(Aldermoor::Utilities::Tools::DateTime::DateTime)

DateTime::DateTime(long seconds) : time_(seconds) {}

void DateTime::SetNow() {
  time_ = std::time(nullptr);
}

void DateTime::SetDateTime(long seconds) {
  time_ = seconds;
}

bool DateTime::SetDateTime(const std::string& text) try {
  const StringTokenizer halves(text, '/');
  std::array<int, 3> date{};
  std::array<int, 3> clock{};
  if (halves.GetTokens().size() < 2 || !ReadThree(halves.GetTokens()[0], '-', date) ||
      !ReadThree(halves.GetTokens()[1], ':', clock)) {
    return false;
  }
  std::tm fields{};
  fields.tm_year = date[0] - 1900;
  fields.tm_mon = date[1] - 1;
  fields.tm_mday = date[2];
  fields.tm_hour = clock[0];
  fields.tm_min = clock[1];
  fields.tm_sec = clock[2];
  const std::time_t time = std::mktime(&fields);
  time_ = time == -1 ? 0 : time;
  return true;
}
ALDERMOOR_FRAME(Aldermoor::Utilities::Tools::DateTime::SetDateTime)

long DateTime::GetLongTime() const {
  return static_cast<std::int32_t>(static_cast<std::uint32_t>(time_));
}

std::string DateTime::GetDateTime() const {
  return Format(date_time_format_);
}

std::string DateTime::GetDate() const {
  return Format(date_format_);
}

std::string DateTime::GetTime() const {
  return Format(time_format_);
}

void DateTime::SetDateTimeFormat(const std::string& format) {
  date_time_format_ = format;
}

void DateTime::SetDateFormat(const std::string& format) {
  date_format_ = format;
}

void DateTime::SetTimeFormat(const std::string& format) {
  time_format_ = format;
}

std::string DateTime::Format(const std::string& format) const try {
  if (time_ == 0) {
    return "";
  }
  const std::time_t time = time_;
  std::tm fields{};
  if (localtime_r(&time, &fields) == nullptr) {
    return "";  // a year that does not fit the calendar fields
  }
  std::array<char, kLongestText> text{};
#pragma GCC diagnostic push
#pragma GCC diagnostic ignored "-Wformat-nonliteral"
  const std::size_t length = std::strftime(text.data(), text.size(), format.c_str(), &fields);
#pragma GCC diagnostic pop
  return std::string(text.data(), length);
}
ALDERMOOR_FRAME(Aldermoor::Utilities::Tools::DateTime::Format)

}  // namespace Aldermoor::Utilities::Tools
