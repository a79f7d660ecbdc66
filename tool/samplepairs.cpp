#include "samplepairs.h"

#include <map>
#include <set>
#include <tuple>

#include <fmt/format.h>

#include "diagnostics.h"

namespace Aldermoor::Tool {
namespace {

struct NamedSample {
  std::string set;
  std::string name;
  const Vexdoc::Sample* sample;
};

// What two samples that belong together have in common: whether both documents have the set, its
// name if they have, the name of the sample.
using Key = std::tuple<bool, std::string, std::string>;
using Index = std::map<Key, std::vector<const NamedSample*>>;

std::vector<NamedSample> AllSamples(const Vexdoc::VEX& document) {
  std::vector<NamedSample> all;
  for (const auto& [set, samples] : document.GetSampleSets()) {
    for (const auto& [name, sample] : samples->GetSamples()) {
      all.push_back({set, name, sample.Get()});
    }
  }
  return all;
}

std::set<std::string> CommonSets(const Vexdoc::VEX& first, const Vexdoc::VEX& second) {
  std::set<std::string> of_first;
  for (const auto& [name, samples] : first.GetSampleSets()) {
    of_first.insert(name);
  }
  std::set<std::string> common;
  for (const auto& [name, samples] : second.GetSampleSets()) {
    if (of_first.contains(name)) {
      common.insert(name);
    }
  }
  return common;
}

Key KeyOf(const NamedSample& entry, const std::set<std::string>& common) {
  const bool is_common = common.contains(entry.set);
  return {is_common, is_common ? entry.set : "", entry.name};
}

Index IndexOf(const std::vector<NamedSample>& entries, const std::set<std::string>& common) {
  Index index;
  for (const NamedSample& entry : entries) {
    index[KeyOf(entry, common)].push_back(&entry);
  }
  return index;
}

std::string NoPartner(const std::string& path, const NamedSample& entry, const std::string& other) {
  return fmt::format("{}: {}/{}: there is no such sample in {}", path, entry.set, entry.name,
                     other);
}

}  // namespace

SamplePairs::SamplePairs(const std::string& reference_path, const Vexdoc::VEX& reference,
                         const std::string& path, const Vexdoc::VEX& document,
                         const SampleFilter& filter)
    : nothing_paired_(fmt::format("{} and {} have no samples in common", reference_path, path)) {
  const std::set<std::string> common = CommonSets(reference, document);
  const std::vector<NamedSample> references = AllSamples(reference);
  const std::vector<NamedSample> samples = AllSamples(document);
  const Index reference_index = IndexOf(references, common);
  const Index sample_index = IndexOf(samples, common);
  const auto passes = [&filter](const NamedSample& entry) {
    return filter.TakesSet(entry.set) && filter.TakesSample(entry.name);
  };
  for (const NamedSample& entry : samples) {
    if (!passes(entry)) {
      continue;
    }
    const Key key = KeyOf(entry, common);
    const auto found = reference_index.find(key);
    if (found == reference_index.end()) {
      unpaired.push_back(NoPartner(path, entry, reference_path));
    } else if (found->second.size() > 1 || sample_index.at(key).size() > 1) {
      unpaired.push_back(fmt::format(
          "{}: {}/{}: sets of different names hold samples of this name, so it has no partner in "
          "{}",
          path, entry.set, entry.name, reference_path));
    } else {
      pairs.push_back({entry.set, entry.name, found->second.front()->sample, entry.sample});
    }
  }
  for (const NamedSample& entry : references) {
    if (passes(entry) && !sample_index.contains(KeyOf(entry, common))) {
      unpaired.push_back(NoPartner(reference_path, entry, path));
    }
  }
}

bool SamplePairs::ReportUnpaired() const {
  for (const std::string& text : unpaired) {
    Report(text);
  }
  if (pairs.empty()) {
    Report(nothing_paired_);
  }
  return unpaired.empty() && !pairs.empty();
}

}  // namespace Aldermoor::Tool
