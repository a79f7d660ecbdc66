#include "aldermoor/measure/context.h"

#include <cmath>

#include <gtest/gtest.h>

#include "aldermoor/measure/measureexception.h"

#include "tests/measure/support.h"
#include "tests/utilities/messageof.h"

namespace Aldermoor::Measure::Tests {
namespace {

using Aldermoor::Tests::MessageOf;

struct Failure {
  const char* what;
  void (*run)();
  const char* text;
};

constexpr std::array<float, 72> kTwoSpectra = {};

const Failure kFailures[] = {
    {"no way from spectra",
     [] {
       std::array<float, 6> out;
       Context(Words({{kSpace, "CMYK"}})).ConvertSpectra(kTwoSpectra, out);
     },
     "GetVector not supported for ColorSpace CMYK"},
    {"no way from colours",
     [] {
       std::array<float, 3> out;
       Context(Words({{kSpace, "RGB"}}), Words({{kSpace, "CIELCh"}}))
           .ConvertColors(std::array{50.0F, 1.0F, 2.0F}, out);
     },
     "Conversion not supported from ColorSpace CIELCh to ColorSpace CIELab"},
    {"no paper",
     [] {
       std::array<float, 6> out;
       Context(Words({{kWhiteBase, "Paper"}})).ConvertSpectra(kTwoSpectra, out);
     },
     "the colours cannot be computed: the white base is \"Paper\" and there is no paper white"},
    {"no light",
     [] {
       std::array<float, 6> out;
       Context(Words({{kIllumination, "Undefined"}})).ConvertSpectra(kTwoSpectra, out);
     },
     "Unsupported Illumination type"},
    {"formula of spectra only",
     [] {
       std::array<float, 1> out;
       Context(Words({{kFormula, "FMCII"}}))
           .CompareColors(std::array{50.0F, 1.0F, 2.0F}, std::array{50.0F, 1.0F, 2.0F}, out);
     },
     "the colour difference \"FMCII\" of two colours cannot be computed"},
    {"curves of the process",
     [] {
       std::array<float, 8> out;
       Context(Conditions()).MeasureDensities(kTwoSpectra, {DensityStandard::User, false}, out);
     },
     "the density standard \"User\" has curves of the process, which a context does not use"},
    {"densities without paper",
     [] {
       std::array<float, 8> out;
       Context(Conditions()).MeasureDensities(kTwoSpectra, {DensityStandard::DIN, true}, out);
     },
     "densities relative to paper cannot be computed: there is no paper white"},
    {"broken row",
     [] {
       std::array<float, 3> out;
       Context(Conditions()).ConvertSpectra(std::span(kTwoSpectra).first(40), out);
     },
     "the spectra have 40 values, which are no rows of 36"},
    {"broken row behind a gap",
     [] {
       std::array<float, 3> out;
       Context(Conditions()).ConvertSpectra({std::span(kTwoSpectra).first(66), 40}, out);
     },
     "the spectra have 66 values, which are no rows of 36, 40 apart"},
    {"no standard of densities",
     [] {
       std::array<float, 8> out;
       Context(Conditions()).MeasureDensities(kTwoSpectra, {static_cast<DensityStandard>(42)}, out);
     },
     "there is no density standard 42"},
    {"broken output",
     [] {
       std::array<float, 5> out;
       Context(Conditions()).ConvertSpectra(kTwoSpectra, out);
     },
     "the colours have 5 values, which are no rows of 3"},
    {"too small an output",
     [] {
       std::array<float, 3> out;
       Context(Conditions()).ConvertSpectra(kTwoSpectra, out);
     },
     "the input has 2 rows and the output 1"},
    {"rows that do not pair",
     [] {
       std::array<float, 3> out;
       const std::array<float, 9> three{};
       Context(Conditions()).CompareColors(std::span(three).first(6), three, out);
     },
     "2 rows and 3 rows do not make 3 differences"},
};

TEST(ContextTest, SaysWhyItCannotCompute) {
  for (const Failure& failure : kFailures) {
    EXPECT_EQ(MessageOf<MeasureException>(failure.run), failure.text) << failure.what;
  }
}

TEST(ContextTest, ConvertsInPlaceAndReadsAnyStride) {
  const Context to_lab(Words({{kSpace, "CIELab"}}), Words({{kSpace, "CIEXYZ"}}));
  Numbers numbers(7);
  std::vector<float> colors(3 * 1000);
  for (float& value : colors) {
    value = numbers.Uniform(0.0F, 100.0F);
  }
  std::vector<float> lab(colors.size());
  to_lab.ConvertColors(colors, lab);
  to_lab.ConvertColors(colors, colors);
  EXPECT_EQ(colors, lab);

  const std::vector<float> dense = numbers.Spectra(100);
  std::vector<float> wide(100 * 40 - 4);  // the last row ends with its last band
  for (std::size_t i = 0; i < dense.size(); ++i) {
    wide[i / kBands * 40 + i % kBands] = dense[i];
  }
  std::vector<float> expected(400);
  std::vector<float> densities(400);
  to_lab.MeasureDensities(dense, {}, expected);
  to_lab.MeasureDensities({wide, 40}, {}, densities);
  EXPECT_EQ(densities, expected);
  to_lab.ConvertColors({}, {});
}

// Black takes the chromaticity of its light; relative to a paper that is not there it has none.
TEST(ContextTest, MarksRowsWithoutColor) {
  const std::array<float, 9> xyz = {20.0F, 30.0F, 40.0F, 0.0F, 0.0F, 0.0F, 1.0F, 2.0F, 3.0F};
  std::array<float, 9> xyy{};
  const Conditions target = Words({{kSpace, "CIExyY"}});
  EXPECT_EQ(Context(target, Words({{kSpace, "CIEXYZ"}})).ConvertColors(xyz, xyy), 0U);
  EXPECT_NEAR(static_cast<double>(xyy[3]), 0.3127, 5e-5);  // D65, CIE 15:2004
  EXPECT_NEAR(static_cast<double>(xyy[4]), 0.3290, 5e-5);
  const Conditions relative = Words({{kSpace, "CIEXYZ"}, {kWhiteBase, "Paper"}});
  EXPECT_EQ(Context(target, relative).ConvertColors(xyz, xyy), 1U);
  EXPECT_TRUE(std::isnan(xyy[3]) && std::isnan(xyy[5]));
  EXPECT_EQ(xyy[8], 2.0F);
}

}  // namespace
}  // namespace Aldermoor::Measure::Tests
