// Everything that the check of a document passes comes back, and everything that it refuses does
// not: over generated documents, and case by case.

#include <fstream>
#include <limits>
#include <random>

#include <gtest/gtest.h>

#include "aldermoor/vexdoc/inspection.h"
#include "aldermoor/vexdoc/internals/conditionmanager.h"
#include "aldermoor/vexdoc/loadoptions.h"
#include "aldermoor/vexdoc/recipe.h"
#include "aldermoor/vexdoc/unknownsampleattribute.h"

#include "tests/vexdoc/internals/documentcontent.h"
#include "tests/vexdoc/internals/loadsupport.h"
#include "tests/vexdoc/internals/writesupport.h"
#include "tests/vexdoc/support.h"

namespace Aldermoor::Vexdoc::Testing {
namespace {

using namespace Vexdoc::Tests;

constexpr char kMinKey[] = "Physical.WavelengthSpectrumMin";
constexpr char kMaxKey[] = "Physical.WavelengthSpectrumMax";
constexpr char kCountKey[] = "Physical.NumberOfDataPointsSpectrum";

SmartPointer<Conditions> OwnBlock(const Conditions& content, const std::string& id = "0") {
  return SmartPointer<Conditions>(new Conditions(id, content));
}

SmartPointer<DataTree> Tree(const std::string& name, const std::string& value = "") {
  return SmartPointer<DataTree>(new DataTree(DataItem(name, value)));
}

SmartPointer<SampleAttribute> Unknown(const SmartPointer<DataTree>& tree) {
  SmartPointer<SampleAttribute> attribute(new UnknownSampleAttribute(tree));
  attribute->SetConditions(OwnBlock(With({{"unknown", "1"}})));
  return attribute;
}

VEX DocumentOf(const std::vector<SmartPointer<SampleAttribute>>& attributes) {
  VEX document("d");
  document.AddSample("s", Sample("t"));
  for (const auto& attribute : attributes) {
    document.FindSample("s", "t")->AddSampleAttribute(attribute);
  }
  return document;
}

// How a document fails to come back from XML in another process, which has no blocks yet; empty if
// it does not.
std::string LossOf(const VEX& document) {
  try {
    const std::string xml = XmlOf(document);
    Internals::ConditionManager::GetInstance().RemoveAllConditions(false);
    VEX again;
    std::istringstream in(xml);
    again.Load(in, LoadOptions());  // as program and Python do
    return ContentOf(again) == ContentOf(document) ? "" : "comes back as\n" + ContentOf(again);
  } catch (const std::exception& e) {
    return e.what();
  }
}

std::string FaultsOf(const VEX& document) {
  std::string text;
  for (const DocumentFault& fault : CheckDocument(document)) {
    text += fault.GetText() + "\n";
  }
  return text;
}

/// Documents in which anything may be wrong, and in most of which little is.
class Generator {
 public:
  explicit Generator(unsigned seed) : random_(seed) {}

  VEX Document() {
    VEX document(Text());
    Annotate(document);
    for (int sets = Below(3); sets > 0; --sets) {
      const SmartPointer<SampleSet> set(new SampleSet(Text()));
      Annotate(*set);
      document.AddElement(set);
      for (int samples = Below(3); samples > 0; --samples) {
        const SmartPointer<Sample> sample(new Sample(Text()));
        Annotate(*sample);
        set->AddElement(sample);
        for (int attributes = Below(4); attributes > 0; --attributes) {
          sample->AddSampleAttribute(Attribute());
        }
      }
    }
    return document;
  }

 private:
  int Below(int end) { return static_cast<int>(random_() % static_cast<unsigned>(end)); }
  bool Seldom() { return Below(80) == 0; }

  template <class T, std::size_t N>
  const T& OneOf(const T (&choices)[N]) {
    return choices[static_cast<std::size_t>(Below(N))];
  }

  std::string Text() {
    static const std::string good[] = {"",         "plain",    "a b",          "  ",
                                       "\xC3\xA9", "\r\n",     "]]>",          "<&>'",
                                       "\x7F",     "\xC2\x85", "\xE2\x80\xA8", "\xF0\x9F\x98\x80",
                                       "x\n y",    "0",        "\t\"",         "\xEF\xBB\xBF"};
    static const std::string bad[] = {"a\x01",        "\xFF", std::string("a\0b", 3),
                                      "\xEF\xBF\xBF", "\x1F", "\xED\xA0\x80"};
    return Seldom() ? OneOf(bad) : OneOf(good);
  }

  float Number() {
    using Limits = std::numeric_limits<float>;
    static const float good[] = {0.0F,    -0.0F,         0.5F,          0.12345678F,
                                 1e30F,   Limits::max(), Limits::min(), Limits::denorm_min(),
                                 -273.15F};
    static const float bad[] = {Limits::quiet_NaN(), Limits::infinity(), -Limits::infinity()};
    return Below(2000) == 0 ? OneOf(bad) : OneOf(good);
  }

  Values Numbers(int count) {
    Values values;
    for (; count > 0; --count) {
      values.push_back(Number());
    }
    return values;
  }

  void Annotate(Header& header) {
    for (const char* const key : {"Description", "Creator", "k", "", "Z", "Value"}) {
      if (Below(6) == 0) {
        header.SetAttribute(key, Text());
      }
    }
  }

  SmartPointer<SampleAttribute> Attribute() {
    SmartPointer<SampleAttribute> attribute;
    switch (Below(4)) {
      case 0:
        attribute = MakeSpectrum();
        break;
      case 1:
        attribute = MakeColor();
        break;
      case 2:
        attribute = Shared(
            Recipe(With({{"r", "1"}}), Text(), Number(), Text(), {{Text(), Number()}, {"b", 1}}));
        Cover(*attribute, With({{"r", "1"}}));
        break;
      default:
        return MakeUnknown();
    }
    attribute->SetName(Text());
    Annotate(*attribute);
    attribute->SetDerived(Below(10) == 0);
    return attribute;
  }

  // Gives it a block: the shared one, one of its own, or one that another attribute has.
  void Cover(SampleAttribute& attribute, Conditions conditions) {
    if (Below(4) == 0) {
      conditions.AddAttribute("note", Text());
    }
    if (Below(6) == 0) {
      conditions.SetCustomIllumination(Spectrum(SpectrumConditions(), Numbers(Seldom() ? 35 : 36)));
      if (Below(2) == 0 && conditions.HasAttribute(kIlluminationKey)) {
        conditions.AddAttribute(kIlluminationKey, "Userdefined");
      }
    }
    static const std::string ids[] = {"0", "1", "2", "", "x y", "\x01"};
    attribute.SetConditions(Below(2) == 0 ? SharedConditions(conditions)
                                          : OwnBlock(conditions, OneOf(ids)));
    if (Seldom()) {
      attribute.SetConditions(SmartPointer<Conditions>());
    }
  }

  SmartPointer<SampleAttribute> MakeSpectrum() {
    static const int counts[] = {36, 36, 36, 31, 1, 0, 40, 351};
    static const char* const ranges[][2] = {{"380nm", "730nm"}, {"400", "750"}, {"0", "4000"}};
    static const char* const odd[][2] = {{"-5", "400"},      {"730nm", "380nm"}, {"400", "400"},
                                         {"Undefined", "7"}, {"40000", "50000"}, {"400", "403"}};
    const int count = OneOf(counts);
    SmartPointer<SampleAttribute> spectrum = Shared(Spectrum(SpectrumConditions(), Numbers(count)));
    Conditions conditions = SpectrumConditions();
    conditions.AddAttribute(kCountKey, std::to_string(Seldom() ? count + 1 : count));
    if (Seldom()) {
      conditions.AddAttribute(kCountKey, "none");
    }
    const auto& range = Seldom() ? OneOf(odd) : OneOf(ranges);
    conditions.AddAttribute(kMinKey, range[0]);
    conditions.AddAttribute(kMaxKey, range[1]);
    for (const char* const key : {kMinKey, kMaxKey, kCountKey, "Physical.SpectrumType"}) {
      if (Below(20) == 0) {
        conditions.RemoveAttribute(key);
      }
    }
    Cover(*spectrum, conditions);
    return spectrum;
  }

  SmartPointer<SampleAttribute> MakeColor() {
    static const char* const spaces[] = {"CIELab", "CIEXYZ", "CMYK", "RGB", "Own"};
    const std::string space = OneOf(spaces);
    std::vector<std::pair<std::string, float>> channels;
    for (int count = (space == "CMYK" ? 4 : 3) + (Seldom() ? 1 : 0); count > 0; --count) {
      channels.emplace_back(Text(), Number());
    }
    SmartPointer<SampleAttribute> color =
        Seldom() ? Shared(ColorVector()) : Shared(ColorVector(With({{kTypeKey, "Own"}}), channels));
    Conditions conditions = ColorConditions(space.c_str());
    for (const char* const key : {kTypeKey, kIlluminationKey, kObserverKey}) {
      if (Seldom()) {
        conditions.RemoveAttribute(key);
      }
    }
    Cover(*color, conditions);
    return color;
  }

  SmartPointer<SampleAttribute> MakeUnknown() {
    const SmartPointer<DataTree> tree = MakeTree(0);
    if (Below(2) == 0) {
      tree->SetAttribute("Conditions", "1");
    }
    SmartPointer<SampleAttribute> attribute(new UnknownSampleAttribute(tree));
    if (Seldom()) {
      attribute->SetDescription("changed");
    }
    for (const auto& child : tree->GetChildren()) {  // as a load does
      if (child->GetName() == "Name" && attribute->GetName().empty()) {
        attribute->SetName(child->GetValue());
      }
    }
    Cover(*attribute, With({{"u", "1"}}));
    return attribute;
  }

  SmartPointer<DataTree> MakeTree(int depth) {
    static const char* const names[] = {"X", "a:b", "Note", "\xC3\xA9", "_", "xmlns", "Value"};
    static const char* const odd[] = {"",  "1x",   "a b",    "Spectrum", "VEXRecipe",
                                      "<", "\x01", "Sample", "\xFF"};
    const SmartPointer<DataTree> tree = Tree(Seldom() ? OneOf(odd) : OneOf(names), Text());
    if (Seldom()) {
      tree->SetValue("\n" + Text());
    }
    for (int count = Seldom() ? 2 : Below(2); count > 0; --count) {
      static const char* const keys[] = {"A", "Aa", "a:c", "Z", "xml:space", "Name"};
      tree->SetAttribute(Seldom() ? "1" : OneOf(keys), Text());
    }
    for (int children = depth < 3 ? Below(3) : 0; children > 0; --children) {
      tree->AdoptChild(MakeTree(depth + 1));
    }
    if (depth == 0 && Below(4) == 0) {
      tree->AdoptChild(Tree("Name", "n"));
    }
    if (depth == 0 && Seldom()) {
      SmartPointer<DataTree> deepest = tree;
      for (int more = 245 + Below(12); more > 0; --more) {
        const SmartPointer<DataTree> next = Tree("deep");
        deepest->AdoptChild(next);
        deepest = next;
      }
    }
    return tree;
  }

  std::mt19937 random_;
};

TEST(DocumentCheckerTest, WhatItPassesComesBackAndWhatItRefusesDoesNot) {
  constexpr unsigned kDocuments = 4000;
  unsigned passed = 0;
  for (unsigned seed = 0; seed < kDocuments; ++seed) {
    const VEX document = Generator(seed).Document();
    const std::string faults = FaultsOf(document);
    const std::string loss = LossOf(document);
    ASSERT_EQ(faults.empty(), loss.empty())
        << "seed " << seed << "\nfaults: " << faults << "\nloss: " << loss;
    if (faults.empty()) {
      ++passed;
      ASSERT_EQ(ContentOf(*LoadedCache(CacheOf(document))), ContentOf(document)) << seed;
    }
  }
  // Both ways are gone often enough.
  EXPECT_GT(passed, kDocuments / 5);
  EXPECT_LT(passed, kDocuments * 4 / 5);
}

SmartPointer<SampleAttribute> SpectrumUnder(Pairs changes, std::size_t count = 36) {
  Conditions conditions = SpectrumConditions();
  for (const auto& [key, value] : changes) {
    conditions.AddAttribute(key, value);
  }
  Values values(count, 0.5F);
  if (count > 0) {
    values.front() = 0.25F;  // so that the order shows
  }
  return Shared(Spectrum(conditions, values));
}

SmartPointer<SampleAttribute> UnderCurve(Pairs conditions, std::size_t count) {
  Conditions block = With(conditions);
  block.SetCustomIllumination(Spectrum(SpectrumConditions(), Values(count, 1.0F)));
  return Shared(Recipe(block, "", 0.0F, "", {}));
}

SmartPointer<SampleAttribute> UnknownOf(const SmartPointer<DataTree>& tree, const char* key,
                                        const char* value) {
  tree->SetAttribute(key, value);
  return Unknown(tree);
}

SmartPointer<DataTree> Nested(int levels) {
  const SmartPointer<DataTree> root = Tree("X");
  for (SmartPointer<DataTree> deepest = root; levels > 1; --levels) {
    const SmartPointer<DataTree> next = Tree("X");
    deepest->AdoptChild(next);
    deepest = next;
  }
  return root;
}

SmartPointer<DataTree> ManyNames(int count) {
  const SmartPointer<DataTree> root = Tree("n0");
  for (int i = 1; i < count; ++i) {
    root->AdoptChild(Tree("n" + std::to_string(i)));
  }
  return root;
}

SmartPointer<SampleAttribute> Without(SmartPointer<SampleAttribute> attribute, const char* key) {
  Conditions conditions = *attribute->GetConditions();
  conditions.RemoveAttribute(key);
  attribute->SetConditions(SharedConditions(conditions));
  return attribute;
}

struct FaultCase {
  const char* name;
  SmartPointer<SampleAttribute> attribute;
  std::string place;
  const char* reason;
};

std::vector<FaultCase> FaultCases() {
  SmartPointer<SampleAttribute> bare = Shared(Recipe());
  SmartPointer<SampleAttribute> empty = Shared(ColorVector(), "c");
  empty->SetConditions(OwnBlock(With({{kTypeKey, "Own"}})));
  Values nan(36, 1.0F);
  nan[2] = nan[5] = std::numeric_limits<float>::quiet_NaN();
  SmartPointer<SampleAttribute> renamed = Unknown(Tree("X"));
  renamed->SetDescription("changed");
  return {
      {"count", SpectrumUnder({{kCountKey, "31"}}), "Spectrum 1",
       "36 values under conditions that name 31"},
      {"no count", SpectrumUnder({{kCountKey, "many"}}), "Spectrum 1",
       "the number of points in its conditions, 'many', is no number"},
      {"legacy count", Without(SpectrumUnder({}, 31), kCountKey), "Spectrum 1",
       "31 values under conditions that name 36"},
      {"step", SpectrumUnder({{kMinKey, "400nm"}, {kMaxKey, "420nm"}}), "Spectrum 1",
       "36 values from '400nm' to '420nm' would get equal or falling wavelengths: the step is in "
       "whole nm"},
      {"one wavelength", SpectrumUnder({{kMinKey, "400"}, {kMaxKey, "400"}}), "Spectrum 1",
       "36 values from '400' to '400' would get equal or falling wavelengths: the step is in whole "
       "nm"},
      {"falling", SpectrumUnder({{kMinKey, "730nm"}, {kMaxKey, "380nm"}}), "Spectrum 1",
       "36 values from '730nm' to '380nm' would get equal or falling wavelengths: the step is in "
       "whole nm"},
      {"no range", SpectrumUnder({{kMinKey, "Undefined"}}), "Spectrum 1",
       "36 values from 'Undefined' to '730nm', which are no whole wavelengths"},
      {"nan", Shared(Spectrum(SpectrumConditions(), nan), "M0"), "Spectrum 'M0'",
       "value 3 is nan, which is read as 0, and so are 1 more"},
      {"infinity", Shared(Lab(1, std::numeric_limits<float>::infinity(), 3)), "ColorVector 1",
       "channel 'a*' is inf, which is read as 0"},
      {"thickness", Shared(Recipe(With({}), "", -std::numeric_limits<float>::infinity(), "", {})),
       "Recipe 1", "the thickness is -inf, which is read as 0"},
      {"observer", Without(Shared(Lab(1, 2, 3)), kObserverKey), "ColorVector 1",
       "the conditions of a colour lack the mandatory 'Colorimetric.Observer'"},
      {"channels", Shared(ColorVector(ColorConditions("CIELab"), Values{1, 2})), "ColorVector 1",
       "Inconsistent ColorVector-size(expected 3 but got 2 elements for colorspace CIELab)"},
      {"no channels", empty, "ColorVector 'c'",
       "the colour has no channels, not even an empty list"},
      {"no conditions", bare, "Recipe 1", "the attribute has no conditions"},
      {"35 points", UnderCurve({}, 35), "Recipe 1",
       "the illumination of the conditions has 35 values instead of 36"},
      {"below 35 nm", UnderCurve({{kMinKey, "400nm"}, {kMaxKey, "430nm"}}, 36), "Recipe 1",
       "36 values of the illumination from '400nm' to '430nm' would get equal or falling "
       "wavelengths: the step is in whole nm"},
      {"control", Shared(Recipe(With({}), "a\x01", 0.0F, "", {})), "Recipe 1",
       "the assortment: XML cannot carry the text 'a\x01'"},
      {"condition", Shared(Recipe(With({{"k", "\xFF"}}), "", 0.0F, "", {})), "Recipe 1",
       "the condition 'k': XML cannot carry the text '\xFF'"},
      {"known name", Unknown(Tree("VEXRecipe")), "VEXRecipe 1",
       "the content of an unknown kind is called 'VEXRecipe', which is the name of a known one"},
      {"element name", Unknown(Tree("1x")), "1x 1", "'1x' is no name of an element in XML"},
      {"attribute name", UnknownOf(Tree("X"), "<", "v"), "X 1",
       "'<' is no name of an attribute in XML"},
      {"attribute lost", UnknownOf(Tree("X"), "Z", "v"), "X 1",
       "of the attributes of element 'X' 'Z' would be lost: only 'Conditions' is read"},
      {"indentation", Unknown(Tree("X", "\nv")), "X 1",
       "the text of element 'X' begins with a line feed and would be taken for indentation"},
      {"header", renamed, "X 1",
       "the header value 'Description' is not what the content says, which alone is written"},
      {"depth", Unknown(Nested(253)), "X 1",
       "the content nests deeper than the 252 levels that are read"},
      {"names", Unknown(ManyNames(32759)), "n0 1",
       "the document has more than the 32768 different names of elements that are read"},
  };
}

TEST(DocumentCheckerTest, EveryFaultIsToldWithItsPlaceAndKeepsTheFileAsItIs) {
  const TemporaryDirectory directory;
  for (const auto& [name, attribute, place, reason] : FaultCases()) {
    const VEX document = DocumentOf({attribute});
    const std::string told = "set 's', sample 't', " + place + ": " + reason;
    EXPECT_TRUE(FaultsOf(document).starts_with(told + "\n")) << name << "\n" << FaultsOf(document);
    EXPECT_NE(LossOf(document), "") << name << " is no fault";
    WriteFile(directory / "a.xml", "old");
    Utilities::FileSystem::File file((directory / "a.xml").string());
    const std::string message =
        MessageOf<UnsavableDocumentException>([&] { SaveCheckedXML(document, file, true); });
    EXPECT_TRUE(message.starts_with("The document cannot be saved as it is: " + told)) << message;
    EXPECT_EQ(ReadFile(directory / "a.xml"), "old") << name;
    EXPECT_FALSE(std::filesystem::exists(directory / "Cache")) << name;
  }
}

TEST(DocumentCheckerTest, TheLimitsThemselvesAreNoFault) {
  for (const auto& attribute :
       {Unknown(Nested(252)), Unknown(ManyNames(32758)), SpectrumUnder({{kMaxKey, "415"}}),
        SpectrumUnder({{kMinKey, "0"}, {kMaxKey, "35"}}),
        UnderCurve({{kIlluminationKey, "Userdefined"}}, 36)}) {
    const VEX document = DocumentOf({attribute});
    EXPECT_EQ(LossOf(document), "");
    EXPECT_EQ(FaultsOf(document), "");
  }
}

TEST(DocumentCheckerTest, AWavelengthThatTheFileWouldMisstateIsAFault) {
  const VEX document = DocumentOf({SpectrumUnder({{kMinKey, "0.38um"}, {kMaxKey, "730nm"}})});
  EXPECT_NE(XmlOf(document).find("<Value Name=\"0\">"), std::string::npos);
  EXPECT_EQ(FaultsOf(document),
            "set 's', sample 't', Spectrum 1: the first wavelength, '0.38um', would be written as "
            "0\n");
  for (const char* const right : {"380", " 380 nm", "380.0nm"}) {
    EXPECT_EQ(FaultsOf(DocumentOf({SpectrumUnder({{kMinKey, right}})})), "") << right;
  }
}

TEST(DocumentCheckerTest, CurvesToWhichNothingRefersComeBackToo) {
  SmartPointer<SampleAttribute> one = UnderCurve({{"idle", "1"}}, 36);
  SmartPointer<SampleAttribute> other = Shared(Recipe());
  Conditions block = *one->GetConditions();
  block.SetCustomIllumination(Flat(2));
  other->SetConditions(OwnBlock(block));
  const VEX document = DocumentOf({one, other});
  EXPECT_EQ(LossOf(document), "");
  EXPECT_EQ(FaultsOf(document), "");
  for (const auto& attribute : {one, other}) {
    VEX again;  // whatever else the process holds, each curve comes back
    LoadText(again, XmlOf(DocumentOf({attribute})));
    EXPECT_EQ(ContentOf(again), ContentOf(DocumentOf({attribute})));
  }
  for (const auto& attribute : {one, other}) {
    block = *attribute->GetConditions();
    block.AddAttribute(kIlluminationKey, "Userdefined");
    attribute->SetConditions(OwnBlock(block));
  }
  EXPECT_EQ(LossOf(document), "");
  EXPECT_EQ(FaultsOf(document), "");
}

TEST(DocumentCheckerTest, AllFaultsAreToldAndTheMessageCountsThem) {
  VEX document = DocumentOf({SpectrumUnder({{kCountKey, "x"}}), Shared(Recipe(), "r")});
  document.SetAttribute("k", "\x02");
  EXPECT_EQ(FaultsOf(document),
            "the header value 'k': XML cannot carry the text '\x02'\n"
            "set 's', sample 't', Spectrum 1: the number of points in its conditions, 'x', is no "
            "number\n"
            "set 's', sample 't', Recipe 'r': the attribute has no conditions\n");
  Utilities::FileSystem::File file("/nowhere/a.xml");
  try {
    SaveCheckedXML(document, file, false);
    FAIL();
  } catch (const UnsavableDocumentException& e) {
    EXPECT_EQ(e.GetFaults().size(), 3U);
    EXPECT_TRUE(std::string(e.what()).ends_with("'\x02' (the first of 3 faults)")) << e.what();
  }
}

TEST(DocumentCheckerTest, ALegacyDocumentIsRefusedWhereItsConditionsAreNotWholeAndElseSaved) {
  VEX document;
  LoadText(document,
           "<VEX><Name>d</Name><SampleSet><Name>s</Name><Sample><Name>t</Name><SampleAttribute>"
           "<ColorVector Conditions='1'><Value Name='x'>1</Value><Value Name='y'>2</Value>"
           "<Value Name='z'>3</Value></ColorVector></SampleAttribute></Sample></SampleSet>"
           "<Conditions><ID>1</ID><Attribute Name='ColorSpaceDescription.Type'>CIELab</Attribute>"
           "</Conditions></VEX>");
  EXPECT_EQ(FaultsOf(document),
            "set 's', sample 't', ColorVector 1: the conditions of a colour lack the mandatory "
            "'Colorimetric.Illumination'\n"
            "set 's', sample 't', ColorVector 1: the conditions of a colour lack the mandatory "
            "'Colorimetric.Observer'\n");
  document.FindSample("s", "t")->GetElements().front().second->SetConditions(
      SharedConditions(ColorConditions("CIELab")));
  const TemporaryDirectory directory;
  Utilities::FileSystem::File file((directory / "a.xml").string());
  SaveCheckedXML(document, file, true);
  VEX again;
  LoadFile(again, directory / "a.xml");
  EXPECT_EQ(ContentOf(again), ContentOf(document));
  EXPECT_TRUE(std::filesystem::exists(directory / "Cache/a.vexb"));
}

}  // namespace
}  // namespace Aldermoor::Vexdoc::Testing
