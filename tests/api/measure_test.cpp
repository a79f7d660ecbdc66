// Colorimetry beyond the requests of a sample, as an application has it: on documents, by the
// installed headers, linked to the shared library alone.

#include <cmath>
#include <optional>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "aldermoor/measure/colordifference.h"
#include "aldermoor/measure/density.h"
#include "aldermoor/measure/judgement.h"
#include "aldermoor/measure/light.h"
#include "aldermoor/measure/paperwhite.h"
#include "aldermoor/measure/printcontrol.h"
#include "aldermoor/vexdoc/sample.h"

#include "measuresupport.h"

namespace {

using namespace MeasureTests;
using Aldermoor::Utilities::Exceptions::ResourceNotAvailableException;
using Aldermoor::Utilities::Tools::SmartPointer;

TEST(MeasureTest, DifferencesOfColorsAndSpectra) {
  EXPECT_NEAR(ColorDifference(Lab(50, 3, 4), Lab(50, 0, 0)), 5.0, 1e-5);
  // Pair 17 of the published ones for CIEDE2000; for CMC the weights are put on.
  EXPECT_NEAR(ColorDifference(Lab(50, 2.5F, 0, "2000"), Lab(73, 25, -18)), 27.1492, 1e-4);
  EXPECT_NEAR(ColorDifference(Lab(16, 0, 0, "CMC"), Lab(15, 0, 0), {1, 1}), 1 / 0.511, 1e-5);
  const Conditions lab = Of({{kLight, "D50"}, {kFormula, "CIELab"}});
  EXPECT_NEAR(ColorDifference(Flat(1), Flat(0), lab), 100.0, 1e-3);
  const ColorVector delta = DifferenceVector(Lab(60, 6, 8), Lab(50, 3, 4));
  EXPECT_NEAR(delta.GetDatastore()[0].second, 10.0, 1e-5);
  EXPECT_NEAR(delta.GetDatastore()[1].second, 5.0, 1e-5);
  EXPECT_EQ(delta.GetConditions()->GetAttribute(kSpace), "CIELCh");
  EXPECT_EQ(delta.GetConditions()->GetAttribute("ColorSpaceDescription.AbsoluteOrDeltaVector"),
            "DeltaVector");
  EXPECT_EQ(delta.GetDatastore()[2].first, "delta H*");

  EXPECT_EQ(ReasonOf([] { ColorDifference(Lab(1, 2, 3, "LABhx"), Lab(1, 2, 3)); }),
            "the colour difference \"LABhx\" of two colours cannot be computed");
  EXPECT_EQ(ReasonOf([] {
              ColorDifference(Flat(0), Flat(1), Of({{kFormula, "FMCII"}}));
            }),
            "the colour difference \"FMCII\" cannot be computed");
  EXPECT_EQ(ReasonOf([] {
              ColorDifference(Flat(0), Flat(1), Of({{kBase, "Paper"}}));
            }),
            "the colour difference \"CIELab\" cannot be computed: the white base is \"Paper\" and "
            "there is no paper white");
  EXPECT_EQ(ReasonOf([] { DifferenceVector(Lab(1, 2, 3, "94", "CIEXYZ"), Lab(1, 2, 3)); }),
            "there is no difference vector of a colour in \"CIEXYZ\" and one in \"CIELab\"");
  EXPECT_EQ(ReasonOf([] {
              const ColorVector xyz = Lab(1, 2, 3, "94", "CIEXYZ");
              DifferenceVector(xyz, xyz);
            }),
            "there is no difference vector in the colour space \"CIEXYZ\"");
}

TEST(MeasureTest, JudgementsOfSpectra) {
  const Conditions paper = Of({{kLight, "D50"}, {kBase, "Paper"}});
  const std::string why =
      " cannot be computed: the white base is \"Paper\" and there is no paper white";
  EXPECT_EQ(ColorFamily(Flat(0.5F)), "Gray");
  EXPECT_EQ(ReasonOf([&] { ColorFamily(Flat(0.5F, paper)); }), "the colour family" + why);
  EXPECT_NEAR(MetamerismIndex(Cyan(0.1F), Cyan(0.1F), Of({}), Of({{kLight, "A"}})), 0.0, 1e-5);
  EXPECT_GT(MetamerismIndex(Cyan(0.1F), Flat(0.5F), Of({}), Of({{kLight, "A"}})), 5.0F);
  EXPECT_EQ(ReasonOf([&] {
              MetamerismIndex(Flat(1), Flat(1), paper, Of({{kLight, "A"}}));
            }),
            "the metamerism index" + why);
  Conditions own = Of({{kLight, "Userdefined"}});
  own.SetCustomIllumination(Flat(1));
  EXPECT_EQ(ReasonOf([&] { MetamerismIndex(Flat(1), Flat(1), own, own); }),
            "the metamerism index needs a test light that has a name");
  const ColorVector color = Lab(60, 20, -10);
  const Conditions lab = Of({{kLight, "D50"}, {kSpace, "CIELab"}});
  Sample sample("s");
  sample.AddSampleAttribute(SmartPointer<Spectrum>(new Spectrum(SpectrumOfColor(color))));
  const auto back = sample.GetSampleAttribute("VEXColorVector", lab, true);
  EXPECT_LT(ColorDifference(color, dynamic_cast<const ColorVector&>(*back)), 0.1F);
  EXPECT_EQ(ReasonOf([] { SpectrumOfColor(Lab(60, 120, -120)); }),
            "a reflectance spectrum of this colour cannot be computed");
  const Conditions lab_on_paper = Of({{kLight, "D50"}, {kSpace, "CIELab"}, {kBase, "Paper"}});
  EXPECT_EQ(ReasonOf([&] {
              SpectrumOfColor({lab_on_paper, {60.0F, 2.0F, 1.0F}});
            }),
            "a reflectance spectrum of this colour" + why);
}

TEST(MeasureTest, LightsHaveATemperatureAndAnIndex) {
  const Conditions emission = Of({{kLight, "Emission"}});
  EXPECT_NEAR(ColorTemperature(Flat(1, emission)).value_or(0), 5455, 5) << "equal energy";
  std::vector<float> blue(36, 0.0F);
  blue[7] = 1.0F;
  EXPECT_FALSE(ColorTemperature({emission, blue}));
  EXPECT_FALSE(ColorTemperature(Flat(0, emission)));
  const ColorRendering rendering = ColorRenderingOf(Flat(1, emission));
  EXPECT_NEAR(rendering.index, 95.0F, 1.0F);
  EXPECT_EQ(rendering.reference, "D55");
  const Spectrum odd(emission, std::vector<float>(35, 1.0F));
  EXPECT_EQ(ReasonOf([&] { (void)ColorTemperature(odd); }),
            ReasonOf([&] { ColorRenderingOf(odd); }));
  EXPECT_NE(ReasonOf([&] { (void)ColorTemperature(odd); }).find("spectrum size"),
            std::string::npos);
}

/// Relative power of a black body, by Planck's law with the constants of the library.
Spectrum BlackBody(double kelvin, const Conditions& conditions, double scale = 1.0) {
  std::vector<float> values;
  for (int i = 0; i < 36; ++i) {
    const double metres = (380 + 10 * i) * 1e-9;
    values.push_back(static_cast<float>(scale * 1.19104678203084e-16 / std::pow(metres, 5) /
                                        (std::exp(0.014388443415906128 / (kelvin * metres)) - 1)));
  }
  return {conditions, values};
}

// Some stand on the locus to the last bit of u and v, where there is no direction towards it.
TEST(MeasureTest, BlackBodiesHaveTheirTemperatureAndAnIndex) {
  const Conditions emission = Of({{kLight, "Emission"}});
  for (int kelvin = 1000; kelvin <= 20000; kelvin += 10) {
    const Spectrum light = BlackBody(kelvin, emission);
    EXPECT_NEAR(ColorTemperature(light).value_or(0.0F), kelvin, 1 + kelvin * 1e-4) << kelvin;
    const ColorRendering rendering = ColorRenderingOf(light);
    const ColorRendering scaled = ColorRenderingOf(BlackBody(kelvin, emission, 1000.0));
    EXPECT_GT(rendering.index, 0.0F) << kelvin;
    EXPECT_NEAR(rendering.index, scaled.index, 1.0) << kelvin;
    EXPECT_EQ(rendering.reference, scaled.reference) << kelvin;
  }
}

// The search ends where the locus hardly moves, at half a million kelvin.
TEST(MeasureTest, DeepRedsHaveNoTemperature) {
  const Conditions emission = Of({{kLight, "Emission"}});
  std::vector<float> red(36, 0.0F);
  red[34] = 1.0F;  // 720 nm alone
  EXPECT_EQ(ColorTemperature({emission, red}), std::nullopt);
  EXPECT_EQ(ColorTemperature(BlackBody(985, emission)), std::nullopt);
  red[34] = 0.0F;
  red[20] = 1.0F;  // 580 nm alone, beside the locus
  EXPECT_NEAR(ColorTemperature({emission, red}).value_or(0.0F), 2589, 1);
}

TEST(MeasureTest, SaysWhyALightHasNeitherTemperatureNorIndex) {
  const Conditions ten = Of({{kLight, "Emission"}, {"Colorimetric.Observer", "TenDegree"}});
  const std::string why =
      "under the observer \"TenDegree\" the search for the colour temperature does not find the "
      "upper end of the black-body locus; ask for \"TwoDegree\"";
  EXPECT_EQ(ReasonOf([&] { (void)ColorTemperature(Flat(1, ten)); }), why);
  EXPECT_EQ(ReasonOf([&] { ColorRenderingOf(Flat(1, ten)); }), why);
  EXPECT_FALSE(ColorTemperature(Flat(0, ten))) << "dark";
  EXPECT_FALSE(ColorTemperature(Flat(std::nanf(""), ten)));
  EXPECT_EQ(ReasonOf([] { ColorRenderingOf(Flat(1)); }),
            "the colour rendering index is that of a light, and the conditions of this spectrum do "
            "not say \"Emission\" under \"Colorimetric.Illumination\"");
}

TEST(MeasureTest, DensitiesAndTheirCalibration) {
  const DensityOptions options{DensityStandardOf("ANSIT"), false};
  EXPECT_NEAR(DensitiesOf(Flat(0.01F), options).Of(DensityChannel::Magenta), 2.0, 1e-5);
  const ChannelDensity reported = DensityOf(Cyan(0.1F), DensityModeOf("Auto"), options);
  EXPECT_STREQ(NameOf(reported.channel), "Cyan");
  EXPECT_NEAR(reported.value, 1.0, 2e-3);
  EXPECT_NEAR(DensitySpectrumOf(Cyan(0.1F), false)[35], 1.0, 1e-6);
  EXPECT_EQ(MaximumDensityOf(Cyan(0.1F), false).wavelength, 580U);
  EXPECT_EQ(ReasonOf([] { DensityStandardOf("DIN 1"); }),
            "Colorimetric.DensityStandard: 'DIN 1' is not one of DIN, DINNB, ANSIA, ANSIE, ANSII, "
            "ANSIT, SPI, User; did you mean 'DIN'?");
  EXPECT_EQ(
      ReasonOf([] { DensityModeOf("Red"); }),
      "Colorimetric.DensityFilterMode: 'Red' is not one of Black, Cyan, Magenta, Yellow, Max, "
      "Auto");
  EXPECT_EQ(ReasonOf([&] { DensityOf(Flat(1), DensityMode::Max, options); }),
            "the densest band belongs to no channel");

  DensityCalibration calibration;
  calibration.slope.yellow = 2.0F;
  calibration.offset.yellow = 0.1F;
  SetDensityCalibration("Polarizer", options.standard, calibration);
  const Spectrum polarized = Flat(0.1F, Of({{"Physical.Filter", "Polarizer"}}));
  EXPECT_EQ(GetDensityCalibration("Polarizer", options.standard).slope.yellow, 2.0F);
  EXPECT_NEAR(DensitiesOf(polarized, options).yellow, 2.1, 1e-5);
  EXPECT_NEAR(DensitiesOf(polarized, {}).yellow, 1.0, 1e-5) << "another standard";
  EXPECT_NEAR(DensitiesOf(Flat(0.1F), options).yellow, 1.0, 1e-5) << "another filter";
  EXPECT_NEAR(UncalibratedDensitiesOf(polarized, options).yellow, 1.0, 1e-5);
  {
    const PaperWhite paper(Flat(0.5F));
    EXPECT_NEAR(DensitiesOf(polarized, {options.standard, true}).yellow, 2 * std::log10(5), 1e-5);
  }
  SetDensityCalibration("Polarizer", options.standard, {});
  EXPECT_NE(ReasonOf([&] { GetDensityCalibration("Nix", options.standard); }),
            "nothing was thrown");

  const DensityOptions user{DensityStandard::User, false};
  EXPECT_NEAR(DensitiesOf(Flat(1), user).cyan, 9.99, 1e-5);
  std::array<float, 36> curve{};
  curve[10] = 1.0F;
  SetUserDensityCurve(DensityChannel::Cyan, curve);
  EXPECT_NEAR(DensitiesOf(Flat(0.1F), user).cyan, 1.0, 1e-5) << "in force at once";
  EXPECT_EQ(GetUserDensityCurve(DensityChannel::Cyan), curve);
  ResetUserDensityCurves();
  EXPECT_NEAR(DensitiesOf(Flat(0.1F), user).yellow, -std::log10(3.6), 1e-5);
}

TEST(MeasureTest, PrintControlRelativeToNestedPapers) {
  constexpr auto kMode = DensityMode::Cyan;
  const auto area = [] {
    return DotArea(Cyan(0.1F), Cyan(0.55F), kMode, kDin);
  };
  const std::string why = "densities relative to paper cannot be computed: there is no paper white";
  EXPECT_EQ(ReasonOf(area), why);
  EXPECT_EQ(ReasonOf([] { PaperWhite({Of({}), {1.0F}}); }).substr(0, 7), "Illegal");
  EXPECT_THROW(PaperWhite{Sample("empty")}, ResourceNotAvailableException);
  {
    Sample white("white");
    white.AddSampleAttribute(SmartPointer<Spectrum>(new Spectrum(Flat(1))));
    const PaperWhite outer(white);
    EXPECT_NEAR(area(), 0.45 / 0.9, 1e-5);
    {
      const PaperWhite inner(Flat(0.8F));
      EXPECT_NEAR(area(), (0.8 - 0.55) / (0.8 - 0.1), 1e-5);
    }
    EXPECT_NEAR(area(), 0.45 / 0.9, 1e-5) << "the outer paper is back";
    EXPECT_NEAR(DotArea(Cyan(0.01F), Cyan(0.25F), kMode, kDin, 2.0F), 0.5 / 0.9, 1e-5);
    EXPECT_NEAR(Trapping(Flat(0.1F), Cyan(0.1F), Cyan(0.01F), kMode, kDin), 1.0, 1e-5);
    const ColorField field =
        RecognizeField(Cyan(0.37F), {{{1, 0, 0, 0}, {0, 1, 0, 0}, {0, 0, 1, 0}, {0, 0, 0, 1}}},
                       {25, 50, 75}, kDin);
    EXPECT_EQ(field.kind, FieldKind::Tint);
    EXPECT_EQ(field.channel, DensityChannel::Cyan);
    EXPECT_EQ(field.tone, 2);
    EXPECT_NEAR(field.dot_gain, 70.0 - 50.0, 1e-3);
    EXPECT_NEAR(field.densities.cyan, -std::log10(0.37), 1e-5);
  }
  EXPECT_EQ(ReasonOf(area), why);
  EXPECT_NEAR(PrintContrast(Cyan(0.01F), Cyan(0.1F), kMode, {}), 0.5, 1e-5);
  EXPECT_NEAR(Greyness(Cyan(0.1F), {}), 0.0, 1e-5);
  EXPECT_NEAR(HueError(Cyan(0.1F), {}), 0.0, 1e-5);
  EXPECT_EQ(ReasonOf([] { Greyness(Flat(1), {kDin, true}); }), why);
}

}  // namespace
