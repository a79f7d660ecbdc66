// Requests for which memory runs out while their lamp takes the place of another: what is asked
// next is computed with the weights of its own lamp.

#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "aldermoor/tristim/hxcolorvector.h"
#include "aldermoor/tristim/hxspectrum.h"
#include "aldermoor/tristim/tristimservice.h"

#include "tests/faults/interposition.h"

namespace Aldermoor::Vexdoc::Testing {
namespace {

using Tristim::HXColorVector;
using Tristim::HXMeasureConditions;
using Tristim::HXSpectrum;
using Tristim::TristimService;

HXSpectrum Slope(float first, float step) {
  std::vector<float> values;
  for (unsigned i = 0; i < HXSpectrum::kBands; ++i) {
    values.push_back(first + step * static_cast<float>(i));
  }
  return HXSpectrum(values);
}

// With conditions of the user's own, so that the copy of them needs memory.
HXMeasureConditions Under(const std::string& illuminant, const std::string& observer) {
  HXMeasureConditions conditions;
  conditions.SetMeasureCondition("CustomCondition", "Enable");
  conditions.SetMeasureCondition("Own", std::string(40, 'x'));
  conditions.SetMeasureCondition("Physical.SpectrumType", std::string(40, 'y'));
  conditions.SetMeasureCondition("ColorSpaceDescription.Type", "CIEXYZ");
  conditions.SetMeasureCondition("Colorimetric.Observer", observer);
  if (illuminant.empty()) {
    conditions.SetUserdefinedIllumination(Slope(100.0F, -2.0F));
  } else {
    conditions.SetMeasureCondition("Colorimetric.Illumination", illuminant);
  }
  return conditions;
}

std::vector<float> Values(const HXColorVector& color) {
  return {color[0], color[1], color[2]};
}

TEST(WeightsTest, BelongToTheLampThatIsAskedAlsoBehindAFailure) {
  const HXSpectrum sample = Slope(0.1F, 0.02F);
  const std::vector<HXMeasureConditions> lamps = {
      Under("A", "TwoDegree"),       Under("F11", "TwoDegree"),
      Under("A", "TenDegree"),       Under("Dxx, Temperature:6500", "TwoDegree"),
      Under("", "TwoDegree"),        Under("", "TwoDegree"),  // another curve object
      Under("Emission", "TwoDegree")};
  std::vector<std::vector<float>> expected;
  for (const HXMeasureConditions& lamp : lamps) {
    expected.push_back(Values(TristimService::GetVector(sample, lamp)));
  }
  int failures = 0;
  for (std::size_t from = 0; from < lamps.size(); ++from) {
    const std::size_t to = (from + 1) % lamps.size();
    Outcome outcome;
    for (long number = 1; number == 1 || outcome.was_reached; ++number) {
      SCOPED_TRACE(std::to_string(from) + " allocation " + std::to_string(number));
      for (const std::size_t next : {from, to}) {
        (void)TristimService::GetVector(sample, lamps[from]);
        outcome = RunWith({Fault::kAllocation, number},
                          [&] { (void)TristimService::GetVector(sample, lamps[to]); });
        failures += outcome.has_failed ? 1 : 0;
        EXPECT_TRUE(!outcome.has_failed || outcome.is_traceable);
        EXPECT_EQ(Values(TristimService::GetVector(sample, lamps[next])), expected[next]);
      }
    }
  }
  EXPECT_GT(failures, 100);
}

template <class Value, class Assign>
void ExpectWholeOrUnchanged(const Value& old, const Value& other, Assign assign) {
  Outcome outcome;
  for (long number = 1; number == 1 || outcome.was_reached; ++number) {
    SCOPED_TRACE(number);
    Value value = old;
    outcome = RunWith({Fault::kAllocation, number}, [&] { assign(value); });
    EXPECT_EQ(outcome.has_failed, outcome.was_reached);
    EXPECT_EQ(value, outcome.has_failed ? old : other);
  }
  EXPECT_GT(outcome.calls, 0);
}

TEST(WeightsTest, ValuesAndTheirConditionsAreReplacedTogether) {
  const HXMeasureConditions a = Under("A", "TenDegree");
  const HXMeasureConditions d50 = Under("D50", "TwoDegree");
  ExpectWholeOrUnchanged(a, d50, [&](HXMeasureConditions& value) { value = d50; });
  const HXColorVector red(1.0F, 2.0F, 3.0F, a);
  const HXColorVector blue(4.0F, 5.0F, 6.0F, d50);
  ExpectWholeOrUnchanged(red, blue, [&](HXColorVector& value) { value = blue; });
  const HXSpectrum curve = Slope(1.0F, 1.0F);
  HXMeasureConditions own = a;
  own.SetUserdefinedIllumination(curve);
  ExpectWholeOrUnchanged(
      a, own, [&](HXMeasureConditions& value) { value.SetUserdefinedIllumination(curve); });
}

}  // namespace
}  // namespace Aldermoor::Vexdoc::Testing
