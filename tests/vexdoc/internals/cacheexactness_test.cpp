// A cache holds a document as it was in memory.  Where that says something else than its file, a
// load that asks for what the file says reads the file.

#include <chrono>

#include <gtest/gtest.h>

#include "aldermoor/vexdoc/loadoptions.h"
#include "aldermoor/vexdoc/vexexception.h"

#include "tests/vexdoc/internals/documenttext.h"
#include "tests/vexdoc/internals/loadsupport.h"
#include "tests/vexdoc/internals/writesupport.h"

namespace Aldermoor::Vexdoc::Testing {
namespace {

namespace fs = std::filesystem;
using Utilities::FileSystem::File;

constexpr const char* kDates =
    "<Created>2024-01-15/12:00:00</Created><Modified>2024-01-15/12:00:00</Modified>";

std::string TextOf(const std::string& dates, const char* last_point) {
  const std::string header = "<Name>n</Name>" + dates;
  return "<VEX Version='1.0'>" + header + "<SampleSet>" + header + "<Sample>" + header +
         "<SampleAttribute><Spectrum Conditions='1'>" + dates +
         "<Value Name='400'>0.5</Value><Value Name='" + last_point +
         "'>1</Value></Spectrum></SampleAttribute></Sample></SampleSet><Conditions><ID>1</ID>"
         "<A N='Physical.SpectrumType'>Remission</A>"
         "<A N='Physical.NumberOfDataPointsSpectrum'>2</A>"
         "<A N='Physical.WavelengthSpectrumMin'>400nm</A>"
         "<A N='Physical.WavelengthSpectrumMax'>410nm</A></Conditions></VEX>";
}

class CacheExactnessTest : public ::testing::Test {
 protected:
  // As old as a cache has to be younger than.
  void Write(const std::string& text) {
    WriteFile(xml_, text);
    fs::last_write_time(xml_, fs::file_time_type::clock::now() - std::chrono::seconds(100));
  }

  LoadReport Load(VEX& document, const LoadOptions& options = {}) {
    return document.LoadXML(File(xml_.string()), options);
  }

  TemporaryDirectory directory_;
  fs::path xml_ = directory_ / "paper.xml";
  fs::path cache_ = directory_ / "Cache/paper.vexb";
  VEX document_;
};

TEST_F(CacheExactnessTest, DatesOfAPlainLoadComeBackInPlainLoadsOnly) {
  for (const bool has_dates : {true, false}) {
    Write(TextOf(has_dates ? kDates : "", "410"));
    document_.LoadXML(File(xml_.string()), true);
    ASSERT_TRUE(fs::exists(cache_));
    VEX careful;
    EXPECT_EQ(Load(careful).from_cache, has_dates);
    EXPECT_EQ(careful.GetCreationDateTime(), has_dates ? "2024-01-15/12:00:00" : "");
    EXPECT_EQ(careful.FindSample("n", "n")->GetModificationDateTime(),
              has_dates ? "2024-01-15/12:00:00" : "");
    fs::remove_all(directory_ / "Cache");
  }
}

TEST_F(CacheExactnessTest, WavelengthsThatAPlainLoadForgotAreStillRefused) {
  Write(TextOf(kDates, "420"));
  document_.LoadXML(File(xml_.string()), true);
  ASSERT_TRUE(fs::exists(cache_));
  EXPECT_THROW(Load(document_), WavelengthException);
  EXPECT_EQ(Load(document_, {.wavelengths = WavelengthUse::kReport}).contradiction_count, 1U);
}

TEST_F(CacheExactnessTest, WhatACarefulLoadCachesIsWhatItRead) {
  for (const char* const dates : {kDates, ""}) {
    Write(TextOf(dates, "410"));
    fs::remove_all(directory_ / "Cache");
    EXPECT_FALSE(Load(document_, {.cache = CacheUse::kReadAndWrite}).from_cache);
    VEX cached;
    EXPECT_TRUE(Load(cached).from_cache);
    EXPECT_EQ(DocumentText(cached), DocumentText(document_));
    VEX plain;
    plain.LoadXML(File(xml_.string()), false);
    EXPECT_EQ(DocumentText(plain), DocumentText(document_));
  }
}

// A plain load knows nothing of a range that nobody named, and its cache nothing of the points.
TEST_F(CacheExactnessTest, ARangeThatIsGivenHasToAgreeWithPointsThatACacheHasNot) {
  std::string text = TextOf(kDates, "410");
  for (const char* const end : {"Min'>400nm", "Max'>410nm"}) {
    const auto at = text.find(std::string("<A N='Physical.WavelengthSpectrum") + end);
    text.erase(at, text.find("</A>", at) + 4 - at);
  }
  text.erase(text.find(" Version='1.0'"), 14);
  Write(text);
  document_.LoadXML(File(xml_.string()), true);
  LoadOptions options;
  options.completion.emplace();
  options.completion->spectra = {{"Physical.WavelengthSpectrumMin", "420nm"},
                                 {"Physical.WavelengthSpectrumMax", "430nm"}};
  EXPECT_THROW(Load(document_, options), WavelengthException);
  options.completion->spectra["Physical.WavelengthSpectrumMin"] = "400nm";
  options.completion->spectra["Physical.WavelengthSpectrumMax"] = "bogus";
  EXPECT_EQ(Load(document_, options).completion.missing_count, 1U);
  options.completion->spectra["Physical.WavelengthSpectrumMax"] = "410nm";
  EXPECT_EQ(Load(document_, options).completion.missing_count, 0U);
}

TEST_F(CacheExactnessTest, ASaveOfWhatNoLoadReadsSucceedsWithoutACache) {
  Write(TextOf(kDates, "410"));
  document_.LoadXML(File(xml_.string()), true);
  const auto spectrum = document_.FindSample("n", "n")->GetElements().front().second;
  for (const char* const count : {"", "none", "99999999999", "35"}) {
    Conditions conditions(*spectrum->GetConditions());
    conditions.AddAttribute("Physical.NumberOfDataPointsSpectrum", count);
    spectrum->SetConditions(SharedConditions(conditions));
    File file(xml_.string());
    EXPECT_NO_THROW(document_.SaveXML(file, true)) << count;
    EXPECT_FALSE(fs::exists(cache_)) << count;
  }
}

TEST_F(CacheExactnessTest, WhatWasCompletedIsNotCached) {
  Write(TextOf(kDates, "420"));
  Load(document_, {.cache = CacheUse::kReadAndWrite, .wavelengths = WavelengthUse::kComplete});
  EXPECT_FALSE(fs::exists(cache_));
}

}  // namespace
}  // namespace Aldermoor::Vexdoc::Testing
