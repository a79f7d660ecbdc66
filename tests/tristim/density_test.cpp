#include <algorithm>
#include <cmath>

#include <gtest/gtest.h>

#include "aldermoor/tristim/internals/densitycalculator.h"

#include "tests/tristim/support.h"

namespace Aldermoor::Tristim::Tests {
namespace {

using namespace Internals;
using Calculator = DensityCalculator;

constexpr int kDin = 0;
constexpr int kUser = 7;
constexpr int kMax = 4;
constexpr int kAuto = 5;

struct Paper {
  explicit Paper(float white = 1.0F) {
    const Utilities::Tools::SmartPointer<HXSample> sample(new HXSample);
    sample->SetSpectrum(Flat(white));
    BaseCalculator::SetPaperWhitePointer(sample);
  }
  ~Paper() { BaseCalculator::SetPaperWhitePointer({}); }
};

/// Cyan, magenta and yellow density behind the filters of DIN.
HXSpectrum Field(double cyan, double magenta, double yellow) {
  HXSpectrum spectrum = Flat(1.0F);
  for (unsigned i = 0; i < 8; ++i) {
    spectrum[20 + i] = static_cast<float>(std::pow(10.0, -cyan));
    spectrum[11 + i] = static_cast<float>(std::pow(10.0, -magenta));
    spectrum[1 + i] = static_cast<float>(std::pow(10.0, -yellow));
  }
  return spectrum;
}

HXDensity DensitiesOf(const HXSpectrum& spectrum, int standard = kDin) {
  HXDensity density;
  EXPECT_TRUE(Calculator::GetDensityVector(spectrum, standard, false, density));
  return density;
}

// Where the curves have their peaks, nm, by standard: a curve in the wrong place shows.
constexpr std::array<int, 4> kPeaks[] = {
    {570, 620, 530, 430}, {570, 620, 530, 430}, {570, 620, 530, 440}, {570, 600, 530, 440},
    {570, 620, 530, 430}, {570, 600, 530, 460}, {570, 620, 540, 430}};

TEST(DensityTest, EveryCurveStandsInItsPlaceAndWhiteHasNoDensity) {
  for (int standard = 0; standard < kUser; ++standard) {
    for (unsigned short channel = 0; channel < 4; ++channel) {
      SCOPED_TRACE(::testing::Message() << "standard " << standard << ", channel " << channel);
      Filter curve = DensityFilter(standard)[channel];
      EXPECT_TRUE(Near(curve.GetFilterSum(), channel == 0 ? 99.999886 : 1.0, 1e-5));
      const float* const values = curve.GetFilterSpectrum();
      EXPECT_EQ(380 + 10 * (std::max_element(values, values + 36) - values),
                kPeaks[standard][channel]);
      EXPECT_TRUE(Near(DensitiesOf(Flat(1.0F), standard).ByChannel(channel), 0.0, 2e-6));
      EXPECT_TRUE(Near(DensitiesOf(Flat(0.01F), standard).ByChannel(channel), 2.0, 2e-6));
    }
  }
  EXPECT_EQ(DensitiesOf(Flat(0.0F)).GetAll(), (Quadruple{9.99F + 2.0F, 9.99F, 9.99F, 9.99F}));
  EXPECT_EQ(DensitiesOf(Flat(1.0F), 8).ByChannel(1), 9.99F) << "no such standard";
}

TEST(DensityTest, ChangedUserCurvesWaitUntilTheStandardIsSelectedAnew) {
  EXPECT_EQ(DensitiesOf(Flat(0.1F), kUser).ByChannel(2), 9.99F) << "zero at load";
  DensityFilter::SetUserDensityStandardToDefault();
  EXPECT_EQ(DensitiesOf(Flat(0.1F), kUser).ByChannel(2), 9.99F);
  EXPECT_TRUE(Near(DensitiesOf(Flat(0.1F)).ByChannel(2), 1.0, 1e-5));
  EXPECT_TRUE(Near(DensitiesOf(Flat(0.1F), kUser).ByChannel(2), -std::log10(3.6), 1e-5));
  for (int channel = 0; channel < 4; ++channel) {
    DensityFilter::SetUserDefinedFilter(HXSpectrum().GetBands().data(), channel);
  }
  EXPECT_EQ(DensitiesOf(Flat(1.0F)).ByMode(kMax), 0.0F);
}

TEST(DensityTest, TheChannelToReportIsTheStrongestUnlessNearlyNeutralOrWhite) {
  constexpr std::pair<Quadruple, int> kCases[] = {
      {{0.0F, 0.0F, 0.0F, 0.0F}, 0}, {{0.2F, 1.4F, 0.5F, 0.3F}, 1}, {{0.2F, 0.5F, 1.4F, 1.5F}, 3},
      {{0.2F, 0.5F, 1.4F, 0.3F}, 2}, {{0.9F, 1.4F, 1.3F, 1.2F}, 0}, {{0, 0.009F, 0, 0}, 0}};
  for (const auto& [densities, channel] : kCases) {
    HXDensity density;
    density.SetAll(densities);
    EXPECT_EQ(Calculator::GetDensityFilter(density), channel);
    EXPECT_EQ(density.ByMode(kAuto), densities[static_cast<unsigned>(channel)]);
    Triple colors = {densities[1], densities[2], densities[3]};
    std::sort(colors.begin(), colors.end(), std::greater<>());
    EXPECT_EQ(SortedColors(densities), colors);
  }
}

TEST(DensityTest, TheDensestBandIsSoughtFrom410To700AndOfEqualOnesInTheMiddle) {
  HXSpectrum spectrum = Flat(0.1F);
  spectrum[2] = spectrum[33] = 0.01F;  // 400 nm and 710 nm, beyond
  float density = 0.0F;
  unsigned short wavelength = 0;
  EXPECT_TRUE(Calculator::GetMaxDensity(spectrum, false, density, wavelength));
  EXPECT_TRUE(Near(density, 1.0, 1e-6));
  EXPECT_EQ(wavelength, 550);
  std::fill_n(&spectrum[10], 15, 0.5F);
  EXPECT_TRUE(Calculator::GetMaxDensity(spectrum, false, density, wavelength));
  EXPECT_EQ(wavelength, 470) << "8 bands from the middle, as is 630 nm";
}

TEST(DensityTest, PrintControlByHand) {
  // Solid, tint, n, and (1 - 10^(-t/n)) / (1 - 10^(-s/n)).
  constexpr double kAreas[][4] = {{1.5, 0.3, 1.0, 0.498813 / 0.968377},
                                  {1.5, 0.3, 2.0, 0.292054 / 0.822172},
                                  {1.0, 1.0, 1.0, 1.0},
                                  {0.004, 0.002, 1.0, 0.0},
                                  {0.005, 0.005, 1.0, 1.0}};
  const Paper paper;
  float value = 0.0F;
  for (const auto& [s, t, n, area] : kAreas) {
    for (const int mode : {1, kMax}) {
      ASSERT_TRUE(Calculator::GetDotArea(Field(s, 0, 0), Field(t, 0, 0), kDin, mode,
                                         static_cast<float>(n), value));
      EXPECT_TRUE(Near(value, area, 1e-4)) << s << ", " << t << ", " << n << ", mode " << mode;
    }
  }
  const HXSpectrum solid = Field(1.4, 0.3, 0.1);
  for (const int mode : {1, kMax, kAuto}) {
    ASSERT_TRUE(Calculator::GetContrast(solid, Field(0.7, 0.1, 0.0), kDin, true, mode, value));
    EXPECT_TRUE(Near(value, (1.4 - 0.7) / 1.4, 1e-5)) << mode;
  }
  for (const int mode : {2, kMax}) {
    ASSERT_TRUE(Calculator::GetTrapping(solid, Field(0.2, 1.2, 0.6), Field(1.5, 1.26, 0.8), kDin,
                                        mode, value));
    EXPECT_TRUE(Near(value, (1.26 - 0.3) / 1.2, 1e-5)) << mode;
  }
  ASSERT_TRUE(Calculator::GetGreyness(solid, kDin, false, value, true));
  EXPECT_TRUE(Near(value, 0.1 / 1.4, 1e-5));
  ASSERT_TRUE(Calculator::GetHueError(solid, kDin, false, value, true));
  EXPECT_TRUE(Near(value, (0.3 - 0.1) / (1.4 - 0.1), 1e-5));
  // What has next to no density is no base.
  EXPECT_EQ(Contrast(0.009F, 0.1F), 0.0F);
  EXPECT_EQ(Trapping(0.5F, 0.009F, 0.5F), 1.0F);
  EXPECT_EQ(Greyness({0.009F, 0.0F, 0.0F}), 1.0F);
  EXPECT_EQ(HueError({0.009F, 0.0F, 0.0F}), 0.0F);
  EXPECT_TRUE(std::isnan(HueError({0.5F, 0.5F, 0.5F})));
}

/// The density of a tint of a solid of 1.5.
double Tint(double percent) {
  return -std::log10(1.0 - percent / 100.0 * (1.0 - std::pow(10.0, -1.5)));
}

struct FieldCase {
  HXSpectrum spectrum;
  std::array<float, 4> tones;
  int field, color;
  double gain;  ///< of a tint
};

TEST(DensityTest, FieldsOfAStripAreRecognised) {
  // The nominal tones 25, 50, 75 gain to 38.5, 68, 88.5; limits half way, 94.25 to the solid.
  constexpr std::array<float, 4> kTones = {0.0F, 25.0F, 50.0F, 75.0F};
  const auto grey = [](double density) {
    return Flat(static_cast<float>(std::pow(10.0, -density)));
  };
  const FieldCase cases[] = {
      {Field(Tint(70), 0, 0), kTones, 6, 1, 20},
      {Field(0, Tint(40), 0), kTones, 3, 2, 15},
      {Field(0, 0, Tint(79)), kTones, 12, 3, 4},
      {Field(0, 0, Tint(94)), kTones, 12, 3, 19},
      {Field(0, 0, Tint(95)), kTones, 19, 3, 0},
      {Field(Tint(19), 0, 0), kTones, 0, 1, 0},
      {Field(Tint(70), 0, 0), {0.0F, 75.0F, 25.0F, 50.0F}, 10, 1, 20},
      {Field(Tint(70), 0, 0), {0.0F, 100.0F, 100.0F, 120.0F}, 17, 1, 0},  // no tints
      {Field(0, 1.4, 1.3), kTones, 13, -1, 0},
      {Field(1.4, 0, 1.3), kTones, 14, -1, 0},
      {Field(1.4, 1.3, 0), kTones, 15, -1, 0},
      {Field(1.4, 0.5, 0.5), kTones, 14, -1, 0},  // greyness over 0.25
      {grey(Tint(70)), kTones, 5, 0, 20},
      {grey(1.5), kTones, 16, 0, 0},
  };
  HXDensity solids[4];
  for (int channel = 0; channel < 4; ++channel) {
    solids[channel].SetDensity(1.5F, channel);
  }
  const Paper paper;
  for (const FieldCase& c : cases) {
    SCOPED_TRACE(::testing::Message() << "case " << &c - cases);
    int field = 99;
    int color = 99;
    HXDensity density;
    ColorFieldResult results[12];
    ASSERT_TRUE(Calculator::RecognizeColorField(solids, c.spectrum, kDin, c.tones.data(), field,
                                                color, density, results));
    EXPECT_EQ(field, c.field);
    EXPECT_EQ(color, c.color);
    for (int i = 0; i < 12; ++i) {
      EXPECT_EQ(results[i].present, c.gain != 0 && i == c.field - 1);
      EXPECT_TRUE(Near(results[i].dotGain, results[i].present ? c.gain : 0.0, 1e-3));
    }
  }
}

TEST(DensityTest, WithoutAPaperWhiteWhatIsAbsoluteIsLeft) {
  const HXSpectrum s = Flat(0.1F);
  HXDensity density;
  float value = 0.0F;
  int channel = 1;
  EXPECT_FALSE(Calculator::GetDensityVector(s, kDin, true, density));
  EXPECT_TRUE(Near(density.ByChannel(1), 1.0, 1e-5));
  EXPECT_FALSE(Calculator::GetDensity(s, kDin, true, value, channel, true));
  EXPECT_EQ(value, 9.99F);
  EXPECT_EQ(channel, -1);
  EXPECT_TRUE(Calculator::GetContrast(s, s, kDin, false, 1, value));
  EXPECT_FALSE(Calculator::GetContrast(s, s, kDin, false, kMax, value)) << "always on paper";
  const Paper black(0.0F);  // not valid
  EXPECT_FALSE(Calculator::GetDensityVector(s, kDin, true, density));
  EXPECT_THROW(Calculator::GetDensitySlope(13, kDin), std::out_of_range);
}

}  // namespace
}  // namespace Aldermoor::Tristim::Tests
