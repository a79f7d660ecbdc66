#include "aldermoor/tristim/internals/measureconditiongetstrings.h"

#include <gtest/gtest.h>

#include "aldermoor/tristim/tristimexception.h"

#include "tests/tristim/support.h"

namespace Aldermoor::Tristim::Tests {
namespace {

using Translator = Internals::MeasureConditionTranslator;
using Utilities::Exceptions::InvalidArgumentException;
using Utilities::Exceptions::OutOfRangeException;

using Words = std::vector<std::pair<const char*, int>>;

const Words kFilters = {
    {"Undefined", 0},      {"No", 1},      {"Polarizer", 2},         {"D65", 3}, {"UVCut", 4},
    {"LastSelectable", 5}, {"Custom", 10}, {"CalibrationCheck", 11}, {"ND0", 12}};
const Words kObservers = {{"Undefined", -1}, {"TwoDegree", 0}, {"TenDegree", 1}};
const Words kWhiteBases = {{"Undefined", -1}, {"Absolute", 0}, {"Paper", 1}, {"Automatic", 2}};
const Words kDensityStandards = {{"Undefined", -1}, {"DIN", 0},   {"DINNB", 1},
                                 {"ANSIA", 2},      {"ANSIE", 3}, {"ANSII", 4},
                                 {"ANSIT", 5},      {"SPI", 6},   {"User", 7}};
const Words kDensityFilters = {{"Undefined", -1}, {"Black", 0}, {"Cyan", 1}, {"Magenta", 2},
                               {"Yellow", 3},     {"Max", 4},   {"Auto", 5}};

template <class Number>
void ExpectRoundTrip(Number (*parse)(const std::string&), const Words& words) {
  for (const auto& [word, number] : words) {
    EXPECT_EQ(static_cast<int>(parse(word)), number) << word;
    EXPECT_EQ(Translator::ToString(static_cast<Number>(number)), word);
  }
}

TEST(MeasureConditionTranslatorTest, WordsOfTheEnumsComeBackFromTheirNumbers) {
  ExpectRoundTrip<PhysicalFilter>(Translator::GetPhysicalFilter, kFilters);
  ExpectRoundTrip<Observer>(Translator::GetObserver, kObservers);
  ExpectRoundTrip<WhiteBase>(Translator::GetWhiteBase, kWhiteBases);
  ExpectRoundTrip<DensityStandard>(Translator::GetDensityStandard, kDensityStandards);
  ExpectRoundTrip<DensityFilterMode>(Translator::GetDensityFilterMode, kDensityFilters);
  EXPECT_EQ(Translator::ToString(PhysicalFilter(6)), "Undefined");
  EXPECT_EQ(Translator::ToString(HXIllumination(IlluminationType::kDaylightS0)), "Undefined");
}

struct IlluminationCase {
  const char* word;
  int type, temperature, number;
  const char* back;
};

constexpr IlluminationCase kIlluminations[] = {
    {"A", 0, 0, 0, "A"},
    {"B", 1, 0, 0, "B"},
    {"C", 2, 0, 0, "C"},
    {"D75", 3, 0, 0, "D75"},
    {"D65", 4, 0, 0, "D65"},
    {"D55", 5, 0, 0, "D55"},
    {"D50", 6, 0, 0, "D50"},
    {"Dxx, Temperature:6500", 7, 6500, 0, "Dxx, Temperature:6500"},
    {"D, seventeen char5000 K", 7, 5000, 0, "Dxx, Temperature:5000"},
    {"F2", 8, 0, 0, "F2"},
    {"F7", 9, 0, 0, "F7"},
    {"F11", 10, 0, 0, "F11"},
    {"F7 ", 11, 0, 7, "F7"},
    {"F12", 11, 0, 12, "F12"},
    {"F257", 11, 0, 1, "F1"},
    {"Undefined", -1, 0, 0, "Undefined"},
    {"Userdefined", 12, 0, 0, "Userdefined"},
    {"Emission", 13, 0, 0, "Emission"}};

TEST(MeasureConditionTranslatorTest, IlluminationsHaveTypeTemperatureAndNumber) {
  for (const IlluminationCase& c : kIlluminations) {
    const HXIllumination illumination = Translator::GetIllumination(c.word);
    EXPECT_EQ(illumination.GetIlluminationType(), c.type) << c.word;
    EXPECT_EQ(illumination.GetColorTemperature(), c.temperature) << c.word;
    EXPECT_EQ(illumination.GetFluorescence(), c.number) << c.word;
    EXPECT_EQ(Translator::ToString(illumination), c.back);
  }
}

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

}  // namespace
}  // namespace Aldermoor::Tristim::Tests
