#include "aldermoor/tristim/internals/measureconditiongetstrings.h"

#include <gtest/gtest.h>

#include "aldermoor/tristim/tristimexception.h"

#include "tests/tristim/support.h"

namespace Aldermoor::Tristim::Tests {
namespace {

using Translator = Internals::MeasureConditionTranslator;
using Utilities::Exceptions::InvalidArgumentException;
using Utilities::Exceptions::OutOfRangeException;

template <class Number>
using Parser = Number (*)(const std::string&);

template <class Number>
void ExpectRoundTrip(Parser<Number> parse, std::vector<std::pair<const char*, int>> words) {
  for (const auto& [word, number] : words) {
    EXPECT_EQ(static_cast<int>(parse(word)), number) << word;
    EXPECT_EQ(Translator::ToString(static_cast<Number>(number)), word);
  }
}

TEST(MeasureConditionTranslatorTest, WordsOfTheEnumsComeBackFromTheirNumbers) {
  ExpectRoundTrip<PhysicalFilter>(Translator::GetPhysicalFilter, {{"Undefined", 0},
                                                                  {"No", 1},
                                                                  {"Polarizer", 2},
                                                                  {"D65", 3},
                                                                  {"UVCut", 4},
                                                                  {"LastSelectable", 5},
                                                                  {"Custom", 10},
                                                                  {"CalibrationCheck", 11},
                                                                  {"ND0", 12}});
  ExpectRoundTrip<Observer>(Translator::GetObserver,
                            {{"Undefined", -1}, {"TwoDegree", 0}, {"TenDegree", 1}});
  ExpectRoundTrip<WhiteBase>(Translator::GetWhiteBase,
                             {{"Undefined", -1}, {"Absolute", 0}, {"Paper", 1}, {"Automatic", 2}});
  ExpectRoundTrip<DensityStandard>(Translator::GetDensityStandard, {{"Undefined", -1},
                                                                    {"DIN", 0},
                                                                    {"DINNB", 1},
                                                                    {"ANSIA", 2},
                                                                    {"ANSIE", 3},
                                                                    {"ANSII", 4},
                                                                    {"ANSIT", 5},
                                                                    {"SPI", 6},
                                                                    {"User", 7}});
  ExpectRoundTrip<DensityFilterMode>(Translator::GetDensityFilterMode, {{"Undefined", -1},
                                                                        {"Black", 0},
                                                                        {"Cyan", 1},
                                                                        {"Magenta", 2},
                                                                        {"Yellow", 3},
                                                                        {"Max", 4},
                                                                        {"Auto", 5}});
}

TEST(MeasureConditionTranslatorTest, ANumberWithoutAWordIsUndefined) {
  EXPECT_EQ(Translator::ToString(PhysicalFilter(6)), "Undefined");
  EXPECT_EQ(Translator::ToString(Observer(2)), "Undefined");
  EXPECT_EQ(Translator::ToString(HXIllumination(IlluminationType::kDaylightS0)), "Undefined");
}

struct IlluminationCase {
  const char* word;
  int type;
  int temperature;
  int number;
  const char* back;
};

class IlluminationWordTest : public ::testing::TestWithParam<IlluminationCase> {};

TEST_P(IlluminationWordTest, GivesTypeTemperatureAndNumber) {
  const IlluminationCase& c = GetParam();
  const HXIllumination illumination = Translator::GetIllumination(c.word);
  EXPECT_EQ(illumination.GetIlluminationType(), c.type);
  EXPECT_EQ(illumination.GetColorTemperature(), c.temperature);
  EXPECT_EQ(illumination.GetFluorescence(), c.number);
  EXPECT_EQ(Translator::ToString(illumination), c.back);
}

INSTANTIATE_TEST_SUITE_P(
    Words, IlluminationWordTest,
    ::testing::Values(
        IlluminationCase{"A", 0, 0, 0, "A"}, IlluminationCase{"B", 1, 0, 0, "B"},
        IlluminationCase{"C", 2, 0, 0, "C"}, IlluminationCase{"D75", 3, 0, 0, "D75"},
        IlluminationCase{"D65", 4, 0, 0, "D65"}, IlluminationCase{"D55", 5, 0, 0, "D55"},
        IlluminationCase{"D50", 6, 0, 0, "D50"},
        IlluminationCase{"Dxx, Temperature:6500", 7, 6500, 0, "Dxx, Temperature:6500"},
        IlluminationCase{"D, seventeen char5000 K", 7, 5000, 0, "Dxx, Temperature:5000"},
        IlluminationCase{"F2", 8, 0, 0, "F2"}, IlluminationCase{"F7", 9, 0, 0, "F7"},
        IlluminationCase{"F11", 10, 0, 0, "F11"}, IlluminationCase{"F7 ", 11, 0, 7, "F7"},
        IlluminationCase{"F12", 11, 0, 12, "F12"}, IlluminationCase{"F257", 11, 0, 1, "F1"},
        IlluminationCase{"Undefined", -1, 0, 0, "Undefined"},
        IlluminationCase{"Userdefined", 12, 0, 0, "Userdefined"},
        IlluminationCase{"Emission", 13, 0, 0, "Emission"}));

TEST(MeasureConditionTranslatorTest, RefusedIlluminationsAreOfThreeKinds) {
  const auto read = [](const char* word) {
    return [word] {
      Translator::GetIllumination(word);
    };
  };
  EXPECT_EQ(MessageOf<TristimException>(read("E")), "E is not a valid illuminationtype");
  EXPECT_EQ(MessageOf<TristimException>(read("")), " is not a valid illuminationtype");
  EXPECT_THROW(Translator::GetIllumination("Dxx"), OutOfRangeException);
  EXPECT_THROW(Translator::GetIllumination("D60"), OutOfRangeException);
  for (const char* const word :
       {"F", "Fx", "F40000", "Dxx, Temperature:", "Dxx, Temperature:warm"}) {
    EXPECT_TRUE(MessageOf<InvalidArgumentException>(read(word))
                    .starts_with("lexical_cast(): fail to convert '"))
        << word;
  }
}

TEST(MeasureConditionTranslatorTest, WordsAreComparedExactly) {
  const auto white = [] {
    Translator::GetWhiteBase("absolute");
  };
  EXPECT_EQ(MessageOf<TristimException>(white), "absolute is not a valid whitespacetype");
  const auto space = [] {
    Translator::GetColorSpace("");
  };
  EXPECT_EQ(MessageOf<TristimException>(space), " is not a valid color space");
}

TEST(MeasureConditionTranslatorTest, ValidatorsHandTheWordItselfBack) {
  const std::string word = "Undefined";
  EXPECT_EQ(&Translator::GetColorSpace(word), &word);
  EXPECT_EQ(&Translator::GetDeltaEFormula(word), &word);
  EXPECT_EQ(&Translator::GetRelativeOrAbsoluteVector(word), &word);
}

TEST(MeasureConditionTranslatorTest, AFailureTellsThrowAndFrame) {
  try {
    Translator::GetObserver("x");
    FAIL() << "nothing was thrown";
  } catch (const TristimException& e) {
    ASSERT_EQ(e.where().size(), 2U);
    EXPECT_TRUE(e.where().front().starts_with(
        "::Aldermoor::Tristim::Internals::MeasureConditionTranslator::GetObserver(): "));
    EXPECT_NE(e.where().front(), e.where().back());
  }
}

}  // namespace
}  // namespace Aldermoor::Tristim::Tests
