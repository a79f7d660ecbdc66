#include "aldermoor/vexdoc/loadoptions.h"

#include <gtest/gtest.h>

#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/internals/loadnotes.h"
#include "aldermoor/vexdoc/internals/xercesadapter.h"
#include "aldermoor/vexdoc/recipe.h"
#include "aldermoor/vexdoc/spectrum.h"
#include "aldermoor/vexdoc/vexexception.h"
#include "aldermoor/vexdoc/wavelengthrange.h"

#include "tests/vexdoc/internals/loadsupport.h"

namespace Aldermoor::Vexdoc::Testing {
namespace {

constexpr const char* kMin = "Physical.WavelengthSpectrumMin";
constexpr const char* kMax = "Physical.WavelengthSpectrumMax";
constexpr const char* kCount = "Physical.NumberOfDataPointsSpectrum";

// A document with one spectrum of the values 0, 1, 2 ... at `points`; a condition without text is
// not there.
struct Case {
  const char* what;
  std::vector<int> points;
  const char* min;
  const char* max;
  const char* count;
  bool is_legacy;
  bool agrees;
  const char* completed;  // the range behind kComplete; empty if that refuses too

  std::string Text() const {
    std::string text = is_legacy ? "<VEX>" : "<VEX Version='1.0'>";
    text +=
        "<Name/><SampleSet><Name>S</Name><Sample><Name>x</Name><SampleAttribute>"
        "<Spectrum Conditions='1'>";
    int value = 0;
    for (const int point : points) {
      text += "<Value Name='" + std::to_string(point) + "'>" + std::to_string(value++) + "</Value>";
    }
    text +=
        "</Spectrum></SampleAttribute></Sample></SampleSet><Conditions><ID>1</ID>"
        "<A N='Physical.SpectrumType'>Remission</A>";
    for (const auto& [key, content] : {std::pair(kMin, min), {kMax, max}, {kCount, count}}) {
      text += *content == '\0' ? "" : "<A N='" + std::string(key) + "'>" + content + "</A>";
    }
    return text + "</Conditions></VEX>";
  }
};

std::vector<int> Steps(int first, int step, int count) {
  std::vector<int> points;
  for (int i = 0; i < count; ++i) {
    points.push_back(first + i * step);
  }
  return points;
}

const std::vector<Case> kCases = {
    {"as told", Steps(380, 10, 36), "380nm", "730nm", "36", false, true, "36 380nm 730nm"},
    {"unsorted", {600, 500, 400}, "400nm", "600nm", "3", false, true, "3 400nm 600nm"},
    {"truncated step", Steps(400, 33, 4), "400nm", "500nm", "4", false, true, "4 400nm 500nm"},
    {"blanks and signs", {400, 410}, " +0400", "410.5 nm", "2", false, true, "2  +0400 410.5 nm"},
    {"one point", {500}, "500nm", "900nm", "1", false, true, "1 500nm 900nm"},
    {"the default", Steps(380, 10, 36), "", "", "36", false, true, "36 380nm 730nm"},
    {"shifted", Steps(400, 10, 31), "380nm", "680nm", "31", false, false, "31 400nm 700nm"},
    {"36 elsewhere", Steps(400, 10, 36), "380nm", "730nm", "36", false, false, "36 400nm 750nm"},
    {"36 without a range", Steps(400, 10, 36), "", "", "36", false, false, "36 400nm 750nm"},
    {"uneven", {380, 400, 410, 730}, "380nm", "730nm", "4", false, false, ""},
    {"reversed", Steps(380, 10, 36), "730nm", "380nm", "36", false, false, "36 380nm 730nm"},
    {"negative", {-10, 0, 10}, "-10nm", "10nm", "3", false, false, ""},
    {"beyond", {40000, 40001}, "380nm", "730nm", "2", false, false, ""},
    {"legacy", Steps(400, 10, 31), "380nm", "680nm", "", true, false, "31 400nm 700nm"},
    {"legacy count", Steps(400, 10, 31), "400nm", "700nm", "36", true, true, "31 400nm 700nm"},
    {"legacy unknown", Steps(400, 10, 31), "Undefined", "", "", true, false, "31 400nm 700nm"},
};

const Spectrum& SpectrumIn(const VEX& document) {
  return dynamic_cast<const Spectrum&>(
      *document.FindSample("S", "x")->GetElements().front().second);
}

std::string RangeOf(const VEX& document) {
  const auto conditions = SpectrumIn(document).GetConditions();
  return conditions->GetAttribute(kCount, "") + " " + conditions->GetAttribute(kMin, "") + " " +
         conditions->GetAttribute(kMax, "");
}

LoadReport LoadWith(VEX& document, const std::string& text, const LoadOptions& options) {
  std::istringstream in(text);
  return document.Load(in, options);
}

LoadOptions Use(WavelengthUse use) {
  LoadOptions options;
  options.wavelengths = use;
  return options;
}

TEST(LoadOptionsTest, WavelengthsOtherThanThoseOfTheConditionsAreRefusedOrTold) {
  for (const Case& one : kCases) {
    VEX document("earlier");
    const LoadReport report = LoadWith(document, one.Text(), Use(WavelengthUse::kReport));
    EXPECT_EQ(report.contradiction_count, one.agrees ? 0U : 1U) << one.what;
    EXPECT_EQ(SpectrumIn(document).GetData().size(), one.points.size()) << one.what;
    VEX kept("earlier");
    try {
      LoadWith(kept, one.Text(), {});
      EXPECT_TRUE(one.agrees) << one.what;
    } catch (const WavelengthException& e) {
      EXPECT_FALSE(one.agrees) << one.what;
      EXPECT_NE(std::string(e.what()).find("set 'S', sample 'x': "), std::string::npos);
      EXPECT_EQ(kept.GetName(), "earlier") << "the document stays as it was";
    }
    EXPECT_NO_THROW(LoadText(document, one.Text())) << "the plain load is as told";
  }
}

// Their values would stand elsewhere; several of them may be read as one.
TEST(LoadOptionsTest, WavelengthsThatSayOtherThanWhatIsReadAreRefusedAndNoRangeIsTakenFromThem) {
  const std::pair<const char*, bool> texts[] = {
      {"380.9", false}, {"379.99", false}, {"3.8e2", false}, {"0.38um", false}, {"380 um", false},
      {"380.0", true},  {"380nm", true},   {" 380", true},   {"+380", true}};
  for (const auto& [text, is_exact] : texts) {
    for (const char* const version : {"", " Version='1.0'"}) {
      const std::string value = std::string("<Value Name='") + text + "'>0.5</Value>";
      const std::string spectrum = "<Spectrum Conditions='1'>" + value + "</Spectrum>";
      const std::string read = std::to_string(std::stoul(text));
      const std::string document_text =
          std::string("<VEX") + version +
          "><Name/><SampleSet><Name>S</Name><Sample><Name>x</Name>" + "<SampleAttribute>" +
          spectrum +
          "</SampleAttribute></Sample></SampleSet><Conditions><ID>1</ID>"
          "<A N='Physical.NumberOfDataPointsSpectrum'>1</A><A N='Physical.SpectrumType'>Flash</A>"
          "<A N='Physical.WavelengthSpectrumMin'>" +
          read + "nm</A><A N='Physical.WavelengthSpectrumMax'>730nm</A></Conditions></VEX>";
      for (const WavelengthUse use : {WavelengthUse::kRefuse, WavelengthUse::kComplete}) {
        VEX document;
        if (is_exact) {
          EXPECT_NO_THROW(LoadWith(document, document_text, Use(use))) << text;
        } else {
          EXPECT_THROW(LoadWith(document, document_text, Use(use)), WavelengthException) << text;
        }
      }
      VEX document;
      EXPECT_EQ(LoadWith(document, document_text, Use(WavelengthUse::kReport)).contradiction_count,
                is_exact ? 0U : 1U)
          << text;
    }
  }
}

TEST(LoadOptionsTest, RangeIsTakenFromPointsWithOneStepAndSurvivesASave) {
  for (const Case& one : kCases) {
    VEX document;
    const std::string expected = one.completed;
    try {
      LoadWith(document, one.Text(), Use(WavelengthUse::kComplete));
      EXPECT_EQ(RangeOf(document), expected) << one.what;
    } catch (const WavelengthException&) {
      EXPECT_EQ(expected, "") << one.what;
      continue;
    }
    // A file of the current dialect may name another number of points, too.
    std::ostringstream out;
    document.Store(out);
    VEX again;
    EXPECT_NO_THROW(LoadWith(again, out.str(), {})) << one.what;
    EXPECT_EQ(SpectrumIn(again).GetData(), SpectrumIn(document).GetData()) << one.what;
  }
  Case short_of_points = kCases[6];
  short_of_points.count = "36";
  VEX document;
  EXPECT_THROW(LoadWith(document, short_of_points.Text(), {}), VexException);
  const LoadReport report =
      LoadWith(document, short_of_points.Text(), Use(WavelengthUse::kComplete));
  EXPECT_EQ(report.ranges_taken.at("31 from 400nm to 700nm"), 1U);
  EXPECT_EQ(RangeOf(document), "31 400nm 700nm");
}

TEST(LoadOptionsTest, IlluminantsStandAt380To730OrInTheRangeOfTheirBlock) {
  for (const auto& [first, agrees] : {std::pair(380, true), {400, false}, {390, true}}) {
    std::string text = "<VEX Version='1'><Name/><Conditions><ID>1</ID><Spectrum>";
    for (const int point : Steps(first, 10, 36)) {
      text += "<Value Name='" + std::to_string(point) + "'>1</Value>";
    }
    text += "</Spectrum><A N='" + std::string(kMin) + "'>390</A><A N='" + kMax +
            "'>740</A></Conditions></VEX>";
    VEX document;
    EXPECT_EQ(LoadWith(document, text, Use(WavelengthUse::kReport)).contradiction_count,
              agrees ? 0U : 1U)
        << first;
  }
}

const char* const kUndated =
    "<VEX Version='1'><Name/><SampleSet><Name>S</Name><Created>c</Created><Sample><Name>x</Name>"
    "<SampleAttribute><Recipe Conditions='1'><Modified>m</Modified></Recipe></SampleAttribute>"
    "<SampleAttribute><Gloss Conditions='1'/></SampleAttribute>"
    "</Sample></SampleSet><Conditions><ID>1</ID></Conditions></VEX>";

std::string DatesOf(const Header& element) {
  return element.GetCreationDateTime() + "," + element.GetModificationDateTime() + ";";
}

TEST(LoadOptionsTest, NoDateIsThereThatTheFileDoesNotHold) {
  VEX document("earlier");
  LoadWith(document, kUndated, {});
  const auto set = document.GetSampleSet("S");
  const auto sample = document.FindSample("S", "x");
  EXPECT_EQ(DatesOf(document) + DatesOf(*set) + DatesOf(*sample) +
                DatesOf(*sample->GetElements().front().second) +
                DatesOf(*sample->GetElements().back().second),
            ",;c,;,;,m;,;");
  LoadText(document, kUndated);
  EXPECT_NE(document.GetCreationDateTime(), "") << "the plain load is as told";
}

TEST(LoadOptionsTest, LoadIsExactIfNothingInTheDocumentIsOfItsOwnMaking) {
  const std::string dated =
      "<VEX Version='1'><Name/><Created>c</Created><Modified>m</Modified></VEX>";
  const auto is_exact = [](const std::string& text, const LoadOptions* options) {
    VEX document;
    LoadReport report;
    Internals::XercesAdapter adapter(&document);
    if (options != nullptr) {
      adapter.SetOptions(*options, report);
    }
    std::istringstream in(text);
    adapter.Load(in);
    return adapter.WasExact();
  };
  const LoadOptions report = Use(WavelengthUse::kReport);
  EXPECT_TRUE(is_exact(dated, nullptr));
  EXPECT_FALSE(is_exact(kUndated, nullptr));
  EXPECT_TRUE(is_exact(kUndated, &report));
  EXPECT_FALSE(is_exact(kCases[6].Text(), &report));
}

TEST(CompletionTest, MissingConditionsAreTakenWhereTheyAreMissingOnly) {
  const auto color = [](const char* type) {
    return "<SampleAttribute><ColorVector Conditions='" + std::string(type) +
           "'><Value Name='a'>1</Value><Value Name='b'>2</Value><Value Name='c'>3</Value>"
           "</ColorVector></SampleAttribute>";
  };
  std::string text = Case(kCases[13]).Text();
  text.insert(text.find("</Sample>"), color("CIELab") + color("RGB") + color("CIEXYZ"));
  text.insert(text.find("<Conditions>"),
              "<Conditions><ID>CIELab</ID><A N='ColorSpaceDescription.Type'>CIELab</A></Conditions>"
              "<Conditions><ID>RGB</ID><A N='ColorSpaceDescription.Type'>RGB</A></Conditions>"
              "<Conditions><ID>CIEXYZ</ID><A N='ColorSpaceDescription.Type'>CIEXYZ</A>"
              "<A N='Colorimetric.Observer'>TenDegree</A></Conditions>");
  VEX document;
  LoadOptions options = Use(WavelengthUse::kComplete);
  options.completion =
      Completion{{{"Physical.SpectrumType", "Flash"}}, {{"Colorimetric.Observer", "TwoDegree"}}};
  LoadReport report = LoadWith(document, text, options);
  ASSERT_EQ(report.completion.missing_count, 2U);
  EXPECT_EQ(report.completion.missing[0].sample, "x");
  EXPECT_EQ(report.completion.missing[0].keys,
            std::vector<std::string>{"Colorimetric.Illumination"});
  options.completion->colors["Colorimetric.Illumination"] = "A";
  report = LoadWith(document, text, options);
  EXPECT_EQ(report.completion.missing_count, 0U);
  EXPECT_EQ(report.completion.spectra.size(), 0U) << "a type that is named stays";
  EXPECT_EQ(report.completion.colors.at("Colorimetric.Illumination"), 2U) << "RGB needs none";
  EXPECT_EQ(report.completion.colors.at("Colorimetric.Observer"), 1U);
  std::ostringstream out;
  document.Store(out);
  EXPECT_NO_THROW(LoadWith(document, out.str(), {}));
}

TEST(WavelengthRangeTest, NanometresAreReadAsASaveReadsThem) {
  const std::pair<const char*, std::optional<int>> cases[] = {
      {"380nm", 380},
      {" 400", 400},
      {"400.5 nm", 400},
      {"0400", 400},
      {"+400", 400},
      {"4e2", 4},
      {"-5nm", -5},
      {"nm", std::nullopt},
      {"", std::nullopt},
      {"40000", std::nullopt},
      {"Undefined", std::nullopt},
  };
  for (const auto& [text, expected] : cases) {
    EXPECT_EQ(NanometresOf(text), expected) << text;
  }
}

TEST(WavelengthRangeTest, ColorsAreOnlyComputedOfSpectraOnTheMeasuringGrid) {
  Conditions request;
  request.AddAttribute("ColorSpaceDescription.Type", "CIELab");
  request.AddAttribute("Colorimetric.Illumination", "D50");
  request.AddAttribute("Colorimetric.Observer", "TwoDegree");
  Conditions conditions;
  conditions.AddAttribute(kCount, "36");
  conditions.AddAttribute("Physical.SpectrumType", "Remission");
  conditions.AddAttribute(kMin, "400nm");
  conditions.AddAttribute(kMax, "750nm");
  Sample sample("x");
  const auto add = [&sample](SampleAttribute* attribute) {
    sample.AddSampleAttribute(Utilities::Tools::SmartPointer<SampleAttribute>(attribute));
  };
  add(new Spectrum(conditions, std::vector<float>(36, 0.5F)));
  EXPECT_NE(GridFault(sample, request).find("from 400nm to 750nm"), std::string::npos);
  add(new ColorVector(request, std::vector<float>{50, 0, 0}));
  EXPECT_EQ(GridFault(sample, request), "") << "the stored colour counts";
  conditions.AddAttribute(kMin, "380 nm");
  conditions.AddAttribute(kMax, "730");
  EXPECT_TRUE(IsOnMeasuringGrid(Spectrum(conditions, std::vector<float>(36))));
}

}  // namespace
}  // namespace Aldermoor::Vexdoc::Testing
