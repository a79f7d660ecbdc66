#include <clocale>
#include <cstdlib>

#include <gtest/gtest.h>

#include "aldermoor/vexdoc/internals/conditionmanager.h"
#include "aldermoor/vexdoc/vexexception.h"

#include "tests/vexdoc/internals/documenttext.h"
#include "tests/vexdoc/internals/loadsupport.h"

namespace Aldermoor::Vexdoc::Testing {
namespace {

using Internals::ConditionManager;

// Each legal/NAME.xml must give what legal/NAME.txt tells, written by hand in the form of
// DocumentText.
class LegalDocumentTest : public ::testing::TestWithParam<std::string> {};

TEST_P(LegalDocumentTest, GivesExactlyItsContentWhateverWasThereBeforeAndInEveryLocale) {
  const std::filesystem::path path = DataFile("legal", GetParam() + ".xml");
  const std::string expected = ReadFile(DataFile("legal", GetParam() + ".txt"));
  VEX document("earlier content");
  document.AddSampleSet("earlier set");
  document.SetCreator("earlier creator");
  LoadFile(document, path);
  EXPECT_EQ(DocumentText(document), expected);
  const unsigned long count = ConditionManager::GetInstance().GetConditionsCount();
  const std::string saved = std::setlocale(LC_ALL, nullptr);
  for (const char* name : {"C", "C.UTF-8", "de_DE.ISO-8859-1"}) {
    // The build makes the locale that is no part of every system, and ctest names its place.
    if (std::setlocale(LC_ALL, name) == nullptr) {
      ASSERT_EQ(std::getenv("LOCPATH"), nullptr) << name;
      continue;
    }
    LoadText(document, ReadFile(path));
    EXPECT_EQ(DocumentText(document), expected) << name;
  }
  std::setlocale(LC_ALL, saved.c_str());
  EXPECT_EQ(ConditionManager::GetInstance().GetConditionsCount(), count) << "blocks are shared";
}

INSTANTIATE_TEST_SUITE_P(Corpus, LegalDocumentTest, ::testing::ValuesIn(XmlFiles("legal")),
                         [](const auto& param) { return param.param; });

TEST(XmlLoaderTest, LoadKeepsTheTimeStampsOfTheFile) {
  VEX document;
  LoadText(document,
           "<VEX Version='1.0'><Name>a</Name><Created>1999-01-02/03:04:05</Created>"
           "<Modified>2000-01-02/03:04:05</Modified>"
           "<SampleSet><Name>s</Name><Modified>2001-01-02/03:04:05</Modified>"
           "<Sample><Name>t</Name></Sample></SampleSet></VEX>");
  EXPECT_EQ(document.GetCreationDateTime(), "1999-01-02/03:04:05");
  EXPECT_EQ(document.GetModificationDateTime(), "2000-01-02/03:04:05");
  EXPECT_EQ(document.GetSampleSet("s")->GetModificationDateTime(), "2001-01-02/03:04:05");
}

TEST(XmlLoaderTest, FirstOfEqualSampleNamesIsFoundAndBothAreListed) {
  VEX document;
  LoadFile(document, DataFile("legal", "tolerance.xml"));
  EXPECT_EQ(document.FindSample("first name", "twin")->GetDescription(), "first");
  EXPECT_EQ(document.GetSampleSet("first name")->Size(), 3U);
}

TEST(XmlLoaderTest, LinkOfTheFileFindsItsBlockUnderAnotherId) {
  ConditionManager::GetInstance().NewConditions();  // so that "1" is taken
  VEX document;
  LoadText(document,
           "<VEX Version='1.0'><Name/><SampleSet><Name>s</Name><Sample><Name>t</Name>"
           "<SampleAttribute><Recipe Conditions='1'/></SampleAttribute></Sample></SampleSet>"
           "<Conditions><ID>1</ID><A N='LinkOfTheFile'>here</A></Conditions></VEX>");
  const auto block = document.FindSample("s", "t")->GetElements().front().second->GetConditions();
  EXPECT_EQ(block->GetAttribute("LinkOfTheFile"), "here");
  EXPECT_NE(block->GetID(), "1");
  EXPECT_EQ(&*ConditionManager::GetInstance().GetConditions(block->GetID()), &*block);
}

TEST(XmlLoaderTest, ContradictoryEncodingIsAWarningOnStandardOutput) {
  VEX document;
  ::testing::internal::CaptureStdout();
  LoadText(document,
           "<?xml version='1.0' encoding='UTF-16'?><VEX Version='1'><Name>a</Name></VEX>");
  EXPECT_EQ(::testing::internal::GetCapturedStdout(),
            "XercesErrorReporter: warning: \nVEX1:40\n"
            "encoding 'UTF-16' from XML declaration or manually set contradicts the auto-sensed "
            "encoding; ignoring\n");
  EXPECT_EQ(document.GetName(), "a");
}

TEST(XmlLoaderTest, XmlVersionThatTheParserKnowsHalfIsAFailureLikeOthers) {
  VEX document;
  const std::string text = "<?xml version='1.2'?><VEX Version='1'><Name>a</Name></VEX>";
  EXPECT_THROW(LoadText(document, text), VexException);
  const TemporaryDirectory directory;
  WriteFile(directory / "a.xml", text);
  EXPECT_THROW(LoadFile(document, directory / "a.xml"), VexException);
}

}  // namespace
}  // namespace Aldermoor::Vexdoc::Testing
