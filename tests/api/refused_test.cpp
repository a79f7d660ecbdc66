// Words and values that are none, at every door of colorimetry for users.

#include <array>
#include <cmath>
#include <string>

#include <gtest/gtest.h>

#include "aldermoor/measure/colordifference.h"
#include "aldermoor/measure/context.h"
#include "aldermoor/measure/density.h"
#include "aldermoor/measure/judgement.h"
#include "aldermoor/measure/light.h"
#include "aldermoor/measure/paperwhite.h"
#include "aldermoor/measure/printcontrol.h"

#include "measuresupport.h"

namespace {

using namespace MeasureTests;

using Action = void (*)();

struct Refused {
  const char* what;
  Action run;
  const char* text;  // with which the message begins
};

ColorVector LabWith(const std::string& key, const std::string& word) {
  return {Of({{kLight, "D50"}, {kSpace, "CIELab"}, {key, word}}), {50.0F, 1.0F, 2.0F}};
}

const Spectrum kGray = Flat(0.5F);
const Conditions kNoCurve = Of({{kLight, "Userdefined"}});
const std::string kFilter = "Physical.Filter";

constexpr DensityStandard kNoStandard = static_cast<DensityStandard>(8);
constexpr DensityMode kNoMode = static_cast<DensityMode>(-1);
constexpr DensityChannel kNoChannel = static_cast<DensityChannel>(4);

const Refused kRefused[] = {
    {"formula",
     [] {
       ColorDifference(kGray, kGray, Of({{kFormula, "CIEDE2000"}}));
     },
     "ColorSpaceDescription.DeltaEFormula: 'CIEDE2000' is not one of CIELab, CIELuv, LABhx, FMCII, "
     "CMC, 94, 2000; did you mean '2000'?"},
    {"illuminant",
     [] {
       ColorDifference(kGray, kGray, Of({{kLight, "d50"}}));
     },
     "Colorimetric.Illumination: 'd50' is not one of A, B,"},
    {"illuminant that was read as a number",
     [] {
       ColorDifference(kGray, kGray, Of({{kLight, "D93"}}));
     },
     "Colorimetric.Illumination: 'D93' is not"},
    {"kind of the first",
     [] {
       ColorDifference(Flat(1, Of({{kLight, "emission"}})), kGray, {});
     },
     "Colorimetric.Illumination: 'emission' is not"},
    {"kind of the second",
     [] {
       ColorDifference(kGray, Flat(1, Of({{kLight, "emission"}})), {});
     },
     "Colorimetric.Illumination: 'emission' is not"},
    {"white base",
     [] {
       ColorDifference(kGray, kGray, Of({{kBase, "paper"}}));
     },
     "Colorimetric.WhiteBase: 'paper' is not"},
    {"no curve", [] { ColorDifference(kGray, kGray, kNoCurve); },
     "Colorimetric.Illumination is \"Userdefined\" and there is no custom illumination"},
    {"formula of colours",
     [] { ColorDifference(LabWith(kFormula, "76"), LabWith(kFormula, "CIELab")); },
     "ColorSpaceDescription.DeltaEFormula: '76' is not"},
    {"observer of colours",
     [] { ColorDifference(LabWith(kFormula, "94"), LabWith("Colorimetric.Observer", "10")); },
     "Colorimetric.Observer: '10' is not"},
    {"difference vector", [] { DifferenceVector(LabWith(kLight, "d65"), LabWith(kLight, "D65")); },
     "Colorimetric.Illumination: 'd65' is not"},
    {"family",
     [] {
       ColorFamily(Flat(0.5F, Of({{kLight, "Daylight"}})));
     },
     "Colorimetric.Illumination: 'Daylight' is not"},
    {"conditions of metamerism",
     [] {
       MetamerismIndex(kGray, kGray, Of({{kLight, "d50"}}), Of({{kLight, "A"}}));
     },
     "Colorimetric.Illumination: 'd50' is not"},
    {"test light",
     [] {
       MetamerismIndex(kGray, kGray, Of({}), Of({{kLight, "f11"}}));
     },
     "Colorimetric.Illumination: 'f11' is not"},
    {"reconstruction", [] { SpectrumOfColor(LabWith(kLight, "d50")); },
     "Colorimetric.Illumination: 'd50' is not"},
    {"temperature",
     [] {
       (void)ColorTemperature(Flat(1, Of({{kLight, "Emission"}, {"Colorimetric.Observer", "2"}})));
     },
     "Colorimetric.Observer: '2' is not"},
    {"rendering",
     [] {
       ColorRenderingOf(Flat(1, Of({{kLight, "emission"}})));
     },
     "Colorimetric.Illumination: 'emission' is not"},
    {"filter",
     [] {
       DensitiesOf(Flat(1, Of({{kFilter, "Pol"}})), {});
     },
     "Physical.Filter: 'Pol' is not one of No, Polarizer,"},
    {"filter of a channel",
     [] {
       DensityOf(Flat(1, Of({{kFilter, "Pol"}})), DensityMode::Cyan, {});
     },
     "Physical.Filter: 'Pol' is not"},
    {"filter of a tint",
     [] {
       PrintContrast(kGray, Flat(1, Of({{kFilter, "Pol"}})), DensityMode::Cyan, {});
     },
     "Physical.Filter: 'Pol' is not"},
    {"filter of greyness",
     [] {
       Greyness(Flat(1, Of({{kFilter, "Pol"}})), {});
     },
     "Physical.Filter: 'Pol' is not"},
    {"filter of a hue error",
     [] {
       HueError(Flat(1, Of({{kFilter, "Pol"}})), {});
     },
     "Physical.Filter: 'Pol' is not"},
    {"filter of a calibration", [] { GetDensityCalibration("pol", kDin); },
     "Physical.Filter: 'pol' is not"},
    {"mode of a dot area", [] { DotArea(kGray, kGray, kNoMode, kDin); },
     "there is no density filter mode -1"},
    {"mode of a density", [] { DensityOf(kGray, kNoMode, {}); },
     "there is no density filter mode -1"},
    {"mode of a contrast", [] { PrintContrast(kGray, kGray, kNoMode, {}); },
     "there is no density filter mode -1"},
    {"mode of a trapping", [] { Trapping(kGray, kGray, kGray, kNoMode, kDin); },
     "there is no density filter mode -1"},
    {"standard of densities", [] { UncalibratedDensitiesOf(kGray, {kNoStandard}); },
     "there is no density standard 8"},
    {"standard of a field", [] { RecognizeField(kGray, {}, {}, kNoStandard); },
     "there is no density standard 8"},
    {"standard of a calibration", [] { SetDensityCalibration("No", kNoStandard, {}); },
     "there is no density standard 8"},
    {"name of a channel", [] { NameOf(kNoChannel); }, "there is no density channel 4"},
    {"one of the densities", [] { (void)Densities().Of(kNoChannel); },
     "there is no density channel 4"},
    {"curve that is read", [] { GetUserDensityCurve(kNoChannel); },
     "there is no density channel 4"},
    {"curve that is set", [] { SetUserDensityCurve(kNoChannel, std::array<float, 36>{}); },
     "there is no density channel 4"},
    {"factor 0", [] { DotArea(kGray, kGray, DensityMode::Cyan, kDin, 0.0F); },
     "the Yule-Nielsen factor is 0.000000 and has to be a number above 0"},
    {"factor below 0", [] { DotArea(kGray, kGray, DensityMode::Cyan, kDin, -2.0F); },
     "the Yule-Nielsen factor is -2"},
    {"factor that is no number",
     [] { DotArea(kGray, kGray, DensityMode::Cyan, kDin, std::nanf("")); },
     "the Yule-Nielsen factor is nan"},
    {"context",
     [] {
       Context context(Of({{kSpace, "XYZ"}}));
     },
     "ColorSpaceDescription.Type: 'XYZ' is not one of CIELab, CIELCh,"},
    {"formula of a context",
     [] {
       Context context(Of({{kFormula, "CIEDE2000"}}));
     },
     "ColorSpaceDescription.DeltaEFormula: 'CIEDE2000' is not"},
    {"source of a context",
     [] {
       Context context({}, Of({{kSpace, "Lab"}}));
     },
     "ColorSpaceDescription.Type: 'Lab' is not"},
    {"light of a context",
     [] {
       Context context({}, Of({{kLight, "emission"}}));
     },
     "Colorimetric.Illumination: 'emission' is not"},
    {"context without a curve", [] { Context context(kNoCurve); },
     "Colorimetric.Illumination is \"Userdefined\" and there is no custom illumination"},
};

TEST(MeasureTest, RefusesWordsAndValuesThatAreNone) {
  const PaperWhite paper(Flat(1));
  for (const Refused& refused : kRefused) {
    const std::string reason = ReasonOf(refused.run);
    EXPECT_EQ(reason.substr(0, std::string(refused.text).size()), refused.text)
        << refused.what << ": " << reason;
  }
  Conditions short_curve = kNoCurve;
  short_curve.SetCustomIllumination({Of({}), {1.0F, 2.0F}});
  EXPECT_EQ(ReasonOf([&] { Context context(short_curve); }),
            "Colorimetric.Illumination is \"Userdefined\" and the custom illumination has 2 values "
            "instead of 36");
}

}  // namespace
