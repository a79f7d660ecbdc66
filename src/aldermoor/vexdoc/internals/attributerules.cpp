#include "aldermoor/vexdoc/internals/attributerules.h"

#include <algorithm>
#include <exception>
#include <stdexcept>

#include "aldermoor/utilities/tools/lexicalcast.h"
#include "aldermoor/vexdoc/colorimetrybridge.h"
#include "aldermoor/vexdoc/colorspace.h"
#include "aldermoor/vexdoc/conditionkeys.h"
#include "aldermoor/vexdoc/elementtyper.h"
#include "aldermoor/vexdoc/internals/elementfactory.h"
#include "aldermoor/vexdoc/internals/faulttext.h"
#include "aldermoor/vexdoc/mandatoryconditions.h"

namespace Aldermoor::Vexdoc::Internals {

namespace {

void AddMissing(const Conditions& conditions, const std::vector<std::string>& keys,
                const char* whose, std::vector<std::string>& faults) {
  for (const std::string& key : keys) {
    if (!conditions.HasAttribute(key)) {
      faults.push_back(std::string("the conditions of a ") + whose + " lack the mandatory '" + key +
                       "'");
    }
  }
}

// In nm; of "380nm" the number counts.
std::int16_t Wavelength(const Conditions& conditions, const char* key, const char* fallback) {
  return Utilities::Tools::lexical_cast<std::int16_t>(conditions.GetAttribute(key, fallback));
}

// The rules of the class itself, which nothing but its channels enters.
template <class Data>
void AddChannelFault(const std::string& color_space, const Data& data,
                     std::vector<std::string>& faults) {
  try {
    const ColorSpace built(color_space, data);
  } catch (const std::exception& e) {
    faults.emplace_back(e.what());
  }
}

std::string QuotedList(const std::vector<std::string>& texts) {
  std::string list;
  for (const std::string& text : texts) {
    list += (list.empty() ? "" : ", ") + Quoted(text);
  }
  return list;
}

}  // namespace

std::string ElementKind(const std::string& name) {
  ElementTyper typer;
  ElementFactory::GetInstance().CreateElement(name)->AcceptVisitor(typer);
  return typer.GetElementName();
}

bool IsLevel(std::string_view kind) {
  return kind == "VEX" || kind == "SampleSet" || kind == "Sample";
}

WavelengthSteps::WavelengthSteps(const Conditions& conditions, std::size_t points)
    : WavelengthSteps(Wavelength(conditions, ConditionKeys::kWavelengthMin, "380"),
                      Wavelength(conditions, ConditionKeys::kWavelengthMax, "730"), points) {}

WavelengthSteps::WavelengthSteps(std::int64_t minimum, std::int64_t maximum, std::size_t points)
    : first(minimum) {
  if (points > 1) {
    step = (maximum - minimum) / (static_cast<std::int64_t>(points) - 1);
  }
}

std::optional<unsigned int> ExpectedPoints(const Conditions& conditions) {
  try {
    return Utilities::Tools::lexical_cast<unsigned int>(
        conditions.GetAttribute(ConditionKeys::kPointCount, "36"));
  } catch (const std::invalid_argument&) {
    return std::nullopt;
  }
}

std::vector<std::string> SpectrumFaults(const Conditions& conditions) {
  std::vector<std::string> faults;
  AddMissing(conditions, MandatoryConditionsOfSpectra(), "spectrum", faults);
  return faults;
}

std::vector<std::string> ColorFaults(const Conditions& conditions, std::size_t channels) {
  std::vector<std::string> faults;
  AddMissing(conditions, {ConditionKeys::kColorSpace}, "colour", faults);
  const std::string color_space = conditions.GetAttribute(ConditionKeys::kColorSpace, "");
  if (!faults.empty() || !IsKnownColorSpace(color_space)) {
    return faults;
  }
  AddMissing(conditions, MandatoryConditionsOfColors(color_space), "colour", faults);
  AddChannelFault(color_space, ColorScheme::Channels(channels), faults);
  return faults;
}

std::vector<std::string> LegacyColorFaults(const Conditions& conditions, std::size_t channels) {
  std::vector<std::string> faults;
  AddMissing(conditions, {ConditionKeys::kColorSpace}, "colour", faults);
  if (faults.empty()) {
    AddChannelFault(conditions.GetAttribute(ConditionKeys::kColorSpace),
                    std::vector<float>(channels), faults);
  }
  return faults;
}

std::string LabelFault(const Conditions& conditions, const std::vector<std::string>& labels) {
  const std::string color_space = conditions.GetAttribute(ConditionKeys::kColorSpace, "");
  if (!IsKnownColorSpace(color_space)) {
    return "";
  }
  // Those of absolute values stand in front of those of differences.  "Undefined" has none.
  const std::vector<std::string>& own = GetChannelLabels(color_space);
  const auto half = own.begin() + static_cast<std::ptrdiff_t>(own.size() / 2);
  if (own.empty() || std::equal(own.begin(), half, labels.begin(), labels.end()) ||
      std::equal(half, own.end(), labels.begin(), labels.end())) {
    return "";
  }
  return "the channels are labelled " + QuotedList(labels) + " but count by position, as " +
         QuotedList({own.begin(), half});
}

}  // namespace Aldermoor::Vexdoc::Internals
