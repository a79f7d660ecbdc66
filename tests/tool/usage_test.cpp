#include <gtest/gtest.h>

#include "toolrun.h"

namespace Aldermoor::Tool {
namespace {

struct Wrong {
  const char* arguments;
  const char* text;  // a part of what is told
};

constexpr Wrong kWrong[] = {
    {"color", "FILE is required"},
    {"paint a.xml", "paint"},
    {"color a.xml --colour RGB", "--colour"},
    {"color a.xml --space cielab", "'cielab' is not one of CIELab, CIELCh, CIELuv"},
    {"color a.xml --space XYZ", "LABhx, LCHhx, RGB, CMYK; did you mean 'CIEXYZ'?"},
    {"color a.xml --space Undefined", "'Undefined' is not one of"},
    {"color a.xml --observer 2", "TwoDegree, TenDegree"},
    {"color a.xml --white-base paper", "Absolute, Paper, Automatic"},
    {"color a.xml --format xml", "table, csv, json"},
    {"info a.xml --format csv", "table, json"},
    {"color a.xml --illuminant D60", "A, B, C, D50, D55, D65, D75, F1"},
    {"color a.xml --illuminant F13", "F12, Emission"},
    {"color a.xml --illuminant 'F2 '", "'F2 ' is not one of"},
    {"color a.xml --illuminant Userdefined", "@FILE:SET/SAMPLE"},
    {"color a.xml --illuminant 'Dxx, Temperature:'", "is not one of"},
    {"color a.xml --illuminant 0K", "from 4000 to 25000 K"},
    {"color a.xml --illuminant=-6500K", "from 4000 to 25000 K"},
    {"color a.xml --illuminant 32768K", "from 4000 to 25000 K"},
    {"color a.xml --condition Colorimetric.Observer", "KEY=VALUE"},
    {"color a.xml --condition =TwoDegree", "KEY=VALUE"},
    {"color a.xml --condition Colorimetric.Observer=Two", "TwoDegree, TenDegree"},
    {"color a.xml --condition Colorimetric.Illumination=F0", "F12, Emission"},
    {"color a.xml --condition Physical.Filter=Pol", "No, Polarizer, UVCut"},
    {"color a.xml --condition Lab.Room=3", "CustomCondition=Enable"},
    {"color a.xml --condition Lab.Room=3 --condition CustomCondition=Enable",
     "CustomCondition=Enable"},
    {"color - -", "only once"},
    {"color - --illuminant @-:Set/gray", "only once"},
};

class UsageTest : public ToolTest {
 protected:
  UsageTest() {
    WriteDocument("a.xml", "Set", SampleXml("gray", 0.5) + LabSampleXml("lab", "50", "20", "10"));
  }
};

TEST_F(UsageTest, WrongUsageIsRefusedWithTheAllowedWordsBeforeAnythingIsWritten) {
  WriteFile("old.txt", "old");
  for (const Wrong& wrong : kWrong) {
    const Result result = Run(std::string(wrong.arguments) + " --output old.txt");
    EXPECT_EQ(result.status, 2) << wrong.arguments;
    EXPECT_TRUE(Holds(result.err, wrong.text));
    EXPECT_EQ(result.out, "");
    EXPECT_EQ(ReadFile("old.txt"), "old");
  }
}

TEST_F(UsageTest, ConditionsOfTheVocabularyAreTakenAndTheLastOneCounts) {
  const Result result =
      Run("color --format=json --illuminant A --condition Colorimetric.Illumination=5000K "
          "--condition CustomCondition=Enable --condition Lab.Room=a=b a.xml");
  EXPECT_EQ(result.status, 1) << "the colour under D50 is not one under a daylight of 5000 K";
  EXPECT_TRUE(Holds(result.out, "\"Colorimetric.Illumination\": \"Dxx, Temperature:5000\""));
  EXPECT_TRUE(Holds(result.out, "\"Lab.Room\": \"a=b\""));
}

TEST_F(UsageTest, DaylightOutsideItsRangeIsComputedWithAWarning) {
  const std::string gray = "color a.xml --sample gray --illuminant ";
  EXPECT_EQ(Run(gray + "4000K").err, "");
  EXPECT_EQ(Run(gray + "25000K").err, "");
  for (const char* outside : {"3999K", "25001K"}) {
    const Result result = Run(gray + outside);
    EXPECT_EQ(result.status, 0) << outside;
    EXPECT_TRUE(Holds(result.err, "warning: daylight is defined from 4000 to 25000 K"));
  }
}

TEST_F(UsageTest, HelpAndVersionGoToStandardOutput) {
  const Result bare = Run("");
  EXPECT_EQ(bare.status, 2);
  EXPECT_TRUE(Holds(bare.out, "color"));
  for (const std::string command : {"info", "color"}) {
    const Result help = Run(command + " --help");
    EXPECT_EQ(help.status, 0);
    EXPECT_TRUE(Holds(help.out, "Examples:\n  aldermoor " + command));
    EXPECT_TRUE(Holds(help.out, "Exit status:"));
    EXPECT_EQ(help.err, "");
  }
  const Result version = Run("--version");
  EXPECT_EQ(version.status, 0);
  EXPECT_EQ(version.out.rfind("aldermoor ", 0), 0U) << version.out;
}

TEST_F(UsageTest, FileMayBearTheNameOfASubcommand) {
  EXPECT_EQ(Shell("mv a.xml info; aldermoor color info --sample gray").status, 0);
}

}  // namespace
}  // namespace Aldermoor::Tool
