#include <cmath>
#include <cstdlib>

#include <gtest/gtest.h>
#include <nlohmann/json.hpp>

#include "toolrun.h"

namespace Aldermoor::Tool {
namespace {

using nlohmann::json;

class ColorTest : public ToolTest {
 protected:
  /// The CSV of a run that succeeds.
  std::vector<Fields> Csv(const std::string& arguments) const {
    const Result result = Run("color --format=csv " + arguments);
    EXPECT_EQ(result.status, 0) << result.err;
    return ParseCsv(result.out);
  }
};

TEST_F(ColorTest, GrayOfHalfTheReflectanceHasTheLightnessOfTheDefinition) {
  WriteDocument("a.xml", "Set", SampleXml("gray", 0.5));
  // CIE 15:2004, 8.2.1: L* = 116 (Y/Yn)^(1/3) - 16, and a* = b* = 0 for every illuminant.  The
  // weights add up to the white within single precision.
  const float lightness = 116.0F * std::cbrt(0.5F) - 16.0F;
  for (const std::string illuminant : {"A", "B", "C", "D50", "D65", "F1", "F2", "F12", "6500K"}) {
    for (const std::string observer : {"TwoDegree", "TenDegree"}) {
      SCOPED_TRACE(illuminant + " " + observer);
      const auto lines = Csv("a.xml --illuminant " + illuminant + " --observer " + observer);
      ASSERT_EQ(lines.size(), 2U);
      EXPECT_EQ(lines[0], (Fields{"set", "sample", "L*", "a*", "b*"}));
      EXPECT_NEAR(ToFloat(lines[1][2]), lightness, 1e-3F);
      EXPECT_NEAR(ToFloat(lines[1][3]), 0.0F, 1e-3F);
      EXPECT_NEAR(ToFloat(lines[1][4]), 0.0F, 1e-3F);
    }
  }
}

TEST_F(ColorTest, WhiteReflectsTheChromaticityOfTheIlluminant) {
  WriteDocument("a.xml", "Set", SampleXml("white", 1.0));
  WriteDocument("la:mp.xml", "S1",
                SampleXml("red/ish", 0.1, 0.02) + SampleXml("equal", 1.0) +
                    LabSampleXml("lab", "50", "0", "0"));
  struct Case {
    const char* illuminant;
    float x, y;
  };
  // CIE 15:2004, tables T.3 and T.8.2, two-degree observer; 36 bands reach them to 3 digits.
  // Illuminant E has x = y = 1/3 by definition.
  for (const Case& c :
       {Case{"A", 0.44758F, 0.40745F}, Case{"D50", 0.34567F, 0.35851F},
        Case{"D65", 0.31272F, 0.32903F}, Case{"6504K", 0.31272F, 0.32903F},
        Case{"F11", 0.3805F, 0.3769F}, Case{"@la:mp.xml:S1/equal", 1.0F / 3.0F, 1.0F / 3.0F}}) {
    const auto lines = Csv(std::string("a.xml --space=CIExyY --illuminant=") + c.illuminant);
    ASSERT_EQ(lines.size(), 2U) << c.illuminant;
    EXPECT_NEAR(ToFloat(lines[1][2]), c.x, 1e-3F) << c.illuminant;
    EXPECT_NEAR(ToFloat(lines[1][3]), c.y, 1e-3F) << c.illuminant;
  }
  const auto reddish = Csv("a.xml --space=CIExyY --illuminant=@la:mp.xml:S1/red/ish");
  ASSERT_EQ(reddish.size(), 2U) << "a sample name may hold a slash";
  EXPECT_GT(ToFloat(reddish[1][2]), 0.38F);

  const auto status = [this](const std::string& lamp) {
    return Run("color a.xml --illuminant=@" + lamp).status;
  };
  EXPECT_EQ(status("la:mp.xml:S1/nix"), 2);
  EXPECT_EQ(status("la:mp.xml:S1/lab"), 2);
  EXPECT_EQ(status("la:mp.xml"), 2);
  EXPECT_EQ(status("nix.xml:S1/equal"), 3);
  EXPECT_EQ(status("la:mp.xml:S1:S1/equal"), 3) << "the last colon ends the file name";
}

TEST_F(ColorTest, NumbersInCsvAndJsonReadBackToTheSameFloat) {
  // A stored colour that meets the conditions comes back unchanged; six digits are what a file
  // holds, and "0.1" as a double is not the float.
  WriteDocument("a.xml", "Set",
                LabSampleXml("stored", "0.1", "-33.3333", "1e-7") + SampleXml("orange", 0.1, 0.02));
  const auto lines = Csv("a.xml");
  const std::string text = Run("color a.xml --format json").out;
  ASSERT_EQ(lines.size(), 3U);
  EXPECT_EQ(lines[1], (Fields{"Set", "stored", "0.1", "-33.3333", "1e-07"}));
  const json results = json::parse(text).at("results");
  ASSERT_EQ(results.size(), 2U);
  for (std::size_t row = 0; row < 2; ++row) {
    for (std::size_t column = 2; column < 5; ++column) {
      const std::string& number = lines[row + 1][column];
      EXPECT_EQ(results[row].at(lines[0][column]).get<float>(), ToFloat(number));
      EXPECT_TRUE(Holds(text, ": " + number));
    }
  }
  EXPECT_LE(lines[2][2].size(), 9U + 1U);  // 9 digits tell every float
}

TEST_F(ColorTest, WhatIsNoNumberIsNullInJsonAndNanInCsv) {
  WriteDocument("a.xml", "Set", SampleXml("black", 0.0));  // as a lamp it lights nothing
  const std::string request = "color a.xml --space CIEXYZ --illuminant @a.xml:Set/black --format ";
  EXPECT_TRUE(Holds(Run(request + "csv").out, "Set,black,nan,"));
  EXPECT_TRUE(json::parse(Run(request + "json").out).at("results")[0].at("X").is_null());
}

TEST_F(ColorTest, NamesKeepTheirLettersAndCannotBreakTheFormats) {
  const std::string name = "Gr\xC3\xBCn \"50\", \xE6\x97\xA5";
  WriteDocument("a.xml", "\xC3\x9C", SampleXml(name, 0.5) + SampleXml("b", 0.5));
  for (const char* locale : {"C", "C.UTF-8"}) {
    const std::string run = std::string("export LC_ALL=") + locale + "; aldermoor color a.xml";
    EXPECT_EQ(ParseCsv(Shell(run + " --format csv").out).at(1).at(1), name) << locale;
    EXPECT_EQ(json::parse(Shell(run + " --format json").out)["results"][0]["sample"], name);
  }
  EXPECT_EQ(Run("color a.xml").out,
            "set  sample            L*    a*    b*\n"
            "\xC3\x9C    " +
                name +
                "  76.07  0.00  0.00\n"
                "\xC3\x9C    b              76.07  0.00  0.00\n");
}

TEST_F(ColorTest, FiltersSelectSetsAndSamples) {
  WriteDocument("a.xml", "A", SampleXml("x", 0.5) + SampleXml("y", 0.5));
  WriteDocument("b.xml", "B", SampleXml("x", 0.5));
  const auto rows = [this](const std::string& filter) {
    std::string names;
    for (const Fields& line : Csv("a.xml b.xml " + filter)) {
      names += line.at(0) + ":" + line.at(1) + "/" + line.at(2) + " ";
    }
    return names;
  };
  EXPECT_EQ(rows(""), "file:set/sample a.xml:A/x a.xml:A/y b.xml:B/x ");
  EXPECT_EQ(rows("--set B"), "file:set/sample b.xml:B/x ");
  EXPECT_EQ(rows("--sample x"), "file:set/sample a.xml:A/x b.xml:B/x ");
  EXPECT_EQ(rows("--set A --sample y"), "file:set/sample a.xml:A/y ");
  const Result nothing = Run("color a.xml --sample z");
  EXPECT_EQ(nothing.status, 1);
  EXPECT_TRUE(Holds(nothing.err, "no sample 'z'"));
}

TEST_F(ColorTest, SampleThatCannotGiveTheColourIsNamedAndTheRestGoesOn) {
  WriteDocument("a.xml", "Set",
                "<Sample><Name>empty</Name></Sample>" + SampleXml("gray", 0.5) +
                    LabSampleXml("lab", "50", "20", "10"));
  const Result result = Run("color a.xml --space CIEuvY1976 --format csv");
  EXPECT_EQ(result.status, 1);
  EXPECT_EQ(ParseCsv(result.out).size(), 2U);
  EXPECT_TRUE(Holds(result.err, "a.xml: Set/empty: Sample empty has no sample attributes !!"));
  EXPECT_TRUE(Holds(result.err, "Set/lab: "));
  EXPECT_TRUE(Holds(result.err, "a colour in CIELab"));
  // A stored colour is not passed off as one under another illuminant.
  for (const std::string option :
       {"--illuminant=A", "--observer=TenDegree", "--white-base=Paper"}) {
    const Result other = Run("color a.xml --sample lab --format=csv " + option);
    EXPECT_EQ(other.status, 1) << option;
    EXPECT_EQ(ParseCsv(other.out).size(), 1U) << option;
    EXPECT_TRUE(Holds(other.err, "Set/lab: the colour holds for"));
  }
  // Chroma and hue of a* = 20, b* = 10 by their definition: sqrt(500), atan(1/2) in degrees.
  const auto polar = Csv("a.xml --sample lab --space=CIELCh");
  ASSERT_EQ(polar.size(), 2U);
  EXPECT_NEAR(ToFloat(polar[1][3]), 22.3607F, 1e-3F);
  EXPECT_NEAR(ToFloat(polar[1][4]), 26.5651F, 1e-3F);
}

TEST_F(ColorTest, LightHasItsOwnColourWhateverIlluminantIsAskedFor) {
  WriteDocument("light.xml", "Set", SampleXml("lamp", 1.0));
  std::string text = ReadFile("light.xml");
  const std::string mark = "<Attribute ";
  text.insert(text.find(mark),
              "<Attribute Name=\"Colorimetric.Illumination\">Emission</Attribute>");
  WriteFile("light.xml", text);
  const auto asked = Csv("light.xml --space CIExyY --illuminant D50");
  ASSERT_EQ(asked.size(), 2U);
  EXPECT_NEAR(ToFloat(asked[1][2]), 1.0F / 3.0F, 1e-3F);
  EXPECT_EQ(asked, Csv("light.xml --space CIExyY --illuminant Emission"));
}

}  // namespace
}  // namespace Aldermoor::Tool
