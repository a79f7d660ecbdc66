#include <gtest/gtest.h>

#include "toolrun.h"

namespace Aldermoor::Tool {
namespace {

const std::string kUnknown =
    "<Sample><Name>u</Name><SampleAttribute><Gloss Conditions='1' Angle='60'><Deep>7</Deep></Gloss>"
    "</SampleAttribute></Sample>";

class DocumentsTest : public ToolTest {
 protected:
  DocumentsTest() {
    WriteDocument("a.xml", "Set", SampleXml("x", 0.5) + SampleXml("y", 0.25));
    WriteDocument("b.xml", "Set", kUnknown + LabSampleXml("x", "50", "20", "10"));
    WriteFile("old.xml", "old");
  }
};

TEST_F(DocumentsTest, MergeKeepsAllSetsAndTellsTheNewNames) {
  EXPECT_EQ(Shell("sed 's/Run 1/Run 2/' b.xml > c.xml").status, 0);
  const Result result = Run("merge a.xml b.xml c.xml -o all.xml");
  EXPECT_EQ(result.status, 0);
  EXPECT_TRUE(Holds(result.err, "a.xml:1:2739: warning: no attribute links to the conditions '2'"));
  EXPECT_EQ(result.err.substr(result.err.find('\n') + 1),
            "aldermoor: b.xml: the set 'Set' becomes 'Set (1)'\n"
            "aldermoor: c.xml: the values of its header are left out where the first document has "
            "others: Name\n"
            "aldermoor: c.xml: the set 'Set' becomes 'Set (2)'\n");
  const std::string info = Run("info all.xml").out;
  EXPECT_TRUE(Holds(info, "Run 1\n  3 sets, 6 samples\n    Set: 2 samples\n    Set (1): 2"));
  EXPECT_TRUE(Holds(info, "conditions 2, used by 2 attributes\n")) << "conditions are shared";
  EXPECT_TRUE(Holds(ReadFile("all.xml"), "<Gloss Angle=\"60\"")) << "unknown content";
  EXPECT_EQ(Run("merge a.xml -o - | cat").out, Run("convert a.xml -").out);
}

TEST_F(DocumentsTest, NothingIsWrittenFromWhatCannotBeReadOrDoesNotMatch) {
  const struct {
    const char* arguments;
    int status;
    const char* text;
  } cases[] = {
      {"merge a.xml old.xml", 3, "old.xml:1:1: "},
      {"merge - a.xml -", 2, "only once"},
      {"extract a.xml", 2, "--set or --sample"},
      {"extract a.xml --sample z", 1, "a.xml: no sample 'z'"},
      {"extract a.xml --set Nix", 1, "no samples in a set 'Nix'"},
  };
  for (const auto& one : cases) {
    const Result result = Run(std::string(one.arguments) + " -o old.xml");
    EXPECT_EQ(result.status, one.status) << one.arguments;
    EXPECT_TRUE(Holds(result.err, one.text));
    EXPECT_EQ(ReadFile("old.xml"), "old");
  }
}

TEST_F(DocumentsTest, WhatAFileWouldNotBringBackIsToldForEverySampleAndNothingIsWritten) {
  // Where the conditions have them, or nothing would be read.
  const auto spectrum = [](const std::string& first) {
    return "'><Value Name='" + first + "'>0.5</Value><Value Name='730'>1</Value></Spectrum>";
  };
  const std::string color = "'><Value Name='1'>3</Value><Value Name='2'>4</Value></ColorVector>";
  const auto sample = [](const std::string& name, const std::string& attribute) {
    return "<Sample><Name>" + name + "</Name><SampleAttribute>" + attribute +
           "</SampleAttribute></Sample>";
  };
  const auto block = [](const char* id, const char* key, const char* value) {
    return std::string("<Conditions><ID>") + id + "</ID><Attribute Name='" + key + "'>" + value +
           "</Attribute></Conditions>";
  };
  WriteFile("l.xml", "<VEX><Name/><SampleSet><Name>S</Name>" +
                         sample("count", "<Spectrum Conditions='1" + spectrum("380")) +
                         sample("range", "<Spectrum Conditions='2" + spectrum("0")) +
                         sample("colour", "<ColorVector Conditions='3" + color) + "</SampleSet>" +
                         block("1", "Physical.SpectrumType", "Flash") +
                         block("2", "Physical.WavelengthSpectrumMin", "0.73um") +
                         block("3", "ColorSpaceDescription.Type", "RGB") + "</VEX>");
  for (const char* const command :
       {"merge a.xml l.xml -o old.xml", "extract l.xml --set S -o old.xml"}) {
    const Result result = Run(command);
    EXPECT_EQ(result.status, 1) << command;
    for (const char* const fault :
         {"set 'S', sample 'count', Spectrum 1: 2 values under conditions that name 36\n",
          "set 'S', sample 'range', Spectrum 1: 2 values under conditions that name 36\n",
          "set 'S', sample 'range', Spectrum 1: the first wavelength, '0.73um', would be written "
          "as "
          "0\n",
          "set 'S', sample 'colour', ColorVector 1: Inconsistent ColorVector-size(expected 3 but "
          "got 2 elements for colorspace RGB)\n",
          "old.xml: XML cannot carry the document: 4 faults; nothing is written\n"}) {
      EXPECT_TRUE(Holds(result.err, fault)) << command << "\n" << result.err;
    }
    EXPECT_EQ(ReadFile("old.xml"), "old") << command;
  }
}

TEST_F(DocumentsTest, SpectraWithoutMandatoryConditionsComeThroughNoCommand) {
  const std::string type = "<Attribute Name='Physical.SpectrumType'>Remission</Attribute>";
  std::string text = ReadFile("a.xml");
  text.erase(text.find(type), type.size());
  WriteFile("current.xml", text);
  WriteFile("legacy.xml", text.erase(text.find(" Version='1.0'"), 14));
  for (const std::string file : {"current.xml", "legacy.xml"}) {
    for (const std::string& command :
         std::vector<std::string>{"convert " + file + " old.xml", "merge " + file + " -o old.xml",
                                  "extract " + file + " --set Set -o old.xml"}) {
      for (const char* const option : {"", " --complete"}) {
        const Result result = Run(command + option);
        EXPECT_EQ(result.status, 1) << command << option;
        EXPECT_TRUE(Holds(result.err,
                          "set 'Set', sample 'x': the conditions of a spectrum lack "
                          "Physical.SpectrumType; "))
            << command;
        EXPECT_TRUE(Holds(result.err, "conditions are missing; nothing is written")) << command;
        EXPECT_EQ(ReadFile("old.xml"), "old") << command << option;
      }
    }
  }
  EXPECT_EQ(Run("convert legacy.xml c.xml --condition Physical.SpectrumType=Remission").status, 0);
  EXPECT_EQ(Run("extract c.xml --set Set -o old.xml").status, 0);
}

TEST_F(DocumentsTest, ExtractKeepsWhatPassesAndTheHeader) {
  ASSERT_EQ(Run("merge a.xml b.xml -o all.xml").status, 0);
  EXPECT_EQ(Run("extract all.xml --sample y -o y.xml").status, 0);
  EXPECT_TRUE(Holds(Run("info y.xml").out, "Run 1\n  1 set, 1 sample\n    Set: 1 sample\n"))
      << "sets without a match go";
  EXPECT_EQ(Run("extract all.xml --set 'Set (1)' -o u.xml").status, 0);
  EXPECT_TRUE(Holds(ReadFile("u.xml"), "<Deep>7</Deep>"));
  EXPECT_TRUE(Holds(Run("info u.xml").out, "  1 set, 2 samples\n"));
  WriteFile("empty.xml", "<VEX Version='1'><Name/><SampleSet><Name>E</Name></SampleSet></VEX>");
  EXPECT_EQ(Run("extract empty.xml --set E -o e.xml").status, 0) << "an empty set that is named";
}

TEST_F(DocumentsTest, CacheIsRebuiltUsedAndRemoved) {
  EXPECT_EQ(Run("cache a.xml").out, "a.xml: Cache/a.vexb: not used: absent\n");
  EXPECT_TRUE(Holds(Run("cache --rebuild a.xml").out, ": used\n"));
  EXPECT_EQ(Shell("cp -p a.xml good; touch -r a.xml t; echo x > a.xml; touch -r t a.xml; "
                  "aldermoor info a.xml")
                .status,
            3)
      << "the cache is that of another content";
  EXPECT_TRUE(Holds(Run("cache a.xml").out, "not used: it belongs to another content"));
  const Result kept = Run("cache --rebuild a.xml nix.xml");
  EXPECT_EQ(kept.status, 3);
  EXPECT_TRUE(Holds(kept.err, "nix.xml: No such file"));
  EXPECT_EQ(Shell("mv good a.xml; test -e Cache/a.vexb && aldermoor cache a.xml").out.substr(0, 19),
            "a.xml: Cache/a.vexb")
      << "the cache outlives a document that cannot be read";
  EXPECT_TRUE(Holds(Run("cache a.xml").out, ": used\n"));
  EXPECT_EQ(Run("check a.xml").err, "");
  EXPECT_EQ(Run("info --no-cache a.xml").out, Run("info a.xml").out);
  EXPECT_EQ(Shell("touch -r Cache/a.vexb a.xml").status, 0);
  EXPECT_TRUE(Holds(Run("cache a.xml").out, "not used: not later than the document"));
  EXPECT_EQ(Shell("truncate -s 40 Cache/a.vexb; touch -d '+9 sec' Cache/a.vexb").status, 0);
  EXPECT_TRUE(Holds(Run("cache a.xml").out, "Cache/a.vexb, 40 bytes, "));
  EXPECT_TRUE(Holds(Run("cache a.xml").out, "not used: broken at 0x"));
  EXPECT_TRUE(Holds(Run("check a.xml").err, "a.xml: the cache is not used: broken at 0x"));
  EXPECT_EQ(Run("check a.xml").status, 0);
  EXPECT_EQ(Run("check --no-cache a.xml").err, "");
  EXPECT_EQ(Run("check --no-cache a.xml").status, 0);
  EXPECT_FALSE(Holds(Run("check --no-cache --format json a.xml").out, "\"cache\""));
  EXPECT_TRUE(Holds(Run("check --format json a.xml").out, R"("used": false)"));
  EXPECT_EQ(Run("cache --remove a.xml").out, "a.xml: Cache/a.vexb: removed\n");
  EXPECT_EQ(Shell("ls Cache").out, "") << "nor is there a stamp";
  EXPECT_EQ(Shell("mv b.xml b.paper.XML; aldermoor cache b.paper.XML").out,
            "b.paper.XML: Cache/b.paper.vexb: not used: absent\n");
}

}  // namespace
}  // namespace Aldermoor::Tool
