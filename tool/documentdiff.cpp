#include "documentdiff.h"

#include <algorithm>
#include <cmath>
#include <iterator>
#include <sstream>
#include <utility>

#include <fmt/format.h>

#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/recipe.h"
#include "aldermoor/vexdoc/spectrum.h"

#include "xmldocument.h"

namespace Aldermoor::Tool {
namespace {

using Vexdoc::Header;
using Vexdoc::Sample;
using Vexdoc::SampleAttribute;

using Attributes = std::vector<std::pair<const SampleAttribute*, const SampleAttribute*>>;

const std::string kUnknown = "VEXUnknownSampleAttribute";

std::string SixDigits(float value) {
  return fmt::format("{:.6g}", value);
}

bool IsDate(const std::string& key) {
  return key == Header::kCreatedKey || key == Header::kModifiedKey;
}

bool IsStored(const std::string& key, const std::string& value) {
  return !value.empty() ||
         (!IsDate(key) && key != Header::kDescriptionKey && key != Header::kCreatorKey);
}

// The attributes of unknown kinds in `sample` as a document of their own, all under `conditions`:
// the IDs of blocks differ from one document to the next.
std::string UnknownText(const Sample& sample,
                        const Utilities::Tools::SmartPointer<Vexdoc::Conditions>& conditions) {
  const Utilities::Tools::SmartPointer<Sample> copy(new Sample(sample));
  for (auto i = copy->GetFirstSampleAttribute(); i.HasNext();) {
    if (i.Dereference()->GetType() == kUnknown) {
      i.Dereference()->SetConditions(conditions);
      i.Move2NextMatch();
    } else {
      copy->Remove(i);
    }
  }
  const Utilities::Tools::SmartPointer<Vexdoc::SampleSet> set(new Vexdoc::SampleSet);
  set->AddElement(copy);
  Vexdoc::VEX document;
  document.AddElement(set);
  for (Header* const element : std::initializer_list<Header*>{copy.Get(), set.Get(), &document}) {
    ForgetDates(*element);
  }
  std::ostringstream out;
  document.Store(out);
  return out.str();
}

}  // namespace

DocumentDiff::DocumentDiff(const Vexdoc::VEX& source, const Vexdoc::VEX& written) {
  place_ = "the document";
  CompareHeader(source, written);
  const auto& sets = source.GetSampleSets();
  const auto& others = written.GetSampleSets();
  if (CompareCount("sets", sets.size(), others.size())) {
    for (auto i = sets.begin(), k = others.begin(); i != sets.end(); ++i, ++k) {
      CompareSet(*i->second, *k->second);
    }
  }
}

std::string DocumentDiff::DigitsText() const {
  return changed_ == 0 ? ""
                       : fmt::format(
                             "{} of {} values lose digits in XML, at most {:.1e} of the "
                             "value",
                             changed_, values_, greatest_change_);
}

void DocumentDiff::CompareSet(const Vexdoc::SampleSet& source, const Vexdoc::SampleSet& written) {
  const std::string set = fmt::format("set '{}'", source.GetName());
  place_ = set;
  CompareHeader(source, written);
  const auto& samples = source.GetSamples();
  const auto& others = written.GetSamples();
  if (CompareCount("samples", samples.size(), others.size())) {
    for (auto i = samples.begin(), k = others.begin(); i != samples.end(); ++i, ++k) {
      place_ = fmt::format("{}, sample '{}'", set, i->second->GetName());
      CompareSample(*i->second, *k->second);
    }
  }
}

void DocumentDiff::CompareSample(const Sample& source, const Sample& written) {
  CompareHeader(source, written);
  const auto& attributes = source.GetElements();
  const auto& others = written.GetElements();
  if (!CompareCount("attributes", attributes.size(), others.size())) {
    return;
  }
  bool has_unknown = false;
  for (auto i = attributes.begin(), k = others.begin(); i != attributes.end(); ++i, ++k) {
    CompareText("kind of an attribute", i->second->GetType(), k->second->GetType());
    CompareAttribute(*i->second, *k->second);
    has_unknown = has_unknown || i->second->GetType() == kUnknown;
  }
  if (has_unknown && differences_.empty()) {
    CompareUnknown(source, written);
  }
}

void DocumentDiff::CompareAttribute(const SampleAttribute& source, const SampleAttribute& written) {
  CompareConditions(*source.GetConditions(), *written.GetConditions());
  if (source.GetType() != kUnknown) {
    CompareHeader(source, written);
    CompareKind(source, written);
  }
}

void DocumentDiff::CompareKind(const SampleAttribute& source, const SampleAttribute& written) {
  if (const auto* const spectrum = dynamic_cast<const Vexdoc::Spectrum*>(&source)) {
    if (const auto* const other = dynamic_cast<const Vexdoc::Spectrum*>(&written)) {
      CompareNumbers("spectrum", spectrum->GetData(), other->GetData());
    }
    return;
  }
  const auto compare_named = [this](const char* what, const auto& pairs, const auto& others) {
    std::vector<float> values;
    std::vector<float> other_values;
    std::string labels;
    std::string other_labels;
    for (const auto& [label, value] : pairs) {
      labels += label + "|";
      values.push_back(value);
    }
    for (const auto& [label, value] : others) {
      other_labels += label + "|";
      other_values.push_back(value);
    }
    CompareText(what, labels, other_labels);
    CompareNumbers(what, values, other_values);
  };
  if (const auto* const color = dynamic_cast<const Vexdoc::ColorVector*>(&source)) {
    if (const auto* const other = dynamic_cast<const Vexdoc::ColorVector*>(&written)) {
      compare_named("colour", color->GetDatastore(), other->GetDatastore());
    }
    return;
  }
  const auto* const recipe = dynamic_cast<const Vexdoc::Recipe*>(&source);
  const auto* const other = dynamic_cast<const Vexdoc::Recipe*>(&written);
  if (recipe != nullptr && other != nullptr) {
    CompareText("assortment", recipe->GetAssortmentName(), other->GetAssortmentName());
    CompareText("substrate", recipe->GetSubstrateLinkName(), other->GetSubstrateLinkName());
    CompareNumbers("thickness", {recipe->GetThickness()}, {other->GetThickness()});
    compare_named("recipe", recipe->GetComponents(), other->GetComponents());
  }
}

void DocumentDiff::CompareHeader(const Header& source, const Header& written) {
  const auto& others = written.GetAttributes();
  for (const auto& [key, value] : source.GetAttributes()) {
    if (IsStored(key, value) && !others.contains(key)) {
      Add(fmt::format("the header value '{}' is missing", key));
    }
  }
  for (const auto& [key, value] : others) {
    const auto found = source.GetAttributes().find(key);
    const bool is_there = found != source.GetAttributes().end() && IsStored(key, found->second);
    if (is_there) {
      CompareText(("header value '" + key + "'").c_str(), found->second, value);
    } else if (!IsDate(key) && IsStored(key, value) &&
               (key != Header::kNameKey || !value.empty())) {
      Add(fmt::format("there is a new header value '{}'", key));
    }
  }
}

void DocumentDiff::CompareConditions(const Vexdoc::Conditions& source,
                                     const Vexdoc::Conditions& written) {
  if (&source == &written) {
    return;
  }
  if (source.GetAttributes() != written.GetAttributes() ||
      source.HasCustomIllumination() != written.HasCustomIllumination()) {
    Add("the conditions of an attribute are others");
  } else if (source.HasCustomIllumination()) {
    CompareNumbers("custom illumination", source.GetCustomIllumination().GetData(),
                   written.GetCustomIllumination().GetData());
  }
}

void DocumentDiff::CompareUnknown(const Sample& source, const Sample& written) {
  const auto conditions = source.GetElements().front().second->GetConditions();
  if (UnknownText(source, conditions) != UnknownText(written, conditions)) {
    Add("an attribute of an unknown kind comes back changed");
  }
}

void DocumentDiff::CompareText(const char* what, const std::string& source,
                               const std::string& written) {
  if (source != written) {
    Add(fmt::format("{}: '{}' comes back as '{}'", what, source, written));
  }
}

void DocumentDiff::CompareNumbers(const char* what, const std::vector<float>& source,
                                  const std::vector<float>& written) {
  if (!CompareCount(what, source.size(), written.size())) {
    return;
  }
  for (std::size_t i = 0; i < source.size(); ++i) {
    ++values_;
    if (source[i] == written[i]) {
      continue;
    }
    if (SixDigits(source[i]) != SixDigits(written[i])) {
      Add(fmt::format("{}: value {} is {} and comes back as {}", what, i + 1, source[i],
                      written[i]));
    }
    ++changed_;
    const auto exact = static_cast<double>(source[i]);
    const auto back = static_cast<double>(written[i]);
    greatest_change_ = std::max(greatest_change_, std::abs((back - exact) / exact));
  }
}

bool DocumentDiff::CompareCount(const char* what, std::size_t source, std::size_t written) {
  if (source != written) {
    Add(fmt::format("{} {} come back as {}", source, what, written));
  }
  return source == written;
}

void DocumentDiff::Add(const std::string& text) {
  constexpr std::size_t kMost = 100;
  if (differences_.size() < kMost) {
    differences_.push_back(place_ + ": " + text);
  }
}

}  // namespace Aldermoor::Tool
