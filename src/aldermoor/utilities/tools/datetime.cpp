#include "aldermoor/utilities/tools/datetime.h"

#include <array>
#include <cstddef>
#include <cstdlib>
#include <ctime>
#include <limits>
#include <sstream>
#include <string_view>
#include <vector>

#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/utilities/tools/stringtokenizer.h"

namespace Aldermoor::Utilities::Tools {
namespace {

constexpr std::size_t kLongestText = 64;

// The leading numbers of the first three parts; false if there are fewer or one has none.
bool ReadThree(const std::string& text, char delimiter, std::array<long, 3>& numbers) {
  const StringTokenizer tokenizer(text, delimiter);
  const std::vector<std::string>& parts = tokenizer.GetTokens();
  if (parts.size() < numbers.size()) {
    return false;
  }
  for (std::size_t i = 0; i < numbers.size(); ++i) {
    std::istringstream stream(parts[i]);
    if (!(stream >> numbers[i])) {
      return false;
    }
  }
  return true;
}

// localtime_r reads the time zone once for a process; an application may choose another one later.
// Only a changed TZ is read again, since that looks at files and every new element asks for a date.
void ReadChangedTimeZone() {
  // No string, which would be gone when the destructors of static objects run.
  thread_local std::array<char, 64> known = {};
  const char* const zone = std::getenv("TZ");
  const std::string_view present = zone == nullptr ? std::string_view("\n") : zone;
  if (present != known.data() || present.empty()) {
    tzset();
    known = {};
    present.copy(known.data(), known.size() - 1);  // a longer one is read each time
  }
}

// The time of calendar fields in standard time; 0 if there is none.
std::int64_t TimeOf(const std::array<long, 3>& date, const std::array<long, 3>& clock) {
  constexpr long kFirstYear = 1900;
  // What a calendar field can hold, with room for the shifts of year and month.
  constexpr long kLimit = std::numeric_limits<int>::max() - kFirstYear;
  for (const long number : {date[0], date[1], date[2], clock[0], clock[1], clock[2]}) {
    if (number > kLimit || number < -kLimit) {
      return 0;
    }
  }
  std::tm fields{};
  fields.tm_year = static_cast<int>(date[0] - kFirstYear);
  fields.tm_mon = static_cast<int>(date[1] - 1);
  fields.tm_mday = static_cast<int>(date[2]);
  fields.tm_hour = static_cast<int>(clock[0]);
  fields.tm_min = static_cast<int>(clock[1]);
  fields.tm_sec = static_cast<int>(clock[2]);
  const std::time_t time = std::mktime(&fields);
  return time == -1 ? 0 : time;
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
  std::array<long, 3> date{};
  std::array<long, 3> clock{};
  if (halves.GetTokens().size() < 2 || !ReadThree(halves.GetTokens()[0], '-', date) ||
      !ReadThree(halves.GetTokens()[1], ':', clock)) {
    return false;
  }
  time_ = TimeOf(date, clock);
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

void DateTime::SetDateTimeFormat(const std::string& format) try { date_time_format_ = format; }
ALDERMOOR_FRAME(Aldermoor::Utilities::Tools::DateTime::SetDateTimeFormat)

void DateTime::SetDateFormat(const std::string& format) try { date_format_ = format; }
ALDERMOOR_FRAME(Aldermoor::Utilities::Tools::DateTime::SetDateFormat)

void DateTime::SetTimeFormat(const std::string& format) try { time_format_ = format; }
ALDERMOOR_FRAME(Aldermoor::Utilities::Tools::DateTime::SetTimeFormat)

std::string DateTime::Format(const std::string& format) const try {
  if (time_ == 0) {
    return "";
  }
  const std::time_t time = time_;
  std::tm fields{};
  ReadChangedTimeZone();
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
