#include <fstream>
#include <sstream>

#include <gtest/gtest.h>

#include "aldermoor/tristim/internals/colormath.h"
#include "aldermoor/tristim/tristimservice.h"

#include "tests/tristim/support.h"

namespace Aldermoor::Tristim::Tests {
namespace {

using namespace Aldermoor::Tests;

/// The colours published for the mean of 30 copies of the chart, under D50 and the two-degree
/// observer.  Source: project colour-science/colour, chromaticity_coordinates.py, average of 30.
struct ChartPatch {
  const char* name;
  float x, y, Y;
};

constexpr ChartPatch kChart24[] = {
    {"dark skin", 0.4325F, 0.3788F, 10.34F},    {"light skin", 0.4191F, 0.3748F, 35.25F},
    {"blue sky", 0.2761F, 0.3004F, 18.47F},     {"foliage", 0.3700F, 0.4501F, 13.35F},
    {"blue flower", 0.3020F, 0.2877F, 23.24F},  {"bluish green", 0.2856F, 0.3910F, 41.74F},
    {"orange", 0.5291F, 0.4075F, 31.17F},       {"purplish blue", 0.2339F, 0.2155F, 11.40F},
    {"moderate red", 0.5008F, 0.3293F, 19.79F}, {"purple", 0.3326F, 0.2556F, 6.44F},
    {"yellow green", 0.3989F, 0.4998F, 44.35F}, {"orange yellow", 0.4962F, 0.4428F, 43.58F},
    {"blue", 0.2040F, 0.1696F, 5.79F},          {"green", 0.3270F, 0.5033F, 23.07F},
    {"red", 0.5709F, 0.3298F, 12.68F},          {"yellow", 0.4694F, 0.4732F, 60.81F},
    {"magenta", 0.4177F, 0.2704F, 20.07F},      {"cyan", 0.2151F, 0.3037F, 19.03F},
    {"white 9.5", 0.3488F, 0.3628F, 91.29F},    {"neutral 8", 0.3451F, 0.3596F, 58.85F},
    {"neutral 6.5", 0.3446F, 0.3590F, 35.95F},  {"neutral 5", 0.3438F, 0.3589F, 19.12F},
    {"neutral 3.5", 0.3423F, 0.3576F, 8.93F},   {"black 2", 0.3439F, 0.3565F, 3.20F},
};

TEST(Chart24Test, EveryPatchHasThePublishedColor) {
  std::ifstream file(ALDERMOOR_EXAMPLES "/data/chart24.csv");
  std::string line;
  std::getline(file, line);  // the heads
  for (const ChartPatch& patch : kChart24) {
    SCOPED_TRACE(patch.name);
    std::getline(file, line);
    std::istringstream cells(line);
    std::string cell;
    std::getline(cells, cell, ',');  // the number
    std::getline(cells, cell, ',');
    ASSERT_EQ(cell, patch.name);
    std::vector<float> reflectance;
    while (std::getline(cells, cell, ',')) {
      reflectance.push_back(std::stof(cell));
    }
    const HXSpectrum spectrum(reflectance);

    const HXColorVector xyy =
        TristimService::GetVector(spectrum, Conditions("D50", "TwoDegree", "CIExyY"));
    EXPECT_TRUE(Near(xyy[0], static_cast<double>(patch.x), kChartChromaticity));
    EXPECT_TRUE(Near(xyy[1], static_cast<double>(patch.y), kChartChromaticity));
    EXPECT_TRUE(Near(xyy[2], static_cast<double>(patch.Y), kChartLuminance));

    // White for D50 and the two-degree observer as commonly cited from ASTM E308.
    const Internals::Triple published = Internals::LabFromXyz(
        {patch.x / patch.y * patch.Y, patch.Y, (1.0F - patch.x - patch.y) / patch.y * patch.Y},
        {96.422F, 100.0F, 82.521F});
    HXColorVector lab = TristimService::GetVector(spectrum, Conditions("D50"));
    lab -= HXColorVector(published[0], published[1], published[2], Conditions("D50"));
    EXPECT_LE(static_cast<double>(lab.Length()), kChartLab);
  }
}

}  // namespace
}  // namespace Aldermoor::Tristim::Tests
