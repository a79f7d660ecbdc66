#include "aldermoor/vexdoc/colorvector.h"

#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "aldermoor/tristim/hxcolorvector.h"
#include "aldermoor/tristim/tristimexception.h"
#include "aldermoor/vexdoc/colorimetrybridge.h"
#include "aldermoor/vexdoc/vexexception.h"

#include "tests/vexdoc/support.h"

namespace Aldermoor::Vexdoc::Tests {
namespace {

using Channels = std::vector<std::pair<std::string, float>>;

const Channels kOdd = {{"a", 1}, {"b", 2}, {"c", 3}};

const Channels& ChannelsOf(const SmartPointer<SampleAttribute>& color) {
  return dynamic_cast<const ColorVector&>(*color).GetDatastore();
}

/// The message of the `E` that comes from such a vector, with labels and without.
template <class E>
std::string Message(const Conditions& conditions, std::size_t channels) {
  const std::string bare = MessageOf<E>([&] { ColorVector(conditions, Values(channels)); });
  EXPECT_EQ(MessageOf<E>([&] { ColorVector(conditions, Channels(channels)); }), bare);
  return bare;
}

TEST(ColorVectorTest, BareValuesGetTheLabelsOfAbsoluteColorsAndOthersKeepTheirOwn) {
  Conditions delta = ColorConditions("CIELab");
  delta.AddAttribute("ColorSpaceDescription.AbsoluteOrDeltaVector", "DeltaVector");
  EXPECT_EQ(ColorVector(delta, Values{1, 2, 3}).GetDatastore(),
            Channels({{"L*", 1}, {"a*", 2}, {"b*", 3}}));
  EXPECT_EQ(ColorVector(ColorConditions("CMYK"), Values{1, 2, 3, 4}).GetDatastore(),
            Channels({{"C", 1}, {"M", 2}, {"Y", 3}, {"K", 4}}));
  EXPECT_EQ(ColorVector(delta, kOdd).GetDatastore(), kOdd);
}

TEST(ColorVectorTest, ConditionsAndChannelsMustFitEachOther) {
  const auto size = [](const char* space, std::size_t channels) {
    return MessageOf<VexParseException>(
        [&] { ColorVector(ColorConditions(space), Channels(channels)); });
  };
  EXPECT_EQ(size("CIELab", 2),
            "Inconsistent ColorVector-size(expected 3 but got 2 elements for colorspace CIELab)");
  EXPECT_EQ(size("CMYK", 3),
            "Inconsistent ColorVector-size(expected 4 but got 3 elements for colorspace CMYK)");
  // Of bare values only those without a label are too many.
  EXPECT_EQ(MessageOf<VexParseException>([] { ColorVector(ColorConditions("RGB"), Values(7)); }),
            "Inconsistent ColorVector-size(expected 3 but got 7 elements for colorspace RGB)");
  EXPECT_NO_THROW(ColorVector(With({{kTypeKey, "RGB"}}), Values(3))) << "needs no viewing";
  EXPECT_NO_THROW(ColorVector(With({{kTypeKey, "CMYK"}}), Channels(4)));
  EXPECT_EQ(Message<MissingConditionException>(With({{kTypeKey, "CIELab"}}), 3),
            "missing mandatory condition 'Colorimetric.Illumination'");
  EXPECT_EQ(
      Message<MissingConditionException>(With({{kTypeKey, "CIELab"}, {kIlluminationKey, ""}}), 3),
      "missing mandatory condition 'Colorimetric.Observer'");
  EXPECT_EQ(Message<Missing>(Conditions(), 3),
            "Condition Attribute <ColorSpaceDescription.Type> not found");
  EXPECT_EQ(MessageOf<Tristim::TristimException>(
                [] { ColorVector(ColorConditions("Munsell"), Values(3)); }),
            "Munsell is not a valid color space");
}

TEST(ColorVectorTest, AnUnknownSchemeHoldsAnythingAndCanOnlyReappear) {
  ColorVector vector(With({{kTypeKey, "Munsell"}}), Channels{{"hue", 5}});
  EXPECT_FALSE(vector.IsStandardColorSpace());
  const auto copy = vector.TransformTo("VEXColorVector", With({{kTypeKey, "Munsell"}, {"a", "b"}}));
  EXPECT_EQ(ChannelsOf(copy), vector.GetDatastore());
  const std::string refusal = "no idea howto transform color-scheme";
  EXPECT_EQ(Refusal(vector, "VEXColorVector", ColorConditions("CIELab")), refusal);
  EXPECT_EQ(Refusal(vector, "VEXSpectrum", With({{kTypeKey, "Munsell"}})), refusal);
  EXPECT_EQ(Refusal(vector, "VEXColorVector"),
            "Condition Attribute <ColorSpaceDescription.Type> not found");
}

TEST(ColorVectorTest, IsEqualByConditionsAloneAndCopiesShareTheChannels) {
  const ColorVector first = Lab(1, 2, 3);
  ColorVector second = Lab(4, 5, 6);
  EXPECT_TRUE(first == second && !(first != second));
  EXPECT_FALSE(Equal(first, ColorVector(ColorConditions("CIELab", "A"), Values{1, 2, 3})));
  EXPECT_FALSE(Equal(first, Flat(1)));
  const Values& held = first.GetData();
  EXPECT_EQ(held, Values({1, 2, 3}));
  EXPECT_EQ(&second.GetData(), &held) << "the list of values is one for the process";
  EXPECT_EQ(held, Values({4, 5, 6}));
  second.Assign(Flat(1));
  EXPECT_EQ(second.GetData(), Values({4, 5, 6}));
  second.Assign(first);
  EXPECT_EQ(&second.GetDatastore(), &first.GetDatastore());
}

TEST(ColorVectorTest, WithoutChannelsEveryUseIsAFailure) {
  const std::string message = "accessed null pointer (class Aldermoor::Vexdoc::ColorScheme)";
  ColorVector vector;
  EXPECT_EQ(MessageOf<NullPointerException>([&] { vector.GetData(); }), message);
  EXPECT_EQ(MessageOf<NullPointerException>([&] { vector.GetDatastore(); }), message);
  EXPECT_EQ(
      MessageOf<NullPointerException>([&] { vector.TransformTo("VEXColorVector", Conditions()); }),
      message);
}

TEST(ColorVectorTest, IsConvertedByTheFormulasOfThePublications) {
  struct Case {
    const char* from;
    Values values;
    const char* to;
    Keys labels;
    std::vector<double> expected;
  };
  for (const Case& c : std::vector<Case>{
           // C = sqrt(20² + 10²), h = atan(10 / 20)
           {"CIELab", {50, 20, 10}, "CIELCh", {"L*", "C*", "h*"}, {50, 22.36068, 26.56505}},
           {"CIELuv", {50, 3, 4}, "CIELChuv", {"L", "C", "h"}, {50, 5, 53.130102}},
           {"CIEXYZ", {20, 30, 50}, "CIExyY", {"x", "y", "Y"}, {0.2, 0.3, 30}},
       }) {
    ColorVector vector(ColorConditions(c.from), c.values);
    // Another illumination cannot be met and does not count.
    const auto result = vector.TransformTo("VEXColorVector", ColorConditions(c.to, "A"));
    EXPECT_TRUE(result->IsDerived());
    EXPECT_EQ(result->GetConditions()->GetAttribute(kTypeKey), c.to);
    EXPECT_EQ(result->GetConditions()->GetAttribute(kIlluminationKey), "D50");
    EXPECT_EQ(KeysOf(ChannelsOf(result)), c.labels);
    ExpectColor(result, c.expected);
  }
  const auto same =
      ColorVector(With({{kTypeKey, "RGB"}}), kOdd).TransformTo("VEXColorVector", Conditions());
  EXPECT_EQ(ChannelsOf(same), kOdd);
  EXPECT_FALSE(same->IsDerived());
}

TEST(ColorVectorTest, WhatCannotBeConvertedIsReportedWithTheTypeAskedFor) {
  const ColorVector lab = Lab(50, 20, 10);
  const std::string refusal = "Could not convert 'VEXColorSpace' to 'VEXColorVector'";
  EXPECT_EQ(Refusal(lab, "VEXColorVector", With({{kIlluminationKey, "A"}})), refusal);
  EXPECT_EQ(Refusal(lab, "VEXColorVector", ColorConditions("Munsell")), refusal);
  EXPECT_EQ(Refusal(ColorVector(ColorConditions("CIELCh"), Values(3)), "VEXColorVector",
                    ColorConditions("CIELab")),
            refusal)
      << "there is no way back";
  EXPECT_EQ(Refusal(lab, "VEXSpectrum"), "Could not convert 'VEXColorSpace' to 'VEXSpectrum'");
}

TEST(ColorimetryBridgeTest, AVectorWithoutAColorSpaceIsNoColor) {
  Tristim::HXMeasureConditions conditions;
  conditions.SetMeasureCondition(kTypeKey, "Undefined");
  const Tristim::HXColorVector vector(1, 2, 3, conditions);
  EXPECT_EQ(
      MessageOf<Utilities::Exceptions::InvalidArgumentException>([&] { ToColorVector(vector); }),
      "Colorspace missing");
}

TEST(ColorimetryBridgeTest, ConditionsComeBackWithoutWhatIsUndefined) {
  const auto round = [](const Conditions& source) {
    return ToConditions(ToMeasureConditions(source));
  };
  Conditions source = With({{"Physical.Filter", "UVCut"},
                            {kObserverKey, "Undefined"},
                            {kIlluminationKey, "A"},
                            {"Colorimetric.WhiteBase", "no such word"}});
  source.SetCustomIllumination(Flat(3));
  const Conditions back = round(source);
  EXPECT_EQ(back.GetAttribute("Physical.Filter"), "UVCut");
  EXPECT_EQ(back.GetAttribute(kIlluminationKey), "A");
  EXPECT_EQ(back.GetAttribute("Colorimetric.WhiteBase"), "Automatic");
  EXPECT_FALSE(back.HasAttribute(kObserverKey));
  EXPECT_EQ(back.GetAttributeCount(), 12U);
  EXPECT_FALSE(back.HasCustomIllumination()) << "no word refers to the curve";
  source.AddAttribute(kIlluminationKey, "Userdefined");
  EXPECT_EQ(round(source).GetCustomIllumination().GetData(), Values(36, 3.0F));
}

TEST(ColorimetryBridgeTest, AVectorGetsTheBlockOfItsConditions) {
  Conditions custom = With({{kIlluminationKey, "Userdefined"}});
  custom.SetCustomIllumination(Flat(2));
  Conditions other_curve = custom;
  other_curve.SetCustomIllumination(Flat(3));
  for (const Conditions& source :
       {With({}), With({{"Physical.Filter", "Undefined"}}), custom, other_curve}) {
    const Tristim::HXMeasureConditions typed = ToMeasureConditions(source);
    const Conditions expected = ToConditions(typed);
    Conditions with_a_curve = expected;  // a block that differs in the curve only
    with_a_curve.SetCustomIllumination(Flat(1));
    const ColorVector decoy(with_a_curve, Values(3));
    const auto first = ToColorVector({1, 2, 3, typed});
    EXPECT_TRUE(*first->GetConditions() == expected);
    EXPECT_TRUE(IsSame(ToColorVector({1, 2, 3, typed})->GetConditions(), first->GetConditions()));
    EXPECT_TRUE(IsSame(ColorVector(expected, Values(3)).GetConditions(), first->GetConditions()));
  }
}

}  // namespace
}  // namespace Aldermoor::Vexdoc::Tests
