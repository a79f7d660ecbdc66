#ifndef ALDERMOOR_UTILITIES_TOOLS_DATETIME_H
#define ALDERMOOR_UTILITIES_TOOLS_DATETIME_H

#include <compare>
#include <cstdint>
#include <string>

#include "aldermoor/export.h"

namespace Aldermoor::Utilities::Tools {

/// A point in time with a resolution of one second; 0 stands for no time.
///
/// It prints itself in local time through strftime formats that belong to the object, and reads
/// the one form "YYYY-MM-DD/hh:mm:ss", whatever the formats are.  Values compare by time alone.
class ALDERMOOR_EXPORT DateTime {
 public:
  /// The current time.
  DateTime();
  /// Reads `text`; a text of another form gives no time.
  explicit DateTime(const std::string& text);
  /// Seconds since 1970-01-01 00:00:00 UTC.
  explicit DateTime(long seconds);

  void SetNow();
  void SetDateTime(long seconds);
  /// Reads local time, taken as standard time (a text written while daylight saving is in force
  /// comes back an hour later).  Fields out of range are carried over.  Text behind a number is
  /// ignored.  Returns false, and changes nothing, if `text` is not of the form.
  bool SetDateTime(const std::string& text);

  /// The time, cut to its low 32 bits.
  long GetLongTime() const;
  /// Seconds since 1970-01-01 00:00:00 UTC.
  std::int64_t GetSeconds() const { return time_; }

  /// The texts; empty if there is no time, or if the format yields nothing or more than 63 bytes.
  std::string GetDateTime() const;
  std::string GetDate() const;
  std::string GetTime() const;

  void SetDateTimeFormat(const std::string& format);
  void SetDateFormat(const std::string& format);
  void SetTimeFormat(const std::string& format);

  bool operator==(const DateTime& other) const { return time_ == other.time_; }
  std::strong_ordering operator<=>(const DateTime& other) const { return time_ <=> other.time_; }

 private:
  std::string Format(const std::string& format) const;

  std::int64_t time_ = 0;
  std::string date_time_format_ = "%Y-%m-%d/%H:%M:%S";
  std::string date_format_ = "%Y-%m-%d";
  std::string time_format_ = "%H:%M:%S";
};

}  // namespace Aldermoor::Utilities::Tools

#endif  // ALDERMOOR_UTILITIES_TOOLS_DATETIME_H
