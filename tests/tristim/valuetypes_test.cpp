#include <cmath>
#include <limits>
#include <memory>

#include <gtest/gtest.h>

#include "aldermoor/tristim/internals/basecalculator.h"
#include "aldermoor/tristim/internals/filter.h"
#include "aldermoor/tristim/internals/hxlab.h"
#include "aldermoor/tristim/internals/hxlch.h"
#include "aldermoor/tristim/internals/hxluv.h"
#include "aldermoor/tristim/internals/hxxyz.h"
#include "aldermoor/tristim/tristimexception.h"

#include "tests/tristim/support.h"

namespace Aldermoor::Tristim::Tests {
namespace {

using namespace Internals;

constexpr char kIllegalSize[] =
    "Illegal spectrum size! (only spectral values [380 - 730nm, 10nm resolution] are supported";

TEST(HXSpectrumTest, TakesThirtySixValuesOnly) {
  for (const std::size_t count : {0U, 35U, 37U}) {
    const std::vector<float> values(count, 0.5F);
    EXPECT_EQ(MessageOf<TristimException>([&] { HXSpectrum spectrum(values); }), kIllegalSize);
    EXPECT_EQ(MessageOf<TristimException>([&] { HXSpectrum spectrum(values, InSpace("RGB")); }),
              kIllegalSize);
  }
  const std::vector<float> values(36, 0.5F);
  EXPECT_EQ(HXSpectrum(values).GetValues(), values);
}

TEST(HXSpectrumTest, IsValidWithOneValueAboveZero) {
  HXSpectrum spectrum;
  EXPECT_FALSE(spectrum.IsValid());
  EXPECT_FALSE(Flat(-0.1F).IsValid());
  spectrum[35] = std::numeric_limits<float>::denorm_min();
  EXPECT_TRUE(spectrum.IsValid());
}

TEST(HXSpectrumTest, WavelengthsBetweenBandsBelongToTheBandBelow) {
  const HXSpectrum spectrum;
  constexpr std::pair<unsigned short, unsigned short> kCases[] = {
      {0, 0},    {370, 0},  {379, 0},  {380, 0},  {385, 0},  {389, 0}, {390, 1},
      {550, 17}, {729, 34}, {730, 35}, {731, 35}, {739, 35}, {740, 0}, {65535, 0}};
  for (const auto& [wavelength, index] : kCases) {
    EXPECT_EQ(spectrum.GetArrayIndex(wavelength), index) << wavelength << " nm";
  }
  EXPECT_EQ(spectrum.GetWaveLength(0), 380);
  EXPECT_EQ(spectrum.GetWaveLength(17), 550);
  EXPECT_EQ(spectrum.GetWaveLength(35), 730);
  EXPECT_EQ(spectrum.GetWaveLength(36), 0);
}

TEST(HXSpectrumTest, EqualityLooksAtValuesAndConditions) {
  EXPECT_TRUE(Flat(0.5F) == Flat(0.5F));
  EXPECT_FALSE(Flat(0.5F) == Flat(0.5F, Conditions("A")));
  HXSpectrum spectrum = Flat(0.5F);
  spectrum[3] = std::nanf("");
  EXPECT_FALSE(spectrum == spectrum);
}

TEST(HXColorVectorTest, ArithmeticTakesInAllFourChannelsAndKeepsTheConditions) {
  HXColorVector vector({5.0F, 7.0F, 1.0F, 2.0F}, InSpace("CMYK"));
  vector -= HXColorVector({2.0F, 3.0F, 1.0F, 2.0F}, InSpace("RGB"));
  EXPECT_TRUE(vector == HXColorVector(3.0F, 4.0F, 0.0F, InSpace("CMYK")));
  EXPECT_EQ(vector.Length(), 5.0F);
  vector *= HXColorVector(2.0F, 0.0F, 1.0F, InSpace("RGB"));
  vector[3] = 8.0F;
  EXPECT_EQ(vector.Length(), 10.0F);
  EXPECT_FALSE(HXColorVector(1.0F, 2.0F, 3.0F, InSpace("RGB")) ==
               HXColorVector(1.0F, 2.0F, 3.0F, InSpace("CIELab")));
}

TEST(HXColorVectorTest, MissingChannelsAreZeroAndSurplusOnesAreDropped) {
  EXPECT_EQ(HXColorVector({9.0F}, InSpace("RGB")).GetChannels(),
            (HXColorVector::Channels{9.0F, 0.0F, 0.0F, 0.0F}));
  EXPECT_EQ(HXColorVector({1.0F, 2.0F, 3.0F, 4.0F, 5.0F}, InSpace("RGB")).GetChannels(),
            (HXColorVector::Channels{1.0F, 2.0F, 3.0F, 4.0F}));
}

TEST(HXColorVectorTest, ThePhysicalFilterCanComeFromElsewhere) {
  HXMeasureConditions physical = Conditions("A");
  physical.SetMeasureCondition(Vocabulary::kFilterKey, "UVCut");
  HXColorVector vector;
  vector.SetMeasureConditions(physical, Conditions("D50"));
  EXPECT_EQ(vector.GetMeasureConditions().GetPhysicalFilter(), PhysicalFilter::UVCut);
  EXPECT_TRUE(vector.GetMeasureConditions().GetIllumination() ==
              Conditions("D50").GetIllumination());
}

TEST(HXColorVectorTest, NamedVectorsTakeOverValuesAndConditions) {
  const HXColorVector vector(1.0F, 2.0F, 3.0F, Conditions("C"));
  HXLab lab;
  lab = vector;
  EXPECT_TRUE(lab == vector);
  EXPECT_TRUE(HXLCh(vector) == vector);
  EXPECT_TRUE(HXXYZ(vector) == vector);
  EXPECT_TRUE(HXLuv() == HXColorVector());
}

TEST(HXSampleTest, TheFirstSpectrumStandsForTheSample) {
  HXSample sample;
  HXSpectrum found = Flat(9.0F);
  EXPECT_FALSE(sample.GetSpectrum(HXMeasureConditions(), found));
  EXPECT_EQ(found[0], 9.0F);
  EXPECT_EQ(sample.AddSample(HXSample()), 0);
  sample.SetSpectrum(Flat(0.8F));
  sample.SetSpectrum(Flat(0.9F));
  EXPECT_TRUE(sample.GetSpectrum(Conditions("A", "TenDegree"), found));
  EXPECT_EQ(found[0], 0.8F);
  EXPECT_EQ(sample.AddSample(sample), 4) << "also its own";

  HXSample other;
  other.SetSpectrum(Flat(0.8F));
  EXPECT_TRUE(sample == other);
  HXSample third;
  third.SetSpectrum(Flat(0.9F));
  EXPECT_FALSE(sample == third);
}

TEST(FilterTest, TheSumIsTakenInOrderAndAgainAfterAWrite) {
  HXSpectrum::Bands values;
  values.fill(0.5F);
  values[0] = 16777216.0F;  // 2^24: what is added behind it one by one is lost, a half at a time
  Filter filter(values.data());
  EXPECT_EQ(filter.GetFilterSum(), 16777216.0F);
  filter[0] = 1.0F;
  EXPECT_EQ(filter.GetFilterSum(), 18.5F);
  EXPECT_EQ(filter * Flat(2.0F), 37.0F);
}

TEST(FilterTest, EqualityIsBitForBitAndTheProductByBand) {
  Filter ones(Flat(1.0F).GetBands().data());
  Filter ramp(Flat(0.0F).GetBands().data());
  for (int i = 0; i < 36; ++i) {
    ramp[i] = static_cast<float>(i);
  }
  Filter product = ones.FilterXFilter(ramp);
  EXPECT_TRUE(product == ramp) << "the sum of one is stale, of the other not";
  EXPECT_EQ(product.GetFilterSum(), 630.0F);
  ramp[0] = -0.0F;
  EXPECT_FALSE(product == ramp);
}

class PaperWhiteTest : public ::testing::Test {
 protected:
  void TearDown() override { BaseCalculator::SetPaperWhitePointer({}); }

  static void SetPaper(std::initializer_list<HXSpectrum> spectra) {
    auto sample = std::make_unique<HXSample>();
    for (const HXSpectrum& spectrum : spectra) {
      sample->SetSpectrum(spectrum);
    }
    BaseCalculator::SetPaperWhitePointer(
        Utilities::Tools::SmartPointer<HXSample>(sample.release()));
  }
};

TEST_F(PaperWhiteTest, WithoutOneNothingIsDivided) {
  HXSpectrum spectrum = Flat(0.5F);
  HXSpectrum::Bands bands = spectrum.GetBands();
  EXPECT_FALSE(BaseCalculator::IsPaperWhiteValid(HXMeasureConditions()));
  EXPECT_FALSE(BaseCalculator::GetSpecBasedToPapWhite(spectrum));
  EXPECT_FALSE(BaseCalculator::GetSpecBasedToPapWhite(HXMeasureConditions(), bands.data()));
  EXPECT_TRUE(spectrum == Flat(0.5F));
  EXPECT_EQ(bands, spectrum.GetBands());
  EXPECT_EQ(MessageOf<Utilities::Exceptions::NullPointerException>(
                [] { BaseCalculator::GetPaperWhite(); }),
            "accessed null pointer (class Aldermoor::Tristim::Internals::HXSample)");
  SetPaper({});
  EXPECT_FALSE(BaseCalculator::GetSpecBasedToPapWhite(spectrum)) << "a sample without spectra";
}

TEST_F(PaperWhiteTest, TheFirstSpectrumDivides) {
  SetPaper({Flat(0.8F), Flat(0.1F)});
  HXSpectrum spectrum = Flat(0.4F);
  EXPECT_TRUE(BaseCalculator::IsPaperWhiteValid(HXMeasureConditions()));
  EXPECT_TRUE(BaseCalculator::GetSpecBasedToPapWhite(spectrum));
  EXPECT_TRUE(spectrum == Flat(0.5F));
  EXPECT_TRUE(BaseCalculator::GetSpecBasedToPapWhite(HXMeasureConditions(), &spectrum[0]));
  EXPECT_EQ(spectrum[35], 0.625F);
}

TEST_F(PaperWhiteTest, AnInvalidOneDividesAllTheSame) {
  SetPaper({Flat(0.0F)});
  HXSpectrum spectrum = Flat(0.4F);
  EXPECT_FALSE(BaseCalculator::IsPaperWhiteValid(HXMeasureConditions()));
  EXPECT_TRUE(BaseCalculator::GetSpecBasedToPapWhite(spectrum));
  EXPECT_TRUE(std::isinf(spectrum[0]));
}

}  // namespace
}  // namespace Aldermoor::Tristim::Tests
