#include "aldermoor/tristim/hxmeasureconditions.h"

#include <gtest/gtest.h>

#include "aldermoor/tristim/tristimexception.h"

#include "tests/tristim/support.h"

namespace Aldermoor::Tristim::Tests {
namespace {

using Utilities::Exceptions::NullPointerException;

struct KeyCase {
  const char* key;
  const char* fallback;  ///< read from a default object
  const char* written;   ///< another word that the key accepts
  const char* read;      ///< what is read after that
  const char* refusal;   ///< behind a bad word; null if every word is accepted
};

constexpr KeyCase kKeys[] = {
    {"Physical.Filter", "No", "UVCut", "UVCut", " is not a valid whitespacetype"},
    {"Physical.NumberOfDataPointsSpectrum", "36", "40", "36", nullptr},
    {"Physical.WavelengthSpectrumMax", "730nm", "750nm", "730nm", nullptr},
    {"Physical.WavelengthSpectrumMin", "380nm", "400nm", "380nm", nullptr},
    {"Physical.SpectrumType", "Remission", "Moonlight", "Moonlight", nullptr},
    {"Colorimetric.Illumination", "D65", "A", "A", " is not a valid illuminationtype"},
    {"Colorimetric.Observer", "TwoDegree", "TenDegree", "TenDegree",
     " is not a valid observertype"},
    {"Colorimetric.WhiteBase", "Automatic", "Paper", "Paper", " is not a valid whitespacetype"},
    {"Colorimetric.DensityStandard", "DIN", "ANSIE", "ANSIE",
     " is not a valid density standard type"},
    {"Colorimetric.DensityFilterMode", "Auto", "Max", "Max", " is not a valid density filter mode"},
    {"ColorSpaceDescription.Type", "CIELab", "CMYK", "CMYK", " is not a valid color space"},
    {"ColorSpaceDescription.AbsoluteOrDeltaVector", "AbsoluteVector", "DeltaVector", "DeltaVector",
     " is not valid for absolute or relative vectors"},
    {"ColorSpaceDescription.DeltaEFormula", "CIELab", "2000", "2000",
     " is not a valid delta E formula"},
};

TEST(HXMeasureConditionsTest, KeysAreReadAndWrittenByTheirWords) {
  for (const KeyCase& c : kKeys) {
    SCOPED_TRACE(c.key);
    HXMeasureConditions conditions;
    EXPECT_EQ(conditions.GetMeasureCondition(c.key), c.fallback);
    if (c.refusal != nullptr) {
      // In upper case since words are compared exactly.
      for (const std::string word : {"two words", "NO", ""}) {
        const auto write = [&] {
          conditions.SetMeasureCondition(c.key, word);
        };
        EXPECT_EQ(MessageOf<TristimException>(write), word + c.refusal);
      }
      EXPECT_EQ(conditions.GetMeasureCondition(c.key), c.fallback) << "the value stays";
    }
    conditions.SetMeasureCondition(c.key, c.written);
    EXPECT_EQ(conditions.GetMeasureCondition(c.key), c.read);
    EXPECT_EQ(conditions == HXMeasureConditions(), std::string(c.read) == c.fallback);
  }
}

TEST(HXMeasureConditionsTest, CustomKeysWorkWhileTheyAreEnabled) {
  HXMeasureConditions conditions;
  const auto write = [&] {
    conditions.SetMeasureCondition("Paper.Lot", "17");
  };
  EXPECT_EQ(MessageOf<TristimException>(write), "Modification not supported for key: Paper.Lot");
  EXPECT_EQ(conditions.GetMeasureCondition("CustomCondition"), "Undefined");

  conditions.SetMeasureCondition("CustomCondition", "Enable");
  write();
  EXPECT_EQ(conditions.GetMeasureCondition("Paper.Lot"), "17");
  EXPECT_EQ(conditions.GetMeasureCondition("CustomCondition"), "Enable");
  EXPECT_EQ(conditions.GetMeasureCondition("Paper.Other"), "Undefined");
  EXPECT_TRUE(conditions == HXMeasureConditions());

  const HXMeasureConditions copy = conditions;
  conditions.SetMeasureCondition("CustomCondition", "Disable");
  EXPECT_EQ(conditions.GetMeasureCondition("Paper.Lot"), "Undefined");
  EXPECT_EQ(copy.GetMeasureCondition("Paper.Lot"), "17");
  conditions.SetMeasureCondition("CustomCondition", "Enable");
  EXPECT_EQ(conditions.GetMeasureCondition("Paper.Lot"), "17") << "the entry has stayed";
}

TEST(HXMeasureConditionsTest, AFailureInAMapLeavesTheEntriesBeforeItApplied) {
  HXMeasureConditions conditions;
  EXPECT_THROW(conditions.SetMeasureConditions({{"Colorimetric.Illumination", "C"},
                                                {"Colorimetric.Observer", "FourDegree"},
                                                {"Colorimetric.WhiteBase", "Paper"}}),
               TristimException);
  EXPECT_EQ(conditions.GetMeasureCondition("Colorimetric.Illumination"), "C");
  EXPECT_EQ(conditions.GetMeasureCondition("Colorimetric.WhiteBase"), "Automatic");
}

TEST(HXMeasureConditionsTest, ListsEndInFrontOfTheWordUndefined) {
  const auto& list = HXMeasureConditions::GetSupportedValues;
  using Words = std::vector<std::string>;
  EXPECT_EQ(list("Colorimetric.Illumination"), (Words{"A", "B", "C", "D50", "D55", "D65", "D75",
                                                      "Dxx", "F", "Userdefined", "Emission"}));
  EXPECT_EQ(list("Colorimetric.Observer"), (Words{"TwoDegree", "TenDegree"}));
  EXPECT_EQ(list("Colorimetric.WhiteBase"), (Words{"Absolute", "Paper", "Automatic"}));
  EXPECT_EQ(list("Colorimetric.DensityStandard"),
            (Words{"DIN", "DINNB", "ANSIA", "ANSIT", "SPI", "User"}));
  EXPECT_EQ(list("Colorimetric.DensityFilterMode"),
            (Words{"Black", "Cyan", "Magenta", "Yellow", "Max", "Auto"}));
  EXPECT_EQ(list("ColorSpaceDescription.DeltaEFormula"),
            (Words{"CIELab", "CIELuv", "LABhx", "FMCII", "CMC", "94", "2000"}));
  EXPECT_EQ(list("Physical.Filter"),
            (Words{"No", "Polarizer", "UVCut", "D65", "Custom", "CalibrationCheck", "ND0"}));
  EXPECT_EQ(list("Physical.SpectrumType"),
            (Words{"Remission", "Emission", "Transmission", "AmbientLight", "Flash"}));
  EXPECT_EQ(list("Physical.NumberOfDataPointsSpectrum"), (Words{"36"}));
  EXPECT_EQ(list("Physical.WavelengthSpectrumMax"), (Words{"730nm"}));
  EXPECT_EQ(list("Physical.WavelengthSpectrumMin"), (Words{"380nm"}));
  EXPECT_EQ(list("ColorSpaceDescription.AbsoluteOrDeltaVector"),
            (Words{"AbsoluteVector", "DeltaVector"}));
  EXPECT_EQ(list("no such key"), Words());
}

struct LabelCase {
  const char* color_space;
  const char* kind;
  std::vector<std::string> labels;
};

const LabelCase kLabels[] = {
    {"CIELab", "DeltaVector", {"delta L*", "delta a*", "delta b*"}},
    {"CIELCh", "DeltaVector", {"delta L*", "delta C*", "delta H*"}},
    {"CIELuv", "AbsoluteVector", {"L", "u*", "v*"}},
    {"CIELChuv", "AbsoluteVector", {"L", "C", "h"}},
    {"CIEuvY1960", "AbsoluteVector", {"u' 1960", "v' 1960", "Y 1960"}},
    {"CIEuvY1976", "DeltaVector", {"delta u' 1976", "delta v' 1976", "delta L 1976"}},
    {"CIEXYZ", "AbsoluteVector", {"X", "Y", "Z"}},
    {"CIExyY", "AbsoluteVector", {"x", "y", "Y"}},
    {"HunterLab", "AbsoluteVector", {"L(l)", "a(l)", "b(l)"}},
    {"RxRyRz", "DeltaVector", {"delta Rx", "delta Ry", "delta Rz"}},
    {"LABhx", "AbsoluteVector", {"L(hx)", "a(hx)", "b(hx)"}},
    {"LCHhx", "DeltaVector", {"delta L(hx)", "delta C(hx)", "delta H(hx)"}},
    {"RGB", "AbsoluteVector", {"R", "G", "B"}},
    {"CMYK", "AbsoluteVector", {"C", "M", "Y", "K"}},
    {"CMYK", "DeltaVector", {"K", "delta C", "delta M"}}};

TEST(HXMeasureConditionsTest, ElementNamesAreTheLabelsOfTheChannels) {
  for (const LabelCase& c : kLabels) {
    HXMeasureConditions conditions = InSpace(c.color_space);
    conditions.SetMeasureCondition(Vocabulary::kVectorKindKey, c.kind);
    for (unsigned short i = 0; i < c.labels.size(); ++i) {
      EXPECT_EQ(conditions.GetElementName(i), c.labels[i]) << c.color_space;
    }
  }
  const auto& spaces = HXMeasureConditions::GetSupportedValues("ColorSpaceDescription.Type");
  ASSERT_EQ(spaces.size(), 14U);
  for (const std::string& space : spaces) {
    const auto& labels = HXMeasureConditions::GetSupportedValues("ColorSpaceDescription." + space);
    EXPECT_EQ(labels.size(), space == "CMYK" ? 8U : 6U) << "twice the channels of " << space;
  }
}

TEST(HXMeasureConditionsTest, AUserdefinedCurveIsSharedAndGoesWithAnotherIllumination) {
  HXMeasureConditions conditions;
  EXPECT_THROW(conditions.GetUserdefinedIllumination(), NullPointerException);
  conditions.SetUserdefinedIllumination(Flat(2.0F));
  EXPECT_EQ(conditions.GetMeasureCondition(Vocabulary::kIlluminationKey), "Userdefined");

  const HXMeasureConditions copy = conditions;
  EXPECT_EQ(&copy.GetUserdefinedIllumination(), &conditions.GetUserdefinedIllumination());
  HXMeasureConditions twin;
  twin.SetUserdefinedIllumination(Flat(2.0F));
  EXPECT_TRUE(twin == copy) << "equal curves in separate objects";
  twin.SetUserdefinedIllumination(Flat(3.0F));
  EXPECT_FALSE(twin == copy);
  EXPECT_FALSE(Conditions("Userdefined") == copy) << "a curve on one side only";

  conditions.SetMeasureCondition(Vocabulary::kIlluminationKey, "D50");
  EXPECT_EQ(MessageOf<NullPointerException>([&] { conditions.GetUserdefinedIllumination(); }),
            "accessed null pointer (class Aldermoor::Tristim::HXSpectrum)");
  EXPECT_EQ(copy.GetUserdefinedIllumination()[0], 2.0F);
}

}  // namespace
}  // namespace Aldermoor::Tristim::Tests
