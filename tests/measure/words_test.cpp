#include "aldermoor/measure/words.h"

#include <algorithm>
#include <fstream>
#include <iterator>
#include <string>

#include <gtest/gtest.h>

#include "aldermoor/measure/density.h"
#include "aldermoor/measure/measureexception.h"
#include "aldermoor/tristim/hxmeasureconditions.h"
#include "aldermoor/tristim/internals/measureconditiongetstrings.h"

#include "tests/utilities/messageof.h"

namespace Aldermoor::Measure::Tests {
namespace {

using Aldermoor::Tests::MessageOf;
using Tristim::HXMeasureConditions;
using Tristim::Internals::MeasureConditionTranslator;

// Colorimetry keeps tables of its own for the words; a word that stands in one of them alone would
// be refused, or computed with a default.
TEST(WordsTest, AreThoseOfColorimetry) {
  for (const std::string_view key : WordKeys()) {
    const auto words = WordsOf(key);
    EXPECT_FALSE(words.empty()) << key;
    for (const std::string_view word : words) {
      HXMeasureConditions conditions;
      conditions.SetMeasureCondition(key, std::string(word));
      if (key != "CustomCondition") {
        EXPECT_EQ(conditions.GetMeasureCondition(key), word);
      }
      EXPECT_TRUE(IsWordOf(key, word)) << key << " " << word;
    }
    for (const std::string& word : HXMeasureConditions::GetSupportedValues(key)) {
      const bool is_form = word == "Dxx" || word == "F";
      EXPECT_EQ(std::ranges::find(words, word) != words.end(), !is_form) << key << " " << word;
    }
  }
  const HXMeasureConditions by_default;
  for (const auto& [key, word] : by_default.GetMeasureConditions()) {
    EXPECT_TRUE(std::ranges::find(WordKeys(), key) != WordKeys().end()) << key;
    EXPECT_TRUE(IsWordOf(key, word)) << key << " " << word;
  }
}

/// Every number that has a word in colorimetry.
template <class Enum>
void ExpectNumbersOf(std::string_view key) {
  for (int number = -1; number < 20; ++number) {
    const std::string word = MeasureConditionTranslator::ToString(static_cast<Enum>(number));
    EXPECT_TRUE(word == "Undefined" || std::ranges::find(WordsOf(key), word) != WordsOf(key).end())
        << key << " " << word;
  }
}

TEST(WordsTest, LeaveNoneOfColorimetryOut) {
  ExpectNumbersOf<Tristim::Observer>("Colorimetric.Observer");
  ExpectNumbersOf<Tristim::WhiteBase>("Colorimetric.WhiteBase");
  ExpectNumbersOf<Tristim::PhysicalFilter>("Physical.Filter");
  ExpectNumbersOf<Tristim::DensityStandard>("Colorimetric.DensityStandard");
  ExpectNumbersOf<Tristim::DensityFilterMode>("Colorimetric.DensityFilterMode");
  for (int type = 0; type < Tristim::IlluminationType::kDaylightS0; ++type) {
    const std::string word = MeasureConditionTranslator::ToString(Tristim::HXIllumination(type));
    const bool has_number = type == Tristim::IlluminationType::kDaylight ||
                            type == Tristim::IlluminationType::kFluorescent;
    EXPECT_TRUE(has_number || IsWordOf("Colorimetric.Illumination", word)) << word;
  }
}

// The values of the enumerations are the places of the words.
TEST(WordsTest, HaveTheNumbersOfColorimetry) {
  for (const std::string_view word : WordsOf("Colorimetric.DensityStandard")) {
    EXPECT_EQ(static_cast<int>(DensityStandardOf(std::string(word))),
              static_cast<int>(MeasureConditionTranslator::GetDensityStandard(std::string(word))));
  }
  for (const std::string_view word : WordsOf("Colorimetric.DensityFilterMode")) {
    EXPECT_EQ(
        static_cast<int>(DensityModeOf(std::string(word))),
        static_cast<int>(MeasureConditionTranslator::GetDensityFilterMode(std::string(word))));
  }
}

std::string ReadPage(const std::string& name) {
  std::ifstream file(ALDERMOOR_TEST_DATA "/../../docs/" + name);
  return {std::istreambuf_iterator<char>(file), {}};
}

// The row of a key in the table of the page; colour spaces have a page of their own.
TEST(WordsTest, StandInTheDocumentation) {
  const std::string conditions = ReadPage("conditions.md");
  const std::string spaces = ReadPage("colorspaces.md");
  for (const std::string_view key : WordKeys()) {
    if (key.find("Wavelength") != key.npos || key.find("NumberOf") != key.npos) {
      continue;  // told in words
    }
    const std::size_t begin = conditions.find("\n| `" + std::string(key) + "` |");
    ASSERT_NE(begin, conditions.npos) << key;
    const std::string row = conditions.substr(begin, conditions.find('\n', begin + 1) - begin);
    const bool is_space = key == "ColorSpaceDescription.Type";
    for (const std::string_view word : WordsOf(key)) {
      const bool is_between = word.size() > 1 && word[0] == 'F' && word != "F1" && word != "F12" &&
                              key == "Colorimetric.Illumination";
      const std::string quoted = '`' + std::string(word) + '`';
      EXPECT_NE((is_space ? spaces : row).find(is_between ? "`F1` … `F12`" : quoted), row.npos)
          << key << " " << word;
    }
  }
}

TEST(WordsTest, HaveFormsBesideTheList) {
  constexpr const char* kIllumination = "Colorimetric.Illumination";
  for (const char* const word :
       {"Dxx, Temperature:1", "Dxx, Temperature:32767", "F7 ", "Undefined"}) {
    EXPECT_TRUE(IsWordOf(kIllumination, word)) << word;
  }
  for (const char* const word :
       {"Dxx, Temperature:0", "Dxx, Temperature:-5000", "Dxx, Temperature:32768",
        "Dxx, Temperature:6500K", "Dxx, Temperature:", "Dxy, Temperature:6500", "Dxx", "D93", "F",
        "F0", "F13", "F7x", "F 7", "A ", "", "6500K", " D65"}) {
    EXPECT_FALSE(IsWordOf(kIllumination, word)) << word;
  }
  EXPECT_TRUE(IsWordOf("Physical.SpectrumType", "anything"));
  EXPECT_TRUE(IsWordOf("Lab.Room", "anything"));
}

TEST(WordsTest, ProposeTheNearest) {
  struct Case {
    const char* key;
    const char* word;
    const char* nearest;
  };
  constexpr Case kCases[] = {{"ColorSpaceDescription.DeltaEFormula", "CIEDE2000", "2000"},
                             {"ColorSpaceDescription.DeltaEFormula", "cielab", "CIELab"},
                             {"ColorSpaceDescription.Type", "XYZ", "CIEXYZ"},
                             {"ColorSpaceDescription.Type", "Lab", "CIELab"},
                             {"ColorSpaceDescription.Type", "CIELAB", "CIELab"},
                             {"ColorSpaceDescription.Type", "CIELch", "CIELCh"},
                             {"ColorSpaceDescription.Type", "paint", ""},
                             {"Colorimetric.Illumination", "d50", "D50"},
                             {"Colorimetric.Illumination", "f11", "F11"},
                             {"Colorimetric.Illumination", "emmision", "Emission"},
                             {"Colorimetric.Illumination", "X", ""},
                             {"Colorimetric.Observer", "Two", "TwoDegree"},
                             {"Physical.Filter", "Pol", "Polarizer"},
                             {"Physical.Filter", "", ""}};
  for (const Case& c : kCases) {
    EXPECT_EQ(NearestWord(c.word, WordsOf(c.key)), c.nearest) << c.key << " " << c.word;
  }
}

TEST(WordsTest, AreNamedWhereOneIsRefused) {
  EXPECT_EQ(MessageOf<MeasureException>([] { CheckWord("Colorimetric.Observer", "Ten"); }),
            "Colorimetric.Observer: 'Ten' is not one of TwoDegree, TenDegree; did you mean "
            "'TenDegree'?");
  EXPECT_EQ(MessageOf<MeasureException>([] { CheckWord("Colorimetric.Illumination", "6500K"); }),
            "Colorimetric.Illumination: '6500K' is not one of A, B, C, D50, D55, D65, D75, F1, F2, "
            "F3, F4, F5, F6, F7, F8, F9, F10, F11, F12, Emission, Userdefined, a daylight such as "
            "\"Dxx, Temperature:6500\"");
  CheckWord("Colorimetric.Observer", "TenDegree");
}

}  // namespace
}  // namespace Aldermoor::Measure::Tests
