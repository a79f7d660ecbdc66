#include <gtest/gtest.h>
#include <nlohmann/json.hpp>

#include "toolrun.h"

namespace Aldermoor::Tool {
namespace {

/// What a file says about wavelengths, on its way through the commands.
class WavelengthsTest : public ToolTest {
 protected:
  WavelengthsTest() { WriteFile("old.xml", "old"); }

  // A document with 36 points from `first` on under conditions from `min` to `max`.
  void WriteSpectrum(const std::string& name, int first, const std::string& min,
                     const std::string& max) const {
    WriteDocument(name, "S", SampleXml("x", 0.5) + LabSampleXml("y", "50", "0", "0"));
    std::string text = ReadFile(name);
    for (int i = 35; i >= 0; --i) {
      const std::string old = "Name='" + std::to_string(380 + 10 * i) + "'";
      text.replace(text.find(old), old.size(), "Name='" + std::to_string(first + 10 * i) + "'");
    }
    text.replace(text.find(">380nm<"), 7, ">" + min + "<");
    text.replace(text.find(">730nm<"), 7, ">" + max + "<");
    WriteFile(name, text);
  }
};

TEST_F(WavelengthsTest, PointsOtherThanThoseOfTheConditionsComeThroughNoCommand) {
  WriteSpectrum("a.xml", 400, "380nm", "730nm");
  const std::string place =
      "a.xml: the wavelengths are not those of the conditions: set 'S', "
      "sample 'x': 36 points at 400, 410, 420 ... 750 nm";
  const std::pair<const char*, int> cases[] = {
      {"color a.xml -o old.xml", 3},
      {"color - -o old.xml < a.xml", 3},
      {"diff a.xml a.xml -o old.xml", 3},
      {"density a.xml -o old.xml", 3},
      {"light a.xml -o old.xml", 3},
      {"classify a.xml -o old.xml", 3},
      {"color good.xml --illuminant @a.xml:S/x -o old.xml", 3},
      {"convert a.xml old.xml", 1},
      {"convert a.xml old.xml --to csv", 1},
      {"merge a.xml good.xml -o old.xml", 1},
      {"merge good.xml a.xml -o old.xml", 1},
      {"extract a.xml --set S -o old.xml", 1},
      {"cache --rebuild a.xml", 3},
  };
  WriteSpectrum("good.xml", 380, "380nm", "730nm");
  for (const auto& [arguments, status] : cases) {
    const Result result = Run(arguments);
    EXPECT_EQ(result.status, status) << arguments;
    EXPECT_TRUE(Holds(result.err, "set 'S', sample 'x': 36 points at 400")) << arguments;
    EXPECT_EQ(ReadFile("old.xml"), "old") << arguments;
  }
  EXPECT_TRUE(Holds(Run("color a.xml").err, place));
  EXPECT_TRUE(Holds(Run("check a.xml").out, "a.xml:1:"));
  EXPECT_TRUE(Holds(Run("check a.xml").out, "warning: 36 points at 400, 410, 420 ... 750 nm"));
  EXPECT_TRUE(Holds(Run("info a.xml").out, "    set 'S', sample 'x': 36 points at 400"));
  const auto json = nlohmann::json::parse(Run("info a.xml --format json").out)["documents"][0];
  EXPECT_EQ(json["contradictions"]["count"], 1);
}

TEST_F(WavelengthsTest, CompleteTakesTheRangeFromThePointsAndSaysSo) {
  WriteSpectrum("a.xml", 400, "380nm", "730nm");
  WriteSpectrum("b.xml", 380, "730nm", "380nm");
  for (const std::string command :
       {"convert a.xml out.xml", "merge a.xml -o out.xml", "extract a.xml --set S -o out.xml"}) {
    const Result result = Run(command + " --complete");
    EXPECT_EQ(result.status, 0) << command << result.err;
    EXPECT_TRUE(Holds(
        result.err, "a.xml: the range 36 from 400nm to 750nm taken from the points of 1 spectrum"));
    EXPECT_TRUE(Holds(ReadFile("out.xml"), "<Value Name=\"750\">0.5<"));
    EXPECT_TRUE(Holds(ReadFile("out.xml"), "Max\">750nm<"));
    EXPECT_EQ(Run("check out.xml").out, "out.xml: in order\n");
  }
  EXPECT_EQ(Run("convert b.xml out.xml --complete").status, 0);
  EXPECT_TRUE(Holds(ReadFile("out.xml"), "Min\">380nm<"));
  EXPECT_EQ(Shell("sed \"s/Name='410'/Name='411'/\" a.xml > c.xml").status, 0);
  const Result uneven = Run("convert c.xml old.xml --complete");
  EXPECT_EQ(uneven.status, 1);
  EXPECT_TRUE(Holds(uneven.err, "the points have no one step"));
  EXPECT_EQ(ReadFile("old.xml"), "old");
}

TEST_F(WavelengthsTest, ColorsAreNotComputedOfSpectraOnAnotherGrid) {
  WriteSpectrum("a.xml", 400, "400nm", "750nm");
  for (const char* const command :
       {"color a.xml", "density a.xml", "classify a.xml", "diff a.xml a.xml"}) {
    const Result result = Run(command);
    EXPECT_EQ(result.status, 1) << command;
    EXPECT_TRUE(Holds(result.err, "the spectrum is from 400nm to 750nm")) << command;
  }
}

TEST_F(WavelengthsTest, ConditionsAreTakenAsTheFormatReadsThem) {
  const std::pair<std::string, const char*> cases[] = {
      {" 380", ""}, {"0380", ""}, {"+380nm", ""}, {"380.5 nm", "'380.5 nm' is read as 380"}};
  for (const auto& [min, told] : cases) {
    WriteSpectrum("a.xml", 380, min, "730nm");
    const Result result = Run("convert a.xml out.xml");
    EXPECT_EQ(result.status, 0) << min << result.err;
    EXPECT_TRUE(*told == '\0' ? ::testing::AssertionResult(result.err.empty())
                              : Holds(result.err, told))
        << result.err;
    EXPECT_EQ(Run("color a.xml --format csv").out, Run("color out.xml --format csv").out);
    EXPECT_EQ(Run("convert a.xml out.csv").status, 0) << min;
  }
  EXPECT_EQ(Run("convert a.xml old.xml --strict").status, 1);
}

// The commands that write the document "a.xml", as far as the name of the output.
const std::string kWriters[] = {"convert a.xml ", "merge a.xml -o ", "extract a.xml --set S -o "};

TEST_F(WavelengthsTest, WhatIsLostIsToldByAllThatWriteDocumentsAndStrictRefusesIt) {
  const std::string lab =
      "<ColorVector Conditions='2'><Value Name='b*'>50</Value><Value Name='a*'>1</Value><Value "
      "Name='L*'>2</Value></ColorVector>";
  const std::string dialects[] = {"<VEX Version='1.0'>", "<VEX>"};
  const struct {
    std::string content;
    const char* told;
    bool is_kept = false;  // by the current dialect
  } cases[] = {
      {"<Recipe Conditions='1'><Thickness>1,5</Thickness></Recipe>", "'1,5' is no number"},
      {"<Recipe Conditions='1'><!-- --></Recipe>", "a comment is not kept"},
      {"<Recipe Conditions='1'><Creator><![CDATA[me]]></Creator></Recipe>",
       "the text of 'Creator'"},
      {"<Recipe Conditions='1' Date='x'/>", "the attribute 'Date' of 'Recipe' is not read"},
      {lab, "labelled 'b*', 'a*', 'L*' but count by position, as 'L*', 'a*', 'b*'", true},
  };
  for (const auto& one : cases) {
    WriteDocument("a.xml", "S",
                  SampleXml("x", 0.5) + "<Sample><Name>x</Name><SampleAttribute>" + one.content +
                      "</SampleAttribute></Sample>" + LabSampleXml("z", "1", "2", "3"));
    const std::string text = ReadFile("a.xml");
    for (const std::string& dialect : dialects) {
      WriteFile("a.xml", dialect + text.substr(text.find('>', text.find("<VEX")) + 1));
      for (const std::string& writer : kWriters) {
        const Result lax = Run(writer + "out.xml");
        EXPECT_EQ(lax.status, 0) << lax.err;
        EXPECT_TRUE(Holds(lax.err, one.told)) << writer;
        EXPECT_FALSE(Holds(lax.err, "already")) << "an equal name is no loss";
        const Result strict = Run(writer + "old.xml --strict");
        EXPECT_EQ(strict.status, 1) << writer;
        EXPECT_TRUE(Holds(strict.err, one.told)) << writer;
        EXPECT_TRUE(Holds(strict.err, "a.xml: --strict; nothing is written")) << writer;
        EXPECT_EQ(ReadFile("old.xml"), "old");
        EXPECT_EQ(Run("convert out.xml out.xml --strict").status,
                  one.is_kept && dialect == dialects[0] ? 1 : 0)
            << "what was written is whole";
      }
    }
  }
}

TEST_F(WavelengthsTest, CompletionIsProposedWhereItHelpsOnly) {
  const std::string remedy = "takes the range from the points";
  WriteSpectrum("a.xml", 400, "380nm", "730nm");
  EXPECT_TRUE(Holds(Run("color a.xml").err, "; 'aldermoor convert --complete' " + remedy));
  EXPECT_TRUE(
      Holds(Run("cache --rebuild a.xml").err, "; 'aldermoor convert --complete' " + remedy));
  for (const std::string& writer : kWriters) {
    EXPECT_TRUE(Holds(Run(writer + "old.xml").err, "; --complete " + remedy)) << writer;
  }
  EXPECT_EQ(Shell("sed \"s/Name='410'/Name='411'/\" a.xml > b.xml; mv b.xml a.xml").status, 0);
  for (const std::string& writer : kWriters) {
    for (const char* const option : {"", " --complete"}) {
      const Result uneven = Run(writer + "old.xml" + option);
      EXPECT_EQ(uneven.status, 1) << writer;
      EXPECT_FALSE(Holds(uneven.err, remedy)) << writer << option;
    }
  }
  // An illuminant has no range of its own, whatever its points are.
  WriteSpectrum("a.xml", 380, "380nm", "730nm");
  std::string text = ReadFile("a.xml");
  std::string light = text.substr(text.find("<Spectrum"));
  light = light.substr(0, light.find("</Spectrum>") + 11);
  light.replace(light.find("'380'"), 5, "'381'");
  text.insert(text.find("<ID>2</ID>") + 10, light);
  WriteFile("a.xml", text);
  for (const char* const command : {"color a.xml", "convert a.xml old.xml"}) {
    const Result result = Run(command);
    EXPECT_TRUE(Holds(result.err, "the illuminant of the conditions '2'")) << command;
    EXPECT_FALSE(Holds(result.err, remedy)) << command;
  }
}

TEST_F(WavelengthsTest, WhatHasNoDatesShowsNone) {
  WriteSpectrum("a.xml", 380, "380nm", "730nm");
  EXPECT_FALSE(Holds(Run("info a.xml").out, "Created"));
  EXPECT_EQ(Run("convert a.xml a.xml").status, 0);
  EXPECT_FALSE(Holds(ReadFile("a.xml"), "Created"));
}

}  // namespace
}  // namespace Aldermoor::Tool
