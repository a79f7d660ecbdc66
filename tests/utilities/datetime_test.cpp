#include "aldermoor/utilities/tools/datetime.h"

#include <cstdlib>
#include <ctime>
#include <string>

#include <gtest/gtest.h>

namespace Aldermoor::Utilities::Tools {
namespace {

constexpr long kWinterNoon = 1705316400;  // 2024-01-15 12:00:00 CET
constexpr long kSummerNoon = 1721037600;  // 2024-07-15 12:00:00 CEST

/// Local time is that of Berlin: UTC + 1 h, with daylight saving + 2 h.
class DateTimeTest : public ::testing::Test {
 protected:
  DateTimeTest() { SetZone("Europe/Berlin"); }
  ~DateTimeTest() override {
    ::unsetenv("TZ");
    ::tzset();
  }
  static void SetZone(const char* name) {
    ::setenv("TZ", name, 1);
    ::tzset();
  }
};

TEST_F(DateTimeTest, PrintsLocalTime) {
  EXPECT_EQ(DateTime(kWinterNoon).GetDateTime(), "2024-01-15/12:00:00");
  EXPECT_EQ(DateTime(kSummerNoon).GetDateTime(), "2024-07-15/12:00:00");
  EXPECT_EQ(DateTime(kWinterNoon).GetTime(), "12:00:00");
  EXPECT_EQ(DateTime(-1L).GetDateTime(), "1970-01-01/00:59:59");
  EXPECT_EQ(DateTime(0L).GetDateTime() + DateTime(0L).GetDate() + DateTime(0L).GetTime(), "");
}

TEST_F(DateTimeTest, ReadsTheFixedFormWithSomeLicence) {
  for (const std::string text : {
           "2024-01-15/12:00:00",
           "2024-1-15/12:0:0",
           "/2024--01-15//12::00:00:59/more",
           "2024AD-01-15th/12h:00m:00s",
           "2023-13-15/12:00:00",  // fields out of range are carried over
           "2024-01-14/35:59:60",
       }) {
    DateTime time(kSummerNoon);
    time.SetDateTimeFormat("%d.%m.%Y");
    EXPECT_TRUE(time.SetDateTime(text)) << text;
    EXPECT_EQ(time.GetSeconds(), kWinterNoon) << text;
    EXPECT_EQ(DateTime(text), time);
  }
  // A text is standard time.
  EXPECT_EQ(DateTime(DateTime(kSummerNoon).GetDateTime()).GetSeconds(), kSummerNoon + 3600);
}

TEST_F(DateTimeTest, RefusesOtherTextsAndStaysAsItWas) {
  for (const std::string text :
       {"", "/", "2024-01-15", "2024-01/12:00:00", "2024-01-15/12:00", "2024-Jan-15/12:00:00",
        "2024-01-15/12:00:x", "15.01.2024/12:00:00", "99999999999999999999-01-15/12:00:00"}) {
    DateTime time(kWinterNoon);
    EXPECT_FALSE(time.SetDateTime(text)) << text;
    EXPECT_EQ(time.GetSeconds(), kWinterNoon) << text;
    EXPECT_EQ(DateTime(text).GetSeconds(), 0) << text;
  }
}

TEST_F(DateTimeTest, FieldsFarOutOfRangeGiveTheirTimeOrNone) {
  SetZone("UTC");
  struct Case {
    const char* text;
    long seconds;
  };
  for (const Case& c : {
           Case{"1970-01-01/00:00:1500000000", 1'500'000'000},
           Case{"1970-01-01/00:25000000:-5", 1'499'999'995}, Case{"9999999999-01-01/00:00:00", 0},
           Case{"1970-01-01/00:00:9999999999", 0},
           Case{"1969-12-31/23:59:59", 0},  // mktime says -1, as for a failure
       }) {
    DateTime time(kWinterNoon);
    EXPECT_TRUE(time.SetDateTime(c.text)) << c.text;
    EXPECT_EQ(time.GetSeconds(), c.seconds) << c.text;
  }
}

TEST_F(DateTimeTest, FollowsAChangedTimeZone) {
  EXPECT_EQ(DateTime(kWinterNoon).GetTime(), "12:00:00");
  ::setenv("TZ", "Asia/Tokyo", 1);  // and nobody says tzset
  EXPECT_EQ(DateTime(kWinterNoon).GetTime(), "20:00:00");
  ::setenv("TZ", "UTC", 1);
  EXPECT_EQ(DateTime(kWinterNoon).GetTime(), "11:00:00");
}

TEST_F(DateTimeTest, FormatsBelongToTheObjectAndGiveUpTo63Characters) {
  DateTime time(kWinterNoon);
  time.SetDateFormat("%d.%m.%Y");
  time.SetTimeFormat(std::string(63, 'x'));
  EXPECT_EQ(time.GetDate(), "15.01.2024");
  EXPECT_EQ(time.GetTime(), std::string(63, 'x'));
  time.SetTimeFormat(std::string(64, 'x'));
  EXPECT_EQ(time.GetTime(), "");
  EXPECT_EQ(DateTime(kWinterNoon).GetDate(), "2024-01-15");
  EXPECT_EQ(DateTime(0x1'0000'0005L).GetLongTime(), 5) << "the long time has 32 bits";
  EXPECT_GT(DateTime(0x1'0000'0005L), time);
}

}  // namespace
}  // namespace Aldermoor::Utilities::Tools
