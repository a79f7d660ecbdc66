#include "aldermoor/vexdoc/colorimetrybridge.h"

#include <algorithm>
#include <stdexcept>
#include <string>
#include <vector>

#include "aldermoor/tristim/hxcolorvector.h"
#include "aldermoor/tristim/hxmeasureconditions.h"
#include "aldermoor/tristim/hxspectrum.h"
#include "aldermoor/tristim/internals/vocabulary.h"
#include "aldermoor/tristim/tristimexception.h"
#include "aldermoor/tristim/tristimservice.h"
#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/vexdoc/internals/conditionmanager.h"

namespace Aldermoor::Vexdoc {

using Internals::ConditionManager;
using Tristim::HXColorVector;
using Tristim::HXMeasureConditions;
using Tristim::HXSpectrum;
using Tristim::TristimException;
using Tristim::TristimService;
using Utilities::Exceptions::ResourceNotAvailableException;
using Utilities::Tools::SmartPointer;

namespace {

namespace IlluminationType = Tristim::IlluminationType;
using Tristim::Vocabulary::kUndefined;
using Tristim::Vocabulary::kUserdefined;

const std::string& kIlluminationKey = *new std::string(Tristim::Vocabulary::kIlluminationKey);
const std::string& kColorSpaceKey = *new std::string(Tristim::Vocabulary::kColorSpaceKey);

// The block that an attribute under ToConditions(conditions) gets.  As a rule it is there already,
// and is found without the two dozen allocations of a Conditions of its own.
SmartPointer<Conditions> ToBlock(const HXMeasureConditions& conditions) {
  ConditionManager& manager = ConditionManager::GetInstance();
  if (conditions.GetIllumination().GetIlluminationType() != IlluminationType::kUserdefined) {
    HXMeasureConditions::KeyedWords words = conditions.GetMeasureConditions();
    const auto defined = std::remove_if(words.begin(), words.end(),
                                        [](const auto& word) { return word.second == kUndefined; });
    if (SmartPointer<Conditions> block = manager.FindConditions({words.begin(), defined})) {
      return block;
    }
  }
  return manager.GetOrCreateConditions(ToConditions(conditions));
}

// Curves that are the illuminants of curves: further ones mean nothing to any colour.
constexpr std::size_t kMostNestedCurves = 100;

// `of_curve` are the conditions of the custom illumination, where the attributes refer to it.
HXMeasureConditions ReadWords(const Conditions& conditions, const HXMeasureConditions* of_curve) {
  HXMeasureConditions result;
  for (const auto& [key, value] : conditions.GetAttributes()) {
    try {
      result.SetMeasureCondition(key, value);
      if (of_curve != nullptr && key == kIlluminationKey) {
        result.SetUserdefinedIllumination(
            HXSpectrum(conditions.GetCustomIllumination().GetData(), *of_curve));
      }
    } catch (const TristimException&) {
      // Documents hold keys and words of their own; colorimetry keeps its default for them.
    }
  }
  return result;
}

SmartPointer<SampleAttribute> Derived(const HXColorVector& vector) {
  SmartPointer<SampleAttribute> result = ToColorVector(vector);
  result->SetDerived(true);
  return result;
}

}  // namespace

bool IsKnownColorSpace(const std::string& color_space) try {
  try {
    HXMeasureConditions().SetMeasureCondition(kColorSpaceKey, color_space);
    return true;
  } catch (const TristimException&) {
    return false;
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::IsKnownColorSpace)

const std::vector<std::string>& GetChannelLabels(const std::string& color_space) try {
  HXMeasureConditions().SetMeasureCondition(kColorSpaceKey, color_space);
  return HXMeasureConditions::GetSupportedValues(Tristim::Vocabulary::kChannelLabelsPrefix +
                                                 color_space);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::GetChannelLabels)

HXMeasureConditions ToMeasureConditions(const Conditions& conditions) try {
  if (!conditions.RefersToCustomIllumination()) {
    return ReadWords(conditions, nullptr);
  }
  // The conditions of a curve may have a curve again.  From the innermost outward, since a ring of
  // them has no end: the block with which it would go round again counts without its illuminant.
  std::vector<const Conditions*> blocks;
  const Conditions* next = &conditions;
  while (next->RefersToCustomIllumination() && blocks.size() < kMostNestedCurves &&
         std::find(blocks.begin(), blocks.end(), next) == blocks.end()) {
    blocks.push_back(next);
    next = &*next->GetCustomIllumination().GetConditions();
  }
  Conditions innermost(*next);
  if (next->RefersToCustomIllumination()) {
    innermost.RemoveAttribute(kIlluminationKey);
  }
  HXMeasureConditions result = ReadWords(innermost, nullptr);
  for (auto block = blocks.rbegin(); block != blocks.rend(); ++block) {
    result = ReadWords(**block, &result);
  }
  return result;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::ToMeasureConditions)

Conditions ToConditions(const HXMeasureConditions& conditions) try {
  Conditions result;
  for (const auto& [key, value] : conditions.GetMeasureConditions()) {
    if (value == kUndefined) {
      continue;
    }
    result.AddAttribute(std::string(key), value);
    if (value == kUserdefined && key == kIlluminationKey) {
      result.SetCustomIllumination(ToSpectrum(conditions.GetUserdefinedIllumination()));
    }
  }
  return result;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::ToConditions)

HXSpectrum ToHXSpectrum(const Spectrum& spectrum) try {
  return HXSpectrum(spectrum.GetData(), ToMeasureConditions(*spectrum.GetConditions()));
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::ToHXSpectrum)

Spectrum ToSpectrum(const HXSpectrum& spectrum) try {
  return Spectrum(ToConditions(spectrum.GetMeasureConditions()), spectrum.GetValues());
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::ToSpectrum)

HXColorVector ToHXColorVector(const ColorVector& vector) try {
  std::vector<float> values;
  for (const auto& channel : vector.GetDatastore()) {
    values.push_back(channel.second);
  }
  return HXColorVector(values, ToMeasureConditions(*vector.GetConditions()));
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::ToHXColorVector)

SmartPointer<ColorVector> ToColorVector(const HXColorVector& vector) try {
  const HXMeasureConditions& conditions = vector.GetMeasureConditions();
  const std::string& color_space = conditions.GetColorSpace();
  if (color_space == kUndefined) {
    throw std::invalid_argument("Colorspace missing");
  }
  const int count = color_space == Tristim::Vocabulary::kCMYK ? 4 : 3;
  const auto* const first = vector.GetChannels().begin();
  const std::vector<float> values(first, first + count);
  return SmartPointer<ColorVector>(new ColorVector(*ToBlock(conditions), values));
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::ToColorVector)

SmartPointer<SampleAttribute> ComputeColorVector(const Spectrum& spectrum,
                                                 const Conditions& conditions) try {
  try {
    const HXMeasureConditions target = ToMeasureConditions(conditions);
    return Derived(TristimService::GetVector(ToHXSpectrum(spectrum), target));
  } catch (const TristimException&) {
    return {};
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::ComputeColorVector)

SmartPointer<SampleAttribute> ComputeColorVector(const ColorScheme::Channels& channels,
                                                 const Conditions& own,
                                                 const Conditions& target) try {
  try {
    std::vector<float> values;
    for (const auto& channel : channels) {
      values.push_back(channel.second);
    }
    const HXColorVector source(values, ToMeasureConditions(own));
    const std::string color_space = target.GetAttribute(kColorSpaceKey);
    return Derived(TristimService::GetVector(source, color_space));
  } catch (const TristimException&) {
    return {};
  } catch (const ResourceNotAvailableException&) {
    return {};
  }
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::ComputeColorVector)

}  // namespace Aldermoor::Vexdoc
