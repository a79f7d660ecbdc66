#include "aldermoor/vexdoc/inspection.h"

#include <gtest/gtest.h>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/vexdoc/internals/binaryloader.h"
#include "aldermoor/vexdoc/internals/conditionmanager.h"

#include "tests/vexdoc/internals/loadsupport.h"
#include "tests/vexdoc/internals/writesupport.h"

namespace Aldermoor::Vexdoc::Testing {
namespace {

using Check = std::vector<Fault> (*)(std::istream&);

// A line for each fault, its place in front: line and column, or the offset in hexadecimal.
std::string Told(Check check, const std::string& bytes) {
  std::istringstream in(bytes);
  std::ostringstream out;
  for (const Fault& fault : check(in)) {
    fault.line > 0 ? out << fault.line << ':' << fault.column : out << std::hex << fault.offset;
    out << (fault.severity == Fault::Severity::kError ? " error: " : " warning: ") << fault.text
        << '\n';
  }
  return out.str();
}

bool HasError(const std::string& told) {
  return told.find(" error: ") != std::string::npos;
}

bool LoadFails(Check check, const std::string& bytes) try {
  std::istringstream in(bytes);
  const bool is_cache = check == static_cast<Check>(&CheckCache);
  is_cache ? void(Internals::BinaryLoader(in).Load()) : VEX().Load(in);
  return false;
} catch (const std::exception&) {
  return true;
}

void ExpectTheVerdictOfTheLoader(Check check, const std::string& bytes) {
  ASSERT_FALSE(HasError(Told(check, bytes)));
  for (std::size_t i = 0; i < bytes.size(); ++i) {
    ASSERT_EQ(HasError(Told(check, bytes.substr(0, i))), LoadFails(check, bytes.substr(0, i)));
    for (const char byte : {'\0', '\xFF', '2'}) {
      std::string damaged = bytes;
      damaged[i] = byte;
      ASSERT_EQ(HasError(Told(check, damaged)), LoadFails(check, damaged)) << byte << " at " << i;
    }
  }
}

TEST(XmlCheckTest, ErrorsAreToldOfExactlyTheFilesThatDoNotLoad) {
  for (const std::string folder : {"legal", "illegal"}) {
    for (const std::string& stem : XmlFiles(folder)) {
      const std::string text = ReadFile(DataFile(folder, stem + ".xml"));
      EXPECT_EQ(HasError(Told(&CheckXML, text)), LoadFails(&CheckXML, text)) << stem;
    }
  }
}

TEST(DamageCheckTest, ErrorsAreToldOfExactlyTheDamagesThatDoNotLoad) {
  const std::string text = ReadFile(DataFile("legal", "all_kinds.xml"));
  ExpectTheVerdictOfTheLoader(&CheckXML, text);
  VEX document;
  LoadText(document, text);
  ExpectTheVerdictOfTheLoader(&CheckCache, CacheOf(document));
}

// With one block for spectra of a point and one for colours, both in use.
const std::string kDocument =
    "<VEX Version='1.0'><Name/><SampleSet><Name/><Sample><Name/><SampleAttribute>"
    "<Recipe Conditions='1'/></SampleAttribute><SampleAttribute><Recipe Conditions='2'/>"
    "</SampleAttribute></Sample></SampleSet><Conditions><ID>1</ID>"
    "<A N='Physical.NumberOfDataPointsSpectrum'>1</A><A N='Physical.SpectrumType'>R</A>"
    "<A N='Physical.WavelengthSpectrumMin'>380</A></Conditions><Conditions><ID>2</ID>"
    "<A N='ColorSpaceDescription.Type'>CIELab</A></Conditions>\n";

TEST(XmlCheckTest, EveryFaultIsToldAtItsElement) {
  const std::string cases[][2] = {
      {R"(<!-- -->  <SampleSet/>
<SampleSet><Name>a</Name><Sample><Name>b</Name></Sample><Sample><Name>b</Name><SampleAttribute/>
<SampleAttribute><VEXSample/></SampleAttribute>
<SampleAttribute><Gloss A='1'/><Recipe/></SampleAttribute>
<SampleAttribute><Recipe Conditions='9'><Thickness>1,5</Thickness>
<Components><C/><C N='a'>nan</C></Components></Recipe></SampleAttribute>
<SampleAttribute><Spectrum Conditions='1'><Value Name='1'> +.5 </Value><Value Name='x'>1</Value>
<Value>1</Value><Value Name='1nm'>9e99</Value></Spectrum></SampleAttribute><SampleAttribute>
<ColorVector Conditions='2'><Value Name='a'/></ColorVector></SampleAttribute></Sample></SampleSet>
)",
       R"(1:1 warning: a comment is not kept
1:199 warning: the conditions of a spectrum lack the mandatory 'Physical.WavelengthSpectrumMax'
2:11 warning: there is a sample set '' already; only the first one is found by that name
2:11 error: 'SampleSet' has no 'Name'
3:57 warning: there is a sample 'b' already; only the first one is found by that name
3:79 error: 'SampleAttribute' holds no element
4:18 error: 'VEXSample' cannot stand in a 'SampleAttribute'
5:18 error: 'Gloss' has no attribute 'Conditions'
5:32 warning: 'Recipe' is not read: only the first element of a 'SampleAttribute' is
6:18 error: links to conditions '9', which the document does not declare
6:41 warning: '1,5' is no number; it is read as 1
7:13 warning: the component is not read: it has no name
7:17 warning: 'nan' is no number; it is read as 0
8:72 error: the wavelength 'x' is no number
9:1 warning: 'Value' is not read: its first attribute is not 'Name'
9:17 warning: '9e99' is out of the range of a float; it is read as 3.4028235e+38
9:17 warning: the wavelength '1nm' is read as 1
9:17 warning: the wavelength 1 is given again; the first one counts
10:1 error: the conditions of a colour lack the mandatory 'Colorimetric.Illumination'
10:1 error: the conditions of a colour lack the mandatory 'Colorimetric.Observer'
10:1 error: Inconsistent ColorVector-size(expected 3 but got 1 elements for colorspace CIELab)
10:29 warning: there is no number; it is read as 0
)"},
      {R"(<Conditions/><Conditions><ID>2</ID><A/><A N='k'>a<!-- -->b</A>
<A N='k'/><Spectrum/></Conditions><Conditions><ID>3</ID></Conditions>)",
       R"(2:1 error: the conditions have no 'ID'
2:14 warning: conditions '2' are declared again; the last ones count
2:36 warning: 'A' is not read: it names no condition
2:40 warning: a comment is not kept
2:40 warning: the text of 'A' is read up to the first element, comment or CDATA section only
3:1 warning: the condition 'k' is given again; the last one counts
3:11 error: the illumination has 0 different wavelengths instead of 36
3:35 warning: no attribute links to the conditions '3'; a save drops them
)"},
  };
  for (const auto& [content, told] : cases) {
    EXPECT_EQ(Told(&CheckXML, kDocument + content + "</VEX>"), told) << content;
  }
}

TEST(XmlCheckTest, WhatNoDocumentHoldsIsALoss) {
  // Each is put into the sample of an otherwise good document.
  const std::string cases[][2] = {
      {"<!-- -->", "a comment is not kept"},
      {"<?x y?>", "the processing instruction 'x' is not kept"},
      {"text", "the text in 'Sample' is not read"},
      {"<![CDATA[text]]>", "the text in 'Sample' is not read"},
      {"<Creator><![CDATA[me]]></Creator>",
       "the text of 'Creator' is read up to the first element, comment or CDATA section only"},
      {"<Creator lang='de'>me</Creator>", "the attribute 'lang' of 'Creator' is not read"},
      {"<AdditionalData><Value Name='a' Unit='b'/></AdditionalData>",
       "of the attributes of 'Value' only 'Name' is kept"},
      {"<AdditionalData><Value Name='a'>1</Value><Value Name='a'>2</Value></AdditionalData>",
       "'a' is given again; the last one counts"},
      {"<AdditionalData><Value Name='Creator'>1</Value></AdditionalData><Creator>2</Creator>",
       "'Creator' is given again; the last one counts"},
      {"<SampleAttribute><Recipe Conditions='1' Date='x'/></SampleAttribute>",
       "the attribute 'Date' of 'Recipe' is not read"},
      {"<SampleAttribute><Gloss Conditions='1' Zone='x'/></SampleAttribute>",
       "of the attributes of 'Gloss' only 'Conditions' is kept"},
      {"<SampleAttribute><Gloss Angle='60' Conditions='1'/></SampleAttribute>", ""},
      {"<SampleAttribute><Gloss Conditions='1'>\n x<A/></Gloss></SampleAttribute>",
       "the text of 'Gloss' begins with a line feed and is read as empty"},
      {"<SampleAttribute><Spectrum Conditions='1'><Value Name='380.5'>1</Value></Spectrum>"
       "</SampleAttribute>",
       "the wavelength '380.5' is read as 380"},
  };
  for (const auto& [content, told] : cases) {
    std::istringstream in("<VEX Version='1.0'><Name/><SampleSet><Name/><Sample><Name/>" + content +
                          kDocument.substr(kDocument.find("<SampleAttribute>")) + "</VEX>");
    std::string losses;
    for (const Fault& fault : CheckXML(in)) {
      losses += fault.loss == Fault::Loss::kContent ? fault.text : "";
    }
    EXPECT_EQ(losses, told) << content;
  }
}

// A document with one colour.
std::string ColorXml(const std::string& version, const std::string& space,
                     const std::vector<std::string>& labels) {
  std::string text = "<VEX" + version +
                     "><Name/><SampleSet><Name/><Sample><Name/><SampleAttribute><ColorVector "
                     "Conditions='1'>";
  for (const std::string& label : labels) {
    text += "<Value Name=\"" + label + "\">1</Value>";
  }
  return text +
         "</ColorVector></SampleAttribute></Sample></SampleSet><Conditions><ID>1</ID>"
         "<Attribute Name='ColorSpaceDescription.Type'>" +
         space +
         "</Attribute><Attribute Name='Colorimetric.Illumination'>D50</Attribute>"
         "<Attribute Name='Colorimetric.Observer'>TwoDegree</Attribute></Conditions></VEX>";
}

TEST(ColorCheckTest, LabelsOtherThanThoseOfTheColorSpaceAreTold) {
  const struct {
    std::string space;
    std::vector<std::string> labels;
    bool is_own;
  } cases[] = {
      {"CIELab", {"L*", "a*", "b*"}, true},
      {"CIELab", {"delta L*", "delta a*", "delta b*"}, true},
      {"CIELab", {"b*", "a*", "L*"}, false},
      {"CIELab", {"L*", "a*", "delta b*"}, false},
      {"CIELab", {"X", "Y", "Z"}, false},
      {"CIELab", {"l*", "a*", "b*"}, false},
      {"CIELab", {"", "", ""}, false},
      {"CIEXYZ", {"X", "Y", "Z"}, true},
      {"CIEXYZ", {"L*", "a*", "b*"}, false},
      {"RGB", {"B", "G", "R"}, false},
      {"CMYK", {"C", "M", "Y", "K"}, true},
      {"CMYK", {"delta C", "delta M", "delta Y", "delta K"}, true},
      {"CMYK", {"K", "C", "M", "Y"}, false},
  };
  for (const auto& one : cases) {
    for (const std::string version : {"", " Version='1.0'"}) {
      const std::string text = ColorXml(version, one.space, one.labels);
      std::istringstream in(text);
      const std::vector<Fault> faults = CheckXML(in);
      ASSERT_EQ(faults.size(), one.is_own ? 0U : 1U) << text;
      if (!one.is_own) {
        EXPECT_EQ(faults[0].severity, Fault::Severity::kWarning);
        EXPECT_EQ(faults[0].loss, version.empty() ? Fault::Loss::kContent : Fault::Loss::kLabels);
      }
    }
    std::istringstream in(ColorXml(" Version='1.0'", one.space, one.labels));
    VEX document;
    document.Load(in);
    EXPECT_EQ(Told(&CheckCache, CacheOf(document)).empty(), one.is_own)
        << one.space << one.labels[0];
  }
  EXPECT_EQ(Told(&CheckXML, ColorXml("", "CIELab", {"b*", "a*", "L*"})),
            "1:63 warning: the channels are labelled 'b*', 'a*', 'L*' but count by position, as "
            "'L*', 'a*', 'b*'\n");
  EXPECT_EQ(Told(&CheckXML, ColorXml(" Version='1'", "Paint", {"b*", "a*"})), "")
      << "the labels are all that names its channels";
  EXPECT_EQ(Told(&CheckXML, ColorXml(" Version='1'", "Undefined", {"b*", "a*", "x"})), "");
}

TEST(XmlCheckTest, WavelengthsOtherThanThoseOfTheConditionsAreToldBesideTheErrors) {
  const auto told = [](const char* point) {
    std::string text = kDocument;
    text.insert(text.find("</Sample>"), "<SampleAttribute><Spectrum Conditions='1'><Value Name='" +
                                            std::string(point) +
                                            "'>1</Value></Spectrum></SampleAttribute>");
    return Told(&CheckXML, text + "</VEX>");
  };
  EXPECT_EQ(told("380").find("points at"), std::string::npos);
  EXPECT_NE(told("390").find("warning: 1 point at 390 nm, but the conditions say from '380' to 730 "
                             "(not named)"),
            std::string::npos)
      << told("390");
}

TEST(XmlCheckTest, FaultsThatAreAlikeAreCounted) {
  std::string text = "<VEX Version='1'><Name/>";
  for (int i = 0; i < 1000; ++i) {
    text += "<SampleSet><Name>" + std::to_string(i / 2) + "</Name></SampleSet>";
  }
  std::istringstream in(text + "</VEX>");
  const std::vector<Fault> faults = CheckXML(in);
  ASSERT_EQ(faults.size(), 10U);
  EXPECT_EQ(faults.front().repeats, 0U);
  EXPECT_EQ(faults.back().repeats, 490U);
}

TEST(XmlCheckTest, CheckLeavesNoConditionsBehind) {
  auto& manager = Internals::ConditionManager::GetInstance();
  const int id = std::stoi(manager.NewConditions()->GetID());
  Told(&CheckXML, ReadFile(DataFile("legal", "conditions.xml")));
  EXPECT_EQ(std::stoi(manager.NewConditions()->GetID()), id + 1);
}

TEST(XmlCheckTest, FileThatCannotBeReadIsAnExceptionWithTheReason) try {
  CheckXML(Utilities::FileSystem::File("/none.xml"));
  FAIL();
} catch (const Utilities::Exceptions::ResourceNotAvailableException& e) {
  EXPECT_STREQ(e.what(), "file '/none.xml' cannot be read: No such file or directory");
}

std::string N(char value) {
  return {value, '\0', '\0', '\0'};
}

std::string T(const std::string& text) {
  return N(static_cast<char>(text.size())) + text;
}

const std::string kHead = N(5) + T("VEX Binary File\n") + T("VEX") + N(0);
const std::string kSample =  // 0x4e bytes
    kHead + N(1) + T("SampleSet") + N(0) + N(1) + T("Sample") + N(0) + N(1);

TEST(CacheCheckTest, EveryFaultIsToldAtItsField) {
  const std::string block = T("1") + N(3) + T("Physical.NumberOfDataPointsSpectrum") + T("2") +
                            T("Physical.SpectrumType") + T("") +
                            T("Physical.WavelengthSpectrumMax") + T("") + N(0);
  std::string deep = T("") + N(0) + T("1");
  for (int i = 0; i < 257; ++i) {
    deep += T("") + T("") + N(0) + N(1);
  }
  const std::string cases[][2] = {
      {"", "0 error: the file ends inside a number: version\n"},
      {N(4), "0 error: version 4 of the format instead of 5\n"},
      {N(5) + T("?") + T("Vex") + N(0) + N(0) + N(0) + "rest",
       R"(4 warning: the magic text is another one
9 warning: the root is 'Vex' instead of 'VEX'
1c warning: 4 bytes behind the table of conditions
)"},
      {kHead + N(2) + T(""), "23 error: 2 sample sets cannot be in the 4 bytes that follow\n"},
      {kSample + deep, "105b error: data trees nest deeper than 256 levels\n"},
      {kSample + T("Spectrum") + N(0) + T("1") + N(0) + N(2) + block + T("2") + N(2) + T("b") +
           T("") + T("b") + T("") + N(7) + N(0),
       R"(4e warning: 0 points instead of the 2 of its conditions
6b warning: the conditions of a spectrum lack the mandatory 'Physical.WavelengthSpectrumMin'
e7 warning: no attribute links to the conditions '2'
f9 warning: the key 'b' is given again; the last one counts
102 warning: the sign of an illumination is 7 instead of 1
106 warning: the illumination has 0 points instead of 36
)"},
      {kSample + T("Recipe") + N(0) + T("1") + T("") + N(0) + T("") + N(0) + N(0),
       "4e error: links to conditions '1', which the table does not declare\n"},
  };
  for (const auto& [bytes, told] : cases) {
    EXPECT_EQ(Told(&CheckCache, bytes), told);
    EXPECT_EQ(HasError(told), LoadFails(&CheckCache, bytes)) << told;
  }
}

TEST(CacheDumpTest, ValuesStandFourToALineWithTheirPlaces) {
  std::istringstream in(kSample + T("Spectrum") + N(0) + T("") + N(6) + std::string(18, '\0') +
                        "\xC0\x3F" + N(0));
  std::ostringstream out;
  EXPECT_FALSE(DumpCache(in, out));
  EXPECT_NE(out.str().find("    values 4 to 5: 1.5 0\n"), std::string::npos) << out.str();
}

}  // namespace
}  // namespace Aldermoor::Vexdoc::Testing
