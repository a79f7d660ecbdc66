#include <bit>
#include <charconv>
#include <cstdint>

#include <gtest/gtest.h>

#include "toolrun.h"

namespace Aldermoor::Tool {
namespace {

const std::string kExample = ALDERMOOR_EXAMPLES "/patches.csv";
const std::string kD50 = "# Colorimetric.Illumination=D50\n# Colorimetric.Observer=TwoDegree\n";

std::string Bands(const std::string& value = "") {
  std::string text;
  for (int wavelength = 380; wavelength <= 730; wavelength += 10) {
    text += "," + (value.empty() ? std::to_string(wavelength) : value);
  }
  return text;
}

class ConvertTest : public ToolTest {
 protected:
  ConvertTest() { WriteFile("old.xml", "old"); }

  // Every way to fail leaves the file that was there.
  void ExpectRefused(const std::string& arguments, const std::string& text, int status) const {
    const Result result = Run("convert " + arguments);
    EXPECT_EQ(result.status, status) << arguments;
    EXPECT_TRUE(Holds(result.err, text)) << arguments;
    EXPECT_EQ(ReadFile("old.xml"), "old");
  }
};

TEST_F(ConvertTest, ShippedTableBecomesADocumentWithItsNumbers) {
  EXPECT_EQ(Run("convert " + kExample + " a.xml").err, "");
  EXPECT_EQ(Shell("test -s Cache/a.vexb").status, 0);
  const auto lab = ParseCsv(Run("color a.xml --format csv").out);
  ASSERT_EQ(lab.size(), 5U);
  EXPECT_EQ(lab[4], (Fields{"chart", "red target", "42", "55", "28"})) << "a row without spectrum";
  EXPECT_EQ(lab[2][1], "white") << "a row without colour";
  EXPECT_NEAR(std::stod(lab[2][2]), 96.54, 0.04) << "the published L* of the patch";
  EXPECT_EQ(Run("convert a.xml b.csv").status, 0);
  const auto there = ParseCsv(Shell("grep -v '^\"*#' " + kExample).out);
  EXPECT_EQ(ParseCsv(Shell("grep -v '^\"*#' b.csv").out), there);
}

TEST_F(ConvertTest, FloatsComeThroughCsvBitForBit) {
  std::vector<float> floats = {-0.0F, 1e-45F, 3.4028235e38F, 1.1754944e-38F, 16777216.0F, 0.1F};
  for (std::uint32_t bits = 12345; floats.size() < 36; bits = bits * 1664525U + 1013904223U) {
    floats.push_back(std::bit_cast<float>(bits & 0xBFFFFFFFU));
  }
  std::string row = "x";
  for (const float value : floats) {
    char text[32];
    row += "," + std::string(text, std::to_chars(text, text + sizeof text, value).ptr);
  }
  WriteFile("a.csv", "Name" + Bands() + "\n" + row + "\n");
  EXPECT_EQ(Run("convert a.csv b.csv").err, "");
  const Fields cells = ParseCsv(Shell("aldermoor convert b.csv - --to csv | tail -1").out).at(0);
  ASSERT_EQ(cells.size(), 37U);
  for (std::size_t i = 0; i < 36; ++i) {
    float value = 0.0F;
    std::from_chars(cells[i + 1].data(), cells[i + 1].data() + cells[i + 1].size(), value);
    EXPECT_EQ(std::bit_cast<std::uint32_t>(value), std::bit_cast<std::uint32_t>(floats[i])) << i;
  }
}

TEST_F(ConvertTest, WhatXmlHoldsComesBackFromCsv) {
  std::string xml =
      "<VEX Version='1'><Name/><Description>two\n\"lines\"</Description><SampleSet><Name>A;1</Name>"
      "<Creator>me, too</Creator></SampleSet><SampleSet><Name/>";
  xml += SampleXml("twice", 0.5) + LabSampleXml("twice", "50", "1e-7", "-3") + SampleXml("", 0.25);
  xml += "<Sample><Name> #1 \"q\"</Name><Created>2001-02-03/04:05:06</Created><AdditionalData>";
  for (const char* key : {"", "380 nm", "C", "L*", "Sample.Set", "Set", "empty", "ä, &amp;\t"}) {
    xml += "<Value Name='" + std::string(key) + "'>" + (*key == 'e' ? "" : "v") + "</Value>";
  }
  xml += "</AdditionalData></Sample></SampleSet><Conditions><ID>1</ID>";
  for (const char* pair : {"NumberOfDataPointsSpectrum'>36", "SpectrumType'>Reflex",
                           "WavelengthSpectrumMax'>730", "WavelengthSpectrumMin'>380"}) {
    xml += "<Attribute Name='Physical." + std::string(pair) + "</Attribute>";
  }
  xml +=
      "<Attribute Name='Lab room'>3</Attribute></Conditions><Conditions><ID>2</ID>"
      "<Attribute Name='ColorSpaceDescription.Type'>CIELab</Attribute>"
      "<Attribute Name='Colorimetric.Illumination'>Dxx, Temperature:6500</Attribute>"
      "<Attribute Name='Colorimetric.Observer'>TenDegree</Attribute></Conditions></VEX>";
  WriteFile("a.xml", xml);
  EXPECT_EQ(Run("convert a.xml b.xml --no-cache").err, "");
  EXPECT_EQ(Run("convert b.xml -").out, ReadFile("b.xml")) << "no dates of reading come in";
  for (const std::string separator : {"comma", "semicolon", "tab"}) {
    const std::string option = " --no-cache --separator " + separator;
    EXPECT_EQ(Run("convert a.xml a.csv" + option).status, 0);
    EXPECT_EQ(Run("convert a.csv d.xml" + option).status, 0);
    EXPECT_EQ(ReadFile("d.xml"), ReadFile("b.xml")) << separator;
  }
  EXPECT_EQ(Shell("test -e Cache").status, 1);
}

TEST_F(ConvertTest, EveryFaultyCellIsToldWithItsPlaceAndItsRowCanBeLeftOut) {
  const std::string good = "good" + Bands("0.5") + ",50,1,2";
  WriteFile("a.csv", "\xEF\xBB\xBF" + kD50 + "Name" + Bands() + ",L*,a*,b*\r\n" + good +
                         "\r\n\"\xC3\xBC\n\"" + Bands("0.5") + ",4;5,,1e99\r\n\xC3\xBC" +
                         Bands("\"\"") + ",nan,+1,2 \n\nshort,1\n\xFF" + Bands("1") +
                         ",1,2,a\"b\nx,\"y\" ,\"1\n");
  const std::string faults =
      "a.csv:6:147: '4;5' is no number; expected a number such as 0.5\n"
      "a.csv:6:152: '1e99' does not fit single precision; expected 1e-38 to 3e38\n"
      "a.csv:6:151: a value is missing; expected all 3 or none\n"
      "a.csv:7:111: 'nan' is not finite; expected a number such as 0.5\n"
      "a.csv:7:115: '+1' is no number; expected a number such as 0.5\n"
      "a.csv:7:118: '2 ' is no number; expected a number such as 0.5\n"
      "a.csv:9:7: expected 40 cells in the row, found 2\n"
      "a.csv:10:1: the cell holds bytes that are no UTF-8\n"
      "a.csv:10:79: a quote inside a cell; expected quotes around the cell and the quote twice\n"
      "a.csv:10:79: 'a\"b' is no number; expected a number such as 0.5\n"
      "a.csv:11:3: text follows the closing quote; expected a separator or the line's end\n"
      "a.csv:11:8: the quotes that begin here are never closed\n"
      "a.csv:11:8: expected 40 cells in the row, found 3\n"
      "a.csv: 13 faults; nothing is written\n";
  ExpectRefused("a.csv old.xml", "nothing is written", 3);
  EXPECT_EQ(Shell("aldermoor convert a.csv old.xml 2>&1 | sed 's/^aldermoor: //'").out, faults);
  const Result skipped = Run("convert a.csv b.csv --skip-faulty");
  EXPECT_EQ(skipped.status, 1);
  EXPECT_TRUE(Holds(skipped.err, "5 rows left out"));
  EXPECT_EQ(Shell("tail -1 b.csv").out, good + "\n");
  WriteFile("a.csv",
            "Name" + Bands() + "\nx" + Bands("?") + "\nx" + Bands("?") + "\nx" + Bands("?"));
  ExpectRefused("a.csv old.xml", "a.csv: and 8 more faults", 3);
}

struct Conversion {
  std::string content;
  const char* arguments;
  const char* text;  // a part of what is told
  int status = 3;
};

TEST_F(ConvertTest, ColumnsAndSettingsThatAreNotClearAreRefused) {
  const Conversion cases[] = {
      {"Name,380,390nm,385,R740\n", "", "730; too many: 385, R740"},
      {"Name" + Bands() + ",380 nm\n", "", "too many: 380 nm"},
      {"380" + Bands() + "\n", "", "1:1: '380' is no heading for the first column"},
      {kD50 + "Name,L,a,b\n", "", "3:1: the columns fit CIELab, HunterLab, LABhx"},
      {kD50 + "Name,X,Y,Z,x,y\n", "", "the columns fit CIEXYZ, CIExyY"},
      {kD50 + "Name,L\n", "--condition ColorSpaceDescription.Type=CIELab", "columns L*, a*, b*"},
      {"Name,X,Y,Z\n", "", "one of A, B, C, D50"},
      {"# Colorimetric.Observer=Two\nName,X\n", "",
       "1:1: this setting Colorimetric.Observer: 'Two'"},
      {"# Observer=TwoDegree\nName,X\n", "", "'Observer' is not one of"},
      {"# Document.Description=a, b\nName\n", "", "1:26: a setting ends at the separator"},
      {"# Set=a\n# Set=b\nName,Note\n", "", "several sets are named; expected a column 'Set'"},
      {"Name,Note,Note\n", "", "1:11: a second column for 'Note'"},
      {"Name;380\n", "", "see --separator"},
      {"Name,Note,\nx,,7\n", "", "2:4: a value in a column without heading"},
      {"# Set=a\nName\n", "--set b", "--set is for a file that does not name its sets", 2},
      {"Name\n", "--condition Physical.SpectrumType=Remision", "Remission, Emission", 2},
      {"", "", "no line with the headings"},
  };
  for (const Conversion& one : cases) {
    WriteFile("a.csv", one.content);
    ExpectRefused(std::string("a.csv old.xml ") + one.arguments, one.text, one.status);
  }
  ExpectRefused("nix.csv old.xml", "No such file", 3);
  ExpectRefused("old.xml old.xml --percent", "CSV file that is read", 2);
}

TEST_F(ConvertTest, PercentAndLostDigitsAreWhatTheOptionAndTheFormatMakeThem) {
  WriteFile("a.csv", "Name" + Bands() + "\nx" + Bands("12.34567") + "\n");
  EXPECT_TRUE(Holds(Run("convert a.csv b.csv").err, "every spectral value is above 1.5"));
  const Result percent = Run("convert a.csv b.xml --percent --set Ramp");
  // |0.123457 - 0.1234567| / 0.1234567
  EXPECT_EQ(percent.err,
            "aldermoor: 36 of 36 values lose digits in XML, at most 2.4e-06 of the value\n");
  EXPECT_EQ(percent.status, 0);
  EXPECT_TRUE(Holds(ReadFile("b.xml"), "<Value Name=\"730\">0.123457</Value>"));
  EXPECT_TRUE(Holds(ReadFile("b.xml"), "<Name>Ramp</Name>"));
  EXPECT_TRUE(Holds(Run("convert a.csv - --percent --to csv").out, ",0.1234567,"));
}

TEST_F(ConvertTest, LegacyDocumentIsCompletedOrRefusedWithTheSample) {
  WriteFile("a.xml",
            "<VEX><Name/><SampleSet><Name>S</Name><Sample><Name>x</Name><SampleAttribute>"
            "<Spectrum Conditions='1'><Value Name='500'>0.5</Value><Value Name='400'>1</Value>"
            "<Value Name='600'>2</Value></Spectrum></SampleAttribute><SampleAttribute>"
            "<ColorVector Conditions='2'><Value Name='1'>3</Value><Value Name='2'>4</Value>"
            "<Value Name='3'>5</Value></ColorVector></SampleAttribute></Sample></SampleSet>"
            "<Conditions><ID>1</ID><Attribute Name='Physical.WavelengthSpectrumMin'>400nm"
            "</Attribute><Attribute Name='Physical.SpectrumType'>Flash</Attribute></Conditions>"
            "<Conditions><ID>2</ID><Attribute Name='ColorSpaceDescription.Type'>CIEXYZ</Attribute>"
            "<Attribute Name='Colorimetric.Observer'>TenDegree</Attribute></Conditions></VEX>");
  ExpectRefused("a.xml old.xml", "sample 'x': the conditions of a spectrum lack Physical.Wave", 1);
  ExpectRefused("a.xml old.xml", "a colour lack Colorimetric.Illumination;", 1);
  const std::string given =
      " --condition Colorimetric.Illumination=A --condition Physical.SpectrumType=Emission"
      " --condition Physical.WavelengthSpectrumMax=";
  ExpectRefused("a.xml old.xml" + given + "401nm",
                "3 points at 400, 500, 600 nm, but the conditions say from '400nm' to '401nm'", 1);
  ExpectRefused("a.xml old.xml" + given + "200nm", "conditions say from '400nm' to '200nm'", 1);
  const Result result = Run("convert a.xml b.xml" + given + "600nm");
  EXPECT_EQ(result.status, 0);
  EXPECT_TRUE(Holds(result.err, "NumberOfDataPointsSpectrum set to 3, the number of values"));
  EXPECT_TRUE(Holds(result.err, "Physical.SpectrumType=Emission is not needed"));
  const std::string xml = ReadFile("b.xml");
  EXPECT_TRUE(Holds(xml, "<Value Name=\"500\">0.5</Value>"));
  EXPECT_TRUE(Holds(xml, "<Value Name=\"Y\">4</Value>"));
  EXPECT_TRUE(Holds(xml, "\"Physical.SpectrumType\">Flash<"));
  EXPECT_EQ(Run("check b.xml").out, "b.xml: in order\n");
}

TEST_F(ConvertTest, WhatARowCannotCarryIsRefusedOrLeftOutWithTheSample) {
  const std::string spectrum = SampleXml("", 0.5);
  const std::size_t begin = spectrum.find("<SampleAttribute>");
  const std::string whole = spectrum.substr(begin, spectrum.find("</Sample>") - begin);
  std::string named = whole;
  named.insert(named.find("<Value"), "<Description>d</Description>");
  const std::string lab = LabSampleXml("y", "1", "2", "3");
  std::string other_label = lab;
  other_label.replace(other_label.find("a*"), 2, "u*");
  const Conversion cases[] = {
      {"<Sample><Name>x</Name>" + whole + whole + "</Sample>", "", "a second spectrum"},
      {"<Sample><Name>x</Name>" + named + "</Sample>", "",
       "a header value 'Description' of its own"},
      {"<Sample><Name>x</Name><SampleAttribute><Gloss Conditions='1'/></SampleAttribute></Sample>",
       "", "an attribute of an unknown kind"},
      {other_label, "", "a colour with other channels than those of CIELab"},
      {lab + lab + "</SampleSet><SampleSet><Name>Set</Name>", "", "a second set 'Set'"},
  };
  for (const Conversion& one : cases) {
    WriteDocument("a.xml", "Set", one.content + lab);
    ExpectRefused("a.xml old.xml --to csv", one.text, 1);
    const Result result = Run("convert a.xml - --to csv --skip-faulty");
    EXPECT_EQ(result.status, 1);
    EXPECT_TRUE(Holds(result.err, one.text));
    EXPECT_TRUE(Holds(result.out, ",1,2,3\n")) << "the others stay";
  }
}

}  // namespace
}  // namespace Aldermoor::Tool
