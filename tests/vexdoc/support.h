#ifndef ALDERMOOR_TESTS_VEXDOC_SUPPORT_H
#define ALDERMOOR_TESTS_VEXDOC_SUPPORT_H

#include <initializer_list>
#include <string>
#include <utility>
#include <vector>

#include <gtest/gtest.h>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/tools/smartpointer.h"
#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/conditions.h"
#include "aldermoor/vexdoc/spectrum.h"

#include "tests/tolerances.h"
#include "tests/utilities/messageof.h"

namespace Aldermoor::Vexdoc::Tests {

using Aldermoor::Tests::MessageOf;
using Keys = std::vector<std::string>;
using Missing = Utilities::Exceptions::ResourceNotAvailableException;
using Pairs = std::initializer_list<std::pair<const char*, const char*>>;
using Utilities::Exceptions::NullPointerException;
using Utilities::Tools::IsSame;
using Utilities::Tools::SmartPointer;
using Values = std::vector<float>;

inline constexpr char kTypeKey[] = "ColorSpaceDescription.Type";
inline constexpr char kIlluminationKey[] = "Colorimetric.Illumination";
inline constexpr char kObserverKey[] = "Colorimetric.Observer";

inline Conditions With(Pairs attributes) {
  Conditions conditions;
  for (const auto& [key, value] : attributes) {
    conditions.AddAttribute(key, value);
  }
  return conditions;
}

/// What a colour in `color_space` needs to say.
inline Conditions ColorConditions(const char* color_space, const char* illumination = "D50") {
  return With(
      {{kTypeKey, color_space}, {kIlluminationKey, illumination}, {kObserverKey, "TwoDegree"}});
}

inline ColorVector Lab(float lightness, float a, float b) {
  return ColorVector(ColorConditions("CIELab"), Values{lightness, a, b});
}

/// What a spectrum needs to say.
inline Conditions SpectrumConditions() {
  return With({{"Physical.WavelengthSpectrumMin", "380nm"},
               {"Physical.WavelengthSpectrumMax", "730nm"},
               {"Physical.NumberOfDataPointsSpectrum", "36"},
               {"Physical.SpectrumType", "Remission"}});
}

inline Spectrum Flat(float value, std::size_t count = 36) {
  return Spectrum(SpectrumConditions(), Values(count, value));
}

/// A copy of `attribute` behind a pointer, under a name.
template <class Attribute>
SmartPointer<SampleAttribute> Shared(const Attribute& attribute, const std::string& name = "") {
  SmartPointer<SampleAttribute> pointer(new Attribute(attribute));
  pointer->SetName(name);
  return pointer;
}

/// Both operators, which must contradict each other.
inline bool Equal(const SampleAttribute& first, const SampleAttribute& second) {
  EXPECT_NE(first == second, first != second);
  return first == second;
}

/// The keys of a list of pairs, in order.
template <class List>
Keys KeysOf(const List& list) {
  Keys keys;
  for (const auto& entry : list) {
    keys.push_back(entry.first);
  }
  return keys;
}

/// Why `attribute` cannot be turned into a `type`.
template <class Attribute>
std::string Refusal(Attribute attribute, const std::string& type, const Conditions& target = {}) {
  return MessageOf<Missing>([&] { attribute.TransformTo(type, target); });
}

inline void ExpectColor(const SmartPointer<SampleAttribute>& color,
                        const std::vector<double>& expected,
                        double tolerance = Aldermoor::Tests::kSinglePrecisionFormula) {
  const Values& values = dynamic_cast<const ColorVector&>(*color).GetData();
  ASSERT_EQ(values.size(), expected.size());
  for (std::size_t i = 0; i < values.size(); ++i) {
    EXPECT_TRUE(Aldermoor::Tests::Within(static_cast<double>(values[i]), expected[i], tolerance))
        << "channel " << i;
  }
}

}  // namespace Aldermoor::Vexdoc::Tests

#endif  // ALDERMOOR_TESTS_VEXDOC_SUPPORT_H
