// light, density and classify, and what the commands of colorimetry refuse.
#include <cmath>
#include <cstdlib>
#include <initializer_list>
#include <map>
#include <tuple>
#include <utility>

#include <gtest/gtest.h>

#include "toolrun.h"

namespace Aldermoor::Tool {
namespace {

const std::string kChart = ALDERMOOR_EXAMPLES "/chart24.xml";

TEST_F(ToolTest, LightFindsTheFiguresOfTheEqualEnergySpectrumInOneThatSaysNothing) {
  WriteDocument("a.xml", "S", SampleXml("E", 1.0) + SampleXml("dark", 0.0));
  const Result result = Run("light a.xml --format csv");
  EXPECT_TRUE(Holds(result.err, "S/dark: the spectrum gives no light"));
  const auto lines = ParseCsv(result.out);
  ASSERT_EQ(lines.size(), 2U);
  // By its definition, and CIE 15:2004, 8.1, for u' and v'.  The temperature is 5455 K, Ra 95; 36
  // bands come within 10 K and 3 digits.
  const std::map<std::size_t, float> expected = {
      {6, 1.0F / 3.0F}, {7, 1.0F / 3.0F}, {8, 4.0F / 19.0F}, {9, 9.0F / 19.0F}};
  for (const auto& [column, value] : expected) {
    EXPECT_NEAR(std::strtof(lines[1].at(column).c_str(), nullptr), value, 1e-3F)
        << lines[0][column];
  }
  EXPECT_NEAR(std::strtof(lines[1][2].c_str(), nullptr), 5455.0F, 10.0F);
  EXPECT_EQ(lines[1][3] + " " + lines[1][5], "95 D55");
  EXPECT_EQ(lines[1][10] + " " + lines[1][11], "Emission TwoDegree");
}

TEST_F(ToolTest, DensitiesAndPrintControlFollowTheirDefinitions) {
  // Grey fields; a halftone reflects half as much as paper and solid together.
  WriteDocument("a.xml", "S",
                SampleXml("paper", 0.8) + SampleXml("solid", 0.08) + SampleXml("tint", 0.44) +
                    SampleXml("first", 0.4) + SampleXml("second", 0.2) + SampleXml("full", 0.1));
  const float absolute = -std::log10(0.44F);
  const float tint = std::log10(0.8F / 0.44F);
  const float area2 = (1.0F - std::pow(10.0F, -tint / 2.0F)) / (1.0F - std::pow(10.0F, -0.5F));
  using Case = std::tuple<const char*, std::size_t, float>;  // options, column, value
  // ISO 5-3: minus the logarithm of the reflectance.  ISO 12647-1: Murray and Davies with the
  // factor of Yule and Nielsen, contrast, and trapping by Preucil, in percent.
  for (const auto& [options, column, value] :
       {Case{"--sample tint", 5, absolute}, Case{"--sample tint --paper S/paper", 2, tint},
        Case{"--sample tint --paper S/paper --absolute --standard ANSIT", 3, absolute},
        Case{"--sample tint --paper S/paper --filter Max", 6, tint},
        Case{"--sample tint --paper S/paper --solid S/solid", 9, 50.0F},
        Case{"--sample tint --paper S/paper --solid S/solid", 10, 100.0F * (1.0F - tint)},
        Case{"--sample tint --paper S/paper --solid S/solid --yule-nielsen 2", 9, 100.0F * area2},
        Case{"--paper S/paper --first S/first --second S/second --overprint S/full", 5, 100.0F},
        Case{"--paper S/paper --first S/first --second S/second --overprint S/second", 5, 50.0F}}) {
    const auto lines = ParseCsv(Run(std::string("density a.xml --format csv ") + options).out);
    ASSERT_EQ(lines.size(), 2U) << options;
    EXPECT_NEAR(std::strtof(lines[1].at(column).c_str(), nullptr), value, 2e-3F * value) << options;
  }
}

TEST_F(ToolTest, AutomaticFilterTakesTheSolidOfTheFieldsOwnChannel) {
  // These patches of the chart are no solids but lie in three channels.
  const std::string run =
      "density --format csv --paper 'chart/white 9.5' --solid chart/cyan "
      "--solid chart/magenta --solid chart/yellow ";
  std::string own;
  for (const Fields& line : ParseCsv(Run(run + kChart).out)) {
    own += line[1] == line[8] ? line[1] + line[9] + " " : "";
  }
  EXPECT_EQ(own, "yellow100 magenta100 cyan100 ");
  EXPECT_TRUE(Holds(Run(run + "--solid chart/cyan " + kChart).err, "are both of channel Cyan"));
  const std::string trapping =
      "density --format csv --paper 'chart/white 9.5' --first chart/cyan "
      "--second chart/magenta --overprint chart/blue ";
  EXPECT_TRUE(Holds(Run(trapping + kChart).out, "chart,blue,cyan,magenta,Magenta,"));
}

TEST_F(ToolTest, ClassifyNamesThePatchesOfTheChart) {
  const std::string text = Run("classify --format csv " + kChart).out;
  for (const char* line : {"red,Red", "blue,Blue", "yellow green,YellowGreen", "black 2,Black"}) {
    EXPECT_TRUE(Holds(text, std::string("chart,") + line + "\n"));
  }
  EXPECT_NE(Run("classify --illuminant F11 --format csv " + kChart).out, text);
}

TEST_F(ToolTest, ColorimetryRefusesWhatMakesNoSenseBeforeAnythingIsWritten) {
  WriteFile("old.txt", "old");
  for (const auto& [arguments, text] : std::initializer_list<std::pair<const char*, const char*>>{
           {"diff a.xml a.xml --formula 76", "FMCII, CMC, 94, 2000"},
           {"diff a.xml a.xml --formula CMC --weights 2,1,1", "CMC takes 2 numbers above 0"},
           {"diff a.xml a.xml --weights 1,0,1", "2000 takes 3 numbers above 0"},
           {"diff a.xml a.xml --limit nan", "0 or above"},
           {"diff - -", "only once"},
           {"metamerism a.xml a.xml --test A,@a.xml:S/gray", "needs a name"},
           {"metamerism a.xml a.xml --reference Emission", "is for lights"},
           {"spectrum 1,2", "'1,2' is not of 3 numbers"},
           {"spectrum", "or --input"},
           {"spectrum 1,2,3 --space CIELCh", "CIELab, CIEXYZ, RGB"},
           {"density a.xml --standard User", "ANSIT, SPI"},
           {"density a.xml --solid S/gray", "--solid needs --paper"},
           {"density a.xml --paper gray", "not of the form SET/SAMPLE"},
           {"density a.xml --paper S/a --first S/a --second S/b --overprint S/c --absolute",
            "without"},
           {"density a.xml --paper S/gray --first S/gray", "--overprint together"},
           {"classify a.xml --observer 2", "TwoDegree, TenDegree"}}) {
    const Result result = Run(std::string(arguments) + " --output old.txt");
    EXPECT_EQ(result.status, 2) << arguments;
    EXPECT_TRUE(Holds(result.err, text));
    EXPECT_EQ(ReadFile("old.txt"), "old");
  }
}

}  // namespace
}  // namespace Aldermoor::Tool
