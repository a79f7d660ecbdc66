// Writes the page that sets published figures beside those of this library.  It takes no arguments;
// its output is docs/accuracy.md.

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <string>
#include <vector>

#include "aldermoor/tristim/internals/colormath.h"
#include "aldermoor/tristim/internals/data/testcolordata.h"
#include "aldermoor/tristim/internals/deltaemath.h"
#include "aldermoor/tristim/internals/densityfilter.h"
#include "aldermoor/tristim/internals/weightfactors.h"
#include "aldermoor/tristim/tristimservice.h"

#include "tests/tristim/measured.h"
#include "tests/tristim/published.h"
#include "tests/tristim/support.h"

namespace Aldermoor::Tristim::Tests {
namespace {

using namespace Internals;

/// One table of the page.  Every row compares one figure; the greatest difference ends the section.
class Section {
 public:
  Section(const char* title, const char* source, int decimals) : decimals_(decimals) {
    std::printf("\n## %s\n\nSource: %s.\n\n", title, source);
    std::printf("| quantity | published | here | difference |\n|---|---:|---:|---:|\n");
  }
  void Row(const std::string& quantity, double published, double here) {
    const double difference = here - published;
    greatest_ = std::max(greatest_, std::abs(difference));
    std::printf("| %s | %.*f | %.*f | %+.*f |\n", quantity.c_str(), decimals_, published, decimals_,
                here, decimals_, NotNegativeZero(difference));
  }
  void End(const char* departure = "") const {
    std::printf("\nGreatest difference: %.*f.%s%s\n", decimals_, greatest_,
                *departure == '\0' ? "" : " ", departure);
  }

 private:
  // -0.00 would depend on the last bit.
  double NotNegativeZero(double value) const {
    return std::abs(value) < 0.5 * std::pow(10.0, -decimals_) ? 0.0 : value;
  }

  int decimals_;
  double greatest_ = 0.0;
};

HXMeasureConditions Emission() {
  return Conditions("Emission", "TwoDegree", "CIEXYZ");
}

std::string Degrees(const char* observer) {
  return observer[1] == 'w' ? ", 2°" : ", 10°";
}

void WhitePoints() {
  Section section("White points", "ASTM E308-01, table 5, weights for 10 nm, as commonly cited", 3);
  for (const auto& [illumination, observer, x, z] : kPublishedWhites) {
    const Weightfactors weights(Conditions(illumination, observer));
    const std::string name = illumination + Degrees(observer);
    section.Row("X of " + name, x, Widen(weights.GetFilterSum(0)));
    section.Row("Z of " + name, z, Widen(weights.GetFilterSum(2)));
  }
  section.End(
      "By design: the published figures are sums of weights rounded to three decimals one by one;\n"
      "here the weights are not rounded.");
}

void Chromaticities() {
  Section section("Chromaticities of illuminants",
                  "CIE 15:2004 for the two-degree observer; B: CIE recommendation of 1931", 5);
  for (const auto& [illumination, x, y] : kChromaticities) {
    const Weightfactors weights(Conditions(illumination));
    const double sum = Widen(weights.GetFilterSum(0)) + 100.0 + Widen(weights.GetFilterSum(2));
    section.Row(std::string("x of ") + illumination, x, Widen(weights.GetFilterSum(0)) / sum);
    section.Row(std::string("y of ") + illumination, y, 100.0 / sum);
  }
  section.End(
      "Published to five decimals, for F1 to F12 to four.  By design: tables of 5 nm are\n"
      "interpolated to 1 nm before they are summed.");
}

void Chart() {
  Section section("A chart of 24 patches, D50, 2°",
                  "mean of 30 charts, x, y to four decimals and Y to two; spectra: "
                  "`examples/data/chart24.csv`",
                  4);
  const std::vector<Measured> chart = ReadFigures(ALDERMOOR_EXAMPLES "/data/chart24.csv");
  for (std::size_t i = 0; i < chart.size(); ++i) {
    const ChartPatch& patch = kChart24[i];
    const HXColorVector xyy = TristimService::GetVector(HXSpectrum(chart[i].values),
                                                        Conditions("D50", "TwoDegree", "CIExyY"));
    // Published figures come as floats; to four decimals they print as they were.
    section.Row(std::string("x of ") + patch.name, Widen(patch.x), Widen(xyy[0]));
    section.Row(std::string("y of ") + patch.name, Widen(patch.y), Widen(xyy[1]));
    section.Row(std::string("Y of ") + patch.name, Widen(patch.Y), Widen(xyy[2]));
  }
  section.End("By design: weights made from tables of 1 nm instead of a sum over 10 nm.");
}

void Ciede2000() {
  Section section("CIEDE2000",
                  "G. Sharma, W. Wu, E. N. Dalal, Color Res. Appl. 30, 21 (2005), table 1", 4);
  for (std::size_t i = 0; i < std::size(kPublished2000); ++i) {
    Quadruple lab[2] = {};
    for (std::size_t k = 0; k < 6; ++k) {
      lab[k / 3][k % 3] = static_cast<float>(kPublished2000[i][k]);
    }
    section.Row("pair " + std::to_string(i + 1), kPublished2000[i][6],
                Widen(DeltaE2000(lab[0], lab[1], {1.0F, 1.0F, 1.0F})));
  }
  section.End(
      "By design: the channels are single precision.  The hues of pair 10 are 180° apart, where\n"
      "the mean hue may be either of two, and its floats fall on the side of pair 11.");
}

void Temperatures() {
  Section section("Correlated colour temperatures, K", "CIE 15:2004", 0);
  for (const auto& [illumination, kelvin] : kTemperatures) {
    section.Row(
        illumination, kelvin,
        Widen(TristimService::GetColorTemperature(LampOf(illumination, false, Emission()))));
  }
  for (std::size_t i = 0; i < std::size(kFluorescents); ++i) {
    const std::string name = "F" + std::to_string(i + 1);
    const auto at_10nm = [&](bool averaged) {
      return Widen(TristimService::GetColorTemperature(LampOf(name, averaged, Emission())));
    };
    section.Row(name + ", averaged over the bands", kFluorescents[i].kelvin, at_10nm(true));
    section.Row(name + ", picked", kFluorescents[i].kelvin, at_10nm(false));
  }
  section.End(
      "By design: 36 bands instead of 5 nm, and c2 of 1.438844e-2 m·K (1.4388e-2 in the\n"
      "publication).  Values that are picked from a table leave out every second emission line.\n"
      "The figures of F1 to F12 are rounded to 10 K.");
}

void Rendering() {
  Section section("General colour rendering index Ra", "CIE 15:2004, by the method of CIE 13.3", 0);
  for (std::size_t i = 0; i < std::size(kFluorescents); ++i) {
    const std::string name = "F" + std::to_string(i + 1);
    for (const bool averaged : {true, false}) {
      float index = 0.0F;
      std::string reference;
      (void)TristimService::GetColorRenderingIndex(LampOf(name, averaged, Emission()), index,
                                                   reference);
      section.Row(name + (averaged ? ", averaged over the bands" : ", picked"),
                  kFluorescents[i].index, Widen(index));
    }
  }
  section.End(
      "By design: whole numbers; 36 bands; from 5000 K on the nearest of D50, D55, D65 and D75 is\n"
      "the reference, not the daylight of the same temperature; test colours as below.");
}

void TestColors() {
  // CIE 13.3-1995, table 1, every 50 nm from 400 nm.
  constexpr double kPublished[][7] = {{0.256, 0.225, 0.223, 0.253, 0.424, 0.45, 0.462},
                                      {0.111, 0.127, 0.207, 0.282, 0.342, 0.336, 0.328}};
  Section section("Test colours of the rendering index", "CIE 13.3-1995, table 1", 3);
  for (std::size_t sample = 0; sample < std::size(kPublished); ++sample) {
    for (std::size_t i = 0; i < 7; ++i) {
      section.Row(
          "sample " + std::to_string(sample + 1) + ", " + std::to_string(400 + 50 * i) + " nm",
          kPublished[sample][i], Widen(Data::kTestColors[sample][2 + 5 * i]));
    }
  }
  section.End(
      "By design: a band is the mean of the published 5 nm values, weighted 1:2:1, around the\n"
      "wavelength 5 nm below its own.");
}

void DensityCurves() {
  // By definition: colour curves add up to 1, the visual one to 100.
  constexpr const char* kStandards[] = {"DIN", "DINNB", "ANSIA", "ANSIE", "ANSII", "ANSIT", "SPI"};
  constexpr const char* kChannels[] = {"visual", "cyan", "magenta", "yellow"};
  Section section("Sums of the density curves", "their definition: no density on white", 6);
  for (int standard = 0; standard < 7; ++standard) {
    const DensityFilter filter(standard);
    for (unsigned short channel = 0; channel < 4; ++channel) {
      Filter curve = filter[channel];
      section.Row(std::string(kStandards[standard]) + ", " + kChannels[channel],
                  channel == 0 ? 100.0 : 1.0, Widen(curve.GetFilterSum()));
    }
  }
  section.End("The curves are those of tables with up to eight decimals; none is scaled.");
}

}  // namespace
}  // namespace Aldermoor::Tristim::Tests

int main() {
  using namespace Aldermoor::Tristim::Tests;
  std::printf(
      "# Accuracy\n\nWritten by `accuracy_page`, a program of the tests; the tests compare this "
      "page with its output.\nRenew it with `accuracy_page > docs/accuracy.md`.\n");
  WhitePoints();
  Chromaticities();
  Chart();
  Ciede2000();
  Temperatures();
  Rendering();
  TestColors();
  DensityCurves();
}
