#include "aldermoor/vexdoc/internals/loadnotes.h"

#include <algorithm>
#include <map>
#include <utility>

#include "aldermoor/vexdoc/conditionkeys.h"
#include "aldermoor/vexdoc/internals/conditionmanager.h"
#include "aldermoor/vexdoc/internals/customillumination.h"
#include "aldermoor/vexdoc/internals/faulttext.h"
#include "aldermoor/vexdoc/vexexception.h"

namespace Aldermoor::Vexdoc::Internals {

namespace {

/// Whether points are those of conditions; few pairs are different.
class Agreement {
 public:
  bool Of(const Wavelengths& points, const Conditions& conditions) {
    const auto [known, is_new] = verdicts_.try_emplace({&points, &conditions}, false);
    if (is_new) {
      known->second = AreOfConditions(points, conditions);
    }
    return known->second;
  }

 private:
  std::map<std::pair<const Wavelengths*, const Conditions*>, bool> verdicts_;
};

bool NamesRange(const Conditions& conditions) {
  return ReadWavelength(conditions.GetAttribute(ConditionKeys::kWavelengthMin, "")) &&
         ReadWavelength(conditions.GetAttribute(ConditionKeys::kWavelengthMax, ""));
}

bool NamesCount(const Conditions& conditions, std::size_t count) {
  return conditions.GetAttribute(ConditionKeys::kPointCount, "") == std::to_string(count);
}

std::string RangeText(const Wavelengths& points) {
  return std::to_string(points.size()) + " from " + std::to_string(points.front()) + "nm to " +
         std::to_string(points.back()) + "nm";
}

[[noreturn]] void Refuse(const LoadReport& report, bool can_complete) {
  constexpr std::size_t kMostInText = 3;
  std::string text = "the wavelengths are not those of the conditions";
  for (std::size_t i = 0; i < std::min(kMostInText, report.contradictions.size()); ++i) {
    text += "\n" + report.contradictions[i].Text();
  }
  if (report.contradiction_count > kMostInText) {
    text += "\nand " + std::to_string(report.contradiction_count - kMostInText) + " more";
  }
  throw WavelengthException(text, ALDERMOOR_HERE(Aldermoor::Vexdoc::Internals::LoadNotes::Settle),
                            can_complete);
}

}  // namespace

void LoadNotes::AddSpectrum(const Spectrum& spectrum, Ruler ruler) {
  if (!ruler.misread.empty()) {
    misread_.emplace(&spectrum, std::move(ruler.misread));
  }
  if (last_ == nullptr || *last_ != ruler.points) {
    last_ = &*rulers_.insert(std::move(ruler.points)).first;
  }
  points_.emplace(&spectrum, last_);
}

void LoadNotes::AddIllumination(const std::string& id, const Ruler& ruler,
                                const Conditions& conditions) {
  if (!ruler.misread.empty() || !AreOfIllumination(ruler.points, conditions)) {
    illuminations_.push_back(
        {"", "",
         "the illuminant of the conditions " + Quoted(id) + ": " +
             (ruler.misread.empty()
                  ? ContradictionText(ruler.points, CustomIlluminationConditions())
                  : ruler.misread)});
  }
}

template <class Visit>
void LoadNotes::ForEachSpectrum(const VEX& document, Visit visit) const {
  for (const auto& [set_key, set] : document.GetSampleSets()) {
    for (const auto& [sample_key, sample] : set->GetSamples()) {
      for (const auto& [key, attribute] : sample->GetElements()) {
        if (const auto found = points_.find(attribute.Get()); found != points_.end()) {
          visit(*set, *sample, *attribute, *found->second);
        }
      }
    }
  }
}

bool LoadNotes::IsExact(const VEX& document) const {
  if (gave_dates_ || !illuminations_.empty() || !misread_.empty()) {
    return false;
  }
  bool is_exact = true;
  Agreement agreement;
  ForEachSpectrum(document, [&](const auto&, const auto&, const SampleAttribute& spectrum,
                                const Wavelengths& points) {
    is_exact = is_exact && agreement.Of(points, *spectrum.GetConditions());
  });
  return is_exact;
}

void LoadNotes::Settle(VEX& document, const LoadOptions& options, LoadReport& report) const {
  if (options.wavelengths == WavelengthUse::kComplete) {
    TakeRanges(document, report);
  }
  if (options.completion) {
    report.completion = CompleteConditions(document, *options.completion);
  }
  const std::size_t listed = std::min(LoadReport::kMostListed, illuminations_.size());
  report.contradictions.assign(illuminations_.begin(),
                               illuminations_.begin() + static_cast<std::ptrdiff_t>(listed));
  report.contradiction_count = illuminations_.size();
  const bool can_complete = FindContradictions(document, options, report) && illuminations_.empty();
  if (report.contradiction_count > 0 && options.wavelengths != WavelengthUse::kReport) {
    Refuse(report, can_complete);
  }
}

void LoadNotes::TakeRanges(const VEX& document, LoadReport& report) const {
  Agreement agreement;
  ForEachSpectrum(document, [&](const auto&, const auto&, SampleAttribute& spectrum,
                                const Wavelengths& points) {
    const Conditions& told = *spectrum.GetConditions();
    if (!AreRegular(points) || misread_.contains(&spectrum) ||
        (NamesRange(told) && NamesCount(told, points.size()) && agreement.Of(points, told))) {
      return;
    }
    Conditions conditions(told);
    TakeRange(points, conditions);
    spectrum.SetConditions(
        ConditionManager::GetInstance().GetOrCreateConditions(std::move(conditions)));
    ++report.ranges_taken[RangeText(points)];
  });
}

bool LoadNotes::FindContradictions(const VEX& document, const LoadOptions& options,
                                   LoadReport& report) const {
  bool can_complete = options.wavelengths != WavelengthUse::kComplete;
  Agreement agreement;
  ForEachSpectrum(document, [&](const SampleSet& set, const Sample& sample,
                                const SampleAttribute& spectrum, const Wavelengths& points) {
    const Conditions& conditions = *spectrum.GetConditions();
    const auto misread = misread_.find(&spectrum);
    if (misread == misread_.end() &&
        (agreement.Of(points, conditions) || (options.completion && !NamesRange(conditions)))) {
      return;
    }
    can_complete = can_complete && misread == misread_.end() && AreRegular(points);
    if (++report.contradiction_count > LoadReport::kMostListed) {
      return;
    }
    if (misread != misread_.end()) {
      report.contradictions.push_back({set.GetName(), sample.GetName(), misread->second});
    } else {
      report.contradictions.push_back(
          {set.GetName(), sample.GetName(),
           ContradictionText(points, conditions) +
               (options.wavelengths == WavelengthUse::kComplete
                    ? "; the points have no one step, or are beyond what conditions can say"
                    : "")});
    }
  });
  return can_complete;
}

}  // namespace Aldermoor::Vexdoc::Internals
