#include <gtest/gtest.h>

#include "aldermoor/tristim/internals/colormath.h"
#include "aldermoor/tristim/tristimservice.h"

#include "tests/tristim/measured.h"
#include "tests/tristim/published.h"
#include "tests/tristim/support.h"

namespace Aldermoor::Tristim::Tests {
namespace {

using namespace Aldermoor::Tests;

TEST(Chart24Test, EveryPatchHasThePublishedColor) {
  const std::vector<Measured> chart = ReadFigures(ALDERMOOR_EXAMPLES "/data/chart24.csv");
  ASSERT_EQ(chart.size(), std::size(kChart24));
  for (std::size_t i = 0; i < chart.size(); ++i) {
    const ChartPatch& patch = kChart24[i];
    SCOPED_TRACE(patch.name);
    ASSERT_EQ(chart[i].name, patch.name);
    const HXSpectrum spectrum(chart[i].values);

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
