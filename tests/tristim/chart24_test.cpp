#include <gtest/gtest.h>

#include "aldermoor/tristim/internals/colormath.h"
#include "aldermoor/tristim/tristimservice.h"

#include "tests/tolerances.h"
#include "tests/tristim/chart24data.h"
#include "tests/tristim/support.h"

namespace Aldermoor::Tristim::Tests {
namespace {

using namespace Aldermoor::Tests;

class Chart24Test : public ::testing::TestWithParam<ChartPatch> {};

TEST_P(Chart24Test, HasThePublishedChromaticityAndLuminance) {
  const ChartPatch& patch = GetParam();
  const HXColorVector color = TristimService::GetVector(HXSpectrum(patch.reflectance.data()),
                                                        Conditions("D50", "TwoDegree", "CIExyY"));
  EXPECT_TRUE(
      Within(static_cast<double>(color[0]), static_cast<double>(patch.x), kChartChromaticity));
  EXPECT_TRUE(
      Within(static_cast<double>(color[1]), static_cast<double>(patch.y), kChartChromaticity));
  EXPECT_TRUE(Within(static_cast<double>(color[2]), static_cast<double>(patch.Y), kChartLuminance));
}

TEST_P(Chart24Test, HasThePublishedLab) {
  const ChartPatch& patch = GetParam();
  HXColorVector lab =
      TristimService::GetVector(HXSpectrum(patch.reflectance.data()), Conditions("D50"));
  // White of ASTM E308 for D50 and the two-degree observer.
  const Internals::Triple published = Internals::LabFromXyz(
      {patch.x / patch.y * patch.Y, patch.Y, (1.0F - patch.x - patch.y) / patch.y * patch.Y},
      {96.422F, 100.0F, 82.521F});
  lab -= HXColorVector(published[0], published[1], published[2], Conditions("D50"));
  EXPECT_LE(static_cast<double>(lab.Length()), kChartLab);
}

INSTANTIATE_TEST_SUITE_P(Patches, Chart24Test, ::testing::ValuesIn(kChart24));

}  // namespace
}  // namespace Aldermoor::Tristim::Tests
