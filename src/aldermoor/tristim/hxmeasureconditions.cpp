#include "aldermoor/tristim/hxmeasureconditions.h"

#include <algorithm>
#include <memory>

#include "aldermoor/tristim/hxspectrum.h"
#include "aldermoor/tristim/internals/measureconditiongetstrings.h"
#include "aldermoor/tristim/internals/vocabulary.h"
#include "aldermoor/tristim/tristimexception.h"
#include "aldermoor/utilities/exceptions/frame.h"

namespace Aldermoor::Tristim {
namespace {

namespace Words = Vocabulary;
using Internals::MeasureConditionTranslator;

constexpr char kNotSupported[] = "Modification not supported for key: ";

}  // namespace

/// A key of the vocabulary, and how its value is written and read.
struct HXMeasureConditions::Key {
  std::string_view name;
  void (*write)(HXMeasureConditions& conditions, const std::string& value);
  std::string (*read)(const HXMeasureConditions& conditions);

  /// In ascending order of their names.
  static const std::array<Key, kKeyCount> kAll;

  template <auto kMember, auto kParse>
  static void Write(HXMeasureConditions& conditions, const std::string& value) {
    conditions.*kMember = kParse(value);
  }
  template <auto kMember>
  static void Store(HXMeasureConditions& conditions, const std::string& value) {
    conditions.*kMember = value;
  }
  static void WriteIllumination(HXMeasureConditions& conditions, const std::string& value) {
    conditions.SetIllumination(MeasureConditionTranslator::GetIllumination(value));
  }
  static void Ignore(HXMeasureConditions&, const std::string&) {}

  template <auto kMember>
  static std::string Word(const HXMeasureConditions& conditions) {
    return MeasureConditionTranslator::ToString(conditions.*kMember);
  }
  template <auto kMember>
  static std::string Text(const HXMeasureConditions& conditions) {
    return conditions.*kMember;
  }
  template <const char* kText>
  static std::string Constant(const HXMeasureConditions&) {
    return kText;
  }
};

using C = HXMeasureConditions;
using T = MeasureConditionTranslator;

constexpr std::array<C::Key, C::kKeyCount> C::Key::kAll = {{
    {Words::kVectorKindKey, Write<&C::vector_kind_, &T::GetRelativeOrAbsoluteVector>,
     Text<&C::vector_kind_>},
    {Words::kDeltaEFormulaKey, Write<&C::delta_e_formula_, &T::GetDeltaEFormula>,
     Text<&C::delta_e_formula_>},
    {Words::kColorSpaceKey, Write<&C::color_space_, &T::GetColorSpace>, Text<&C::color_space_>},
    {Words::kDensityFilterModeKey, Write<&C::density_filter_mode_, &T::GetDensityFilterMode>,
     Word<&C::density_filter_mode_>},
    {Words::kDensityStandardKey, Write<&C::density_standard_, &T::GetDensityStandard>,
     Word<&C::density_standard_>},
    {Words::kIlluminationKey, WriteIllumination, Word<&C::illumination_>},
    {Words::kObserverKey, Write<&C::observer_, &T::GetObserver>, Word<&C::observer_>},
    {Words::kWhiteBaseKey, Write<&C::white_base_, &T::GetWhiteBase>, Word<&C::white_base_>},
    {Words::kFilterKey, Write<&C::physical_filter_, &T::GetPhysicalFilter>,
     Word<&C::physical_filter_>},
    {Words::kNumberOfDataPointsKey, Ignore, Constant<Words::kNumberOfDataPoints>},
    {Words::kSpectrumTypeKey, Store<&C::spectrum_type_>, Text<&C::spectrum_type_>},
    {Words::kWavelengthMaxKey, Ignore, Constant<Words::kWavelengthMax>},
    {Words::kWavelengthMinKey, Ignore, Constant<Words::kWavelengthMin>},
}};

const C::Key* C::FindKey(std::string_view name) {
  const auto* const found = std::ranges::find(Key::kAll, name, &Key::name);
  return found == Key::kAll.end() ? nullptr : found;
}

HXMeasureConditions::HXMeasureConditions() try
    : color_space_(Words::kCIELab),
      delta_e_formula_(Words::kCIELab),
      vector_kind_(Words::kAbsoluteVector),
      spectrum_type_(Words::kRemission) {}
ALDERMOOR_FRAME(Aldermoor::Tristim::HXMeasureConditions::HXMeasureConditions)

HXMeasureConditions::HXMeasureConditions(const HXMeasureConditions& other) = default;
HXMeasureConditions& HXMeasureConditions::operator=(const HXMeasureConditions& other) try {
  // The copy may fail half-way, the move cannot.
  return *this = HXMeasureConditions(other);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::HXMeasureConditions::operator=)
HXMeasureConditions& HXMeasureConditions::operator=(HXMeasureConditions&& other) noexcept = default;
HXMeasureConditions::~HXMeasureConditions() = default;

bool HXMeasureConditions::operator==(const HXMeasureConditions& other) const try {
  const bool same_words =
      color_space_ == other.color_space_ && illumination_ == other.illumination_ &&
      observer_ == other.observer_ && white_base_ == other.white_base_ &&
      density_standard_ == other.density_standard_ &&
      density_filter_mode_ == other.density_filter_mode_ &&
      delta_e_formula_ == other.delta_e_formula_ && physical_filter_ == other.physical_filter_ &&
      vector_kind_ == other.vector_kind_ && spectrum_type_ == other.spectrum_type_;
  if (!same_words || SharesUserdefinedIllumination(other)) {
    return same_words;
  }
  return userdefined_illumination_ && other.userdefined_illumination_ &&
         *userdefined_illumination_ == *other.userdefined_illumination_;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::HXMeasureConditions::operator==)

void HXMeasureConditions::SetMeasureCondition(std::string_view key, const std::string& value) try {
  if (const Key* const known = FindKey(key)) {
    known->write(*this, value);
  } else if (key == Words::kCustomConditionKey || IsCustomEnabled()) {
    custom_conditions_.insert_or_assign(std::string(key), value);
  } else {
    throw TristimException(
        kNotSupported + std::string(key),
        ALDERMOOR_HERE(Aldermoor::Tristim::HXMeasureConditions::SetMeasureCondition));
  }
}
ALDERMOOR_FRAME(Aldermoor::Tristim::HXMeasureConditions::SetMeasureCondition)

void HXMeasureConditions::SetMeasureConditions(
    const std::map<std::string, std::string>& conditions) try {
  for (const auto& [key, value] : conditions) {
    SetMeasureCondition(key, value);
  }
}
ALDERMOOR_FRAME(Aldermoor::Tristim::HXMeasureConditions::SetMeasureConditions)

std::string HXMeasureConditions::GetMeasureCondition(std::string_view key) const try {
  if (const Key* const known = FindKey(key)) {
    return known->read(*this);
  }
  if (IsCustomEnabled()) {
    if (const auto found = custom_conditions_.find(key); found != custom_conditions_.end()) {
      return found->second;
    }
  }
  return Words::kUndefined;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::HXMeasureConditions::GetMeasureCondition)

HXMeasureConditions::KeyedWords HXMeasureConditions::GetMeasureConditions() const try {
  static_assert(std::ranges::is_sorted(Key::kAll, {}, &Key::name));
  KeyedWords words;
  std::ranges::transform(Key::kAll, words.begin(),
                         [this](const Key& key) { return std::pair(key.name, key.read(*this)); });
  return words;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::HXMeasureConditions::GetMeasureConditions)

const std::vector<std::string>& HXMeasureConditions::GetSupportedValues(std::string_view key) try {
  return Internals::Initialisator::Get().GetSupportedValues(key);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::HXMeasureConditions::GetSupportedValues)

std::string HXMeasureConditions::GetElementName(unsigned short index) const try {
  // Three also for "CMYK", whose first delta label stands at 4.
  const unsigned offset = vector_kind_ == Words::kDeltaVector ? 3 : 0;
  return GetSupportedValues(Words::kChannelLabelsPrefix + color_space_).at(index + offset);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::HXMeasureConditions::GetElementName)

void HXMeasureConditions::SetIllumination(const HXIllumination& illumination) try {
  illumination_ = illumination;
  if (illumination_ != HXIllumination(IlluminationType::kUserdefined)) {
    userdefined_illumination_ = 0;
  }
}
ALDERMOOR_FRAME(Aldermoor::Tristim::HXMeasureConditions::SetIllumination)

const HXSpectrum& HXMeasureConditions::GetUserdefinedIllumination() const try {
  return *userdefined_illumination_;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::HXMeasureConditions::GetUserdefinedIllumination)

void HXMeasureConditions::SetUserdefinedIllumination(const HXSpectrum& spectrum) try {
  userdefined_illumination_ =
      Utilities::Tools::SmartPointer<HXSpectrum>(std::make_unique<HXSpectrum>(spectrum).release());
  illumination_ = HXIllumination(IlluminationType::kUserdefined);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::HXMeasureConditions::SetUserdefinedIllumination)

bool HXMeasureConditions::SharesUserdefinedIllumination(const HXMeasureConditions& other) const {
  return userdefined_illumination_.Get() == other.userdefined_illumination_.Get();
}

void HXMeasureConditions::SetPhysMeasCond(const HXMeasureConditions& other) {
  physical_filter_ = other.physical_filter_;
}

bool HXMeasureConditions::IsCustomEnabled() const {
  const auto found = custom_conditions_.find(std::string_view(Words::kCustomConditionKey));
  return found != custom_conditions_.end() && found->second == Words::kEnable;
}

}  // namespace Aldermoor::Tristim
