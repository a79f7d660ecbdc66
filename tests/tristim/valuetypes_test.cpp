#include <cmath>
#include <memory>

#include <gtest/gtest.h>

#include "aldermoor/tristim/internals/basecalculator.h"
#include "aldermoor/tristim/internals/filter.h"
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

TEST(HXColorVectorTest, ArithmeticTakesInAllFourChannelsAndKeepsTheConditions) {
  HXColorVector vector({5.0F, 7.0F, 1.0F, 2.0F}, InSpace("CMYK"));
  vector -= HXColorVector({2.0F, 3.0F, 1.0F, 2.0F}, InSpace("RGB"));
  EXPECT_TRUE(vector == HXColorVector(3.0F, 4.0F, 0.0F, InSpace("CMYK")));
  EXPECT_EQ(vector.Length(), 5.0F);
  vector *= HXColorVector(2.0F, 0.0F, 1.0F, InSpace("RGB"));
  vector[3] = 8.0F;
  EXPECT_EQ(vector.Length(), 10.0F);
  // Missing channels are zero, surplus ones are dropped.
  EXPECT_EQ(HXColorVector({9.0F}, InSpace("RGB")).GetChannels(),
            (HXColorVector::Channels{9.0F, 0.0F, 0.0F, 0.0F}));
  EXPECT_EQ(HXColorVector({1.0F, 2.0F, 3.0F, 4.0F, 5.0F}, InSpace("RGB")).GetChannels(),
            (HXColorVector::Channels{1.0F, 2.0F, 3.0F, 4.0F}));
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

void SetPaper(std::initializer_list<HXSpectrum> spectra) {
  auto sample = std::make_unique<HXSample>();
  for (const HXSpectrum& spectrum : spectra) {
    sample->SetSpectrum(spectrum);
  }
  BaseCalculator::SetPaperWhitePointer(Utilities::Tools::SmartPointer<HXSample>(sample.release()));
}

TEST(PaperWhiteTest, WithoutOneNothingIsDivided) {
  HXSpectrum spectrum = Flat(0.5F);
  EXPECT_FALSE(BaseCalculator::IsPaperWhiteValid(HXMeasureConditions()));
  EXPECT_FALSE(BaseCalculator::GetSpecBasedToPapWhite(spectrum));
  EXPECT_FALSE(BaseCalculator::GetSpecBasedToPapWhite(HXMeasureConditions(), &spectrum[0]));
  EXPECT_TRUE(spectrum == Flat(0.5F));
  EXPECT_EQ(MessageOf<Utilities::Exceptions::NullPointerException>(
                [] { BaseCalculator::GetPaperWhite(); }),
            "accessed null pointer (class Aldermoor::Tristim::Internals::HXSample)");
  SetPaper({});
  EXPECT_FALSE(BaseCalculator::GetSpecBasedToPapWhite(spectrum)) << "a sample without spectra";
  BaseCalculator::SetPaperWhitePointer({});
}

TEST(PaperWhiteTest, TheFirstSpectrumDividesEvenIfItIsInvalid) {
  SetPaper({Flat(0.8F), Flat(0.1F)});
  HXSpectrum spectrum = Flat(0.4F);
  EXPECT_TRUE(BaseCalculator::IsPaperWhiteValid(HXMeasureConditions()));
  EXPECT_TRUE(BaseCalculator::GetSpecBasedToPapWhite(spectrum));
  EXPECT_TRUE(spectrum == Flat(0.5F));
  EXPECT_TRUE(BaseCalculator::GetSpecBasedToPapWhite(HXMeasureConditions(), &spectrum[0]));
  EXPECT_EQ(spectrum[35], 0.625F);
  SetPaper({Flat(0.0F)});
  EXPECT_FALSE(BaseCalculator::IsPaperWhiteValid(HXMeasureConditions()));
  EXPECT_TRUE(BaseCalculator::GetSpecBasedToPapWhite(spectrum));
  EXPECT_TRUE(std::isinf(spectrum[0]));
  BaseCalculator::SetPaperWhitePointer({});
}

}  // namespace
}  // namespace Aldermoor::Tristim::Tests
