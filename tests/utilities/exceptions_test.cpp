#include "aldermoor/utilities/exceptions/exceptions.h"

#include <new>
#include <sstream>
#include <string>
#include <system_error>
#include <typeinfo>
#include <vector>

#include <gtest/gtest.h>

#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/vexdoc/vexexception.h"

namespace Aldermoor::Utilities::Exceptions {
namespace {

template <class Action>
void Inner(Action action) try {
  action();
}
ALDERMOOR_FRAME(Here::Inner)

template <class Action>
void Outer(Action action) try {
  Inner(action);
}
ALDERMOOR_FRAME(Here::Outer)

std::string TraceOf(const TraceableException& e) {
  std::ostringstream out;
  e.print_stack_trace(out);
  return out.str();
}

/// What a frame makes of `thrown`: exactly a `Traceable`, still caught as the standard type that it
/// stands for, with the frame as its only location.
template <class Traceable, class Standard, class Thrown>
void ExpectTranslated(const Thrown& thrown, const std::string& message) {
  SCOPED_TRACE(typeid(Thrown).name());
  try {
    Inner([&] { throw thrown; });
    FAIL() << "nothing was thrown";
  } catch (const Standard& e) {
    EXPECT_EQ(typeid(e), typeid(Traceable));
    EXPECT_EQ(e.what(), message);
    const auto& traceable = dynamic_cast<const TraceableException&>(e);
    EXPECT_EQ(traceable.what(), message);
    ASSERT_EQ(traceable.where().size(), 1U);
    EXPECT_TRUE(traceable.where().front().starts_with("::Here::Inner(): "));
  }
}

struct Homegrown : std::runtime_error {
  using std::runtime_error::runtime_error;
};

TEST(FrameTest, TurnsStandardExceptionsIntoTheirTraceableCounterparts) {
  ExpectTranslated<RuntimeException, std::runtime_error>(std::runtime_error("a"), "a");
  ExpectTranslated<OverflowException, std::overflow_error>(std::overflow_error("b"), "b");
  ExpectTranslated<UnderflowException, std::underflow_error>(std::underflow_error("c"), "c");
  ExpectTranslated<RangeException, std::range_error>(std::range_error("d"), "d");
  ExpectTranslated<LogicException, std::logic_error>(std::logic_error("e"), "e");
  ExpectTranslated<DomainException, std::domain_error>(std::domain_error("f"), "f");
  ExpectTranslated<InvalidArgumentException, std::invalid_argument>(std::invalid_argument("g"),
                                                                    "g");
  ExpectTranslated<LengthException, std::length_error>(std::length_error("h"), "h");
  ExpectTranslated<OutOfRangeException, std::out_of_range>(std::out_of_range("i"), "i");
  ExpectTranslated<BadAllocException, std::bad_alloc>(std::bad_alloc(), "bad allocation");
  ExpectTranslated<BadTypeidException, std::bad_typeid>(std::bad_typeid(), "bad typeid");
  ExpectTranslated<BadCastException, std::bad_cast>(std::bad_cast(), "bad cast");
  // Without a counterpart: the name of the type goes into the message.
  ExpectTranslated<RuntimeException, std::exception>(std::exception(),
                                                     "class std::exception std::exception");
  ExpectTranslated<RuntimeException, std::runtime_error>(
      std::bad_array_new_length(), "class std::bad_array_new_length std::bad_array_new_length");
  ExpectTranslated<RuntimeException, std::runtime_error>(
      Homegrown("sour"),
      "class Aldermoor::Utilities::Exceptions::(anonymous namespace)::Homegrown sour");
  ExpectTranslated<RuntimeException, std::runtime_error>(42, "unkown exception caught");
}

TEST(FrameTest, AppendsToTheSameObjectFromTheInsideOut) {
  const Vexdoc::VexXMLParseException thrown("bad", "a.xml", 3, 14, "thrown here");
  try {
    Outer([&] { throw thrown; });
    FAIL() << "nothing was thrown";
  } catch (const Vexdoc::VexXMLParseException& e) {
    const std::vector<std::string> where(e.where().begin(), e.where().end());
    ASSERT_EQ(where.size(), 3U);
    EXPECT_EQ(where[0], "thrown here");
    EXPECT_TRUE(where[1].starts_with("::Here::Inner(): ")) << where[1];
    EXPECT_TRUE(where[2].starts_with("::Here::Outer(): ")) << where[2];
    EXPECT_EQ(e.GetLine(), 3U);
    EXPECT_EQ(TraceOf(e), "\t" + where[0] + "\n\t" + where[1] + "\n\t" + where[2]);
  }
}

TEST(TraceTest, SkipsEmptyLocationsButKeepsTheLineBreakBehindAnEmptyFirstOne) {
  LogicException e("m", "");
  EXPECT_EQ(e.where().size(), 1U);
  EXPECT_EQ(TraceOf(e), "");
  e.where().insert(e.where().end(), {"one", "", "two"});
  EXPECT_EQ(TraceOf(e), "\n\tone\n\ttwo");
}

TEST(TraceTest, EndsWhatWhileTheFlagIsSet) {
  const ResourceNotAvailableException e("gone", "there");
  const std::runtime_error& standard = e;
  const TraceableException& traceable = e;
  TraceableException::use_implicite_stack_trace(true);
  EXPECT_STREQ(standard.what(), "gone\n\tthere");
  EXPECT_STREQ(traceable.what(), "gone\n\tthere");
  EXPECT_STREQ(e.traceable_what(), "gone");
  EXPECT_STREQ(ResourceNotAvailableException("gone", "").what(), "gone");
  EXPECT_STREQ(BadAllocException("m", "there").what(), "bad allocation\n\tthere");
  TraceableException::use_implicite_stack_trace(false);
  EXPECT_STREQ(standard.what(), "gone");
  EXPECT_STREQ(traceable.what(), "gone");
}

class Consequence : public TraceableException {
 public:
  using TraceableException::TraceableException;
  const char* what() const noexcept override { return "consequence"; }
};

TEST(TraceTest, TellsTheCauseWithItsOwnTrace) {
  OutOfRangeException cause("too far", "");
  cause.where().insert(cause.where().end(), {"in", "out"});
  EXPECT_EQ(TraceOf(Consequence(cause, "here")),
            "\there\ncaused by: class Aldermoor::Utilities::Exceptions::OutOfRangeException: "
            "too far\n\tin\n\tout\n");
  EXPECT_EQ(TraceOf(Consequence(std::range_error("r"), "")),
            "\ncaused by: class std::range_error: r\n");
}

TEST(MakeLocationTest, CutsThePathBeforeItsLastSourceFolder) {
  EXPECT_EQ(MakeLocation("p", "A::B", "/home/src/lib/src/a.cpp", 7), "p::A::B(): /src/a.cpp:7");
  EXPECT_EQ(MakeLocation("p", "A", "C:\\src\\lib\\src\\b.cpp", 7), "p::A(): \\src\\b.cpp:7");
  EXPECT_EQ(MakeLocation("p", "A", "/home/resrc/b.cpp", 7), "p::A(): /home/resrc/b.cpp:7");
}

TEST(ReplaceAllTest, PassesOverTheReplacementOrTheLengthOfTheToken) {
  const auto replaced = [](std::string text, const std::string& replacement) {
    return ReplaceAll("%N%", replacement, text);
  };
  EXPECT_EQ(replaced("%N% and %N%", "x"), "x and x");
  EXPECT_EQ(replaced("%N%%N%", ""), "%N%");  // the second one has moved into the stretch
  EXPECT_EQ(replaced("%N%-%N%", "abcdef%N%"), "abcdef%N%-abcdef%N%");
}

}  // namespace
}  // namespace Aldermoor::Utilities::Exceptions
