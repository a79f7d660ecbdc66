#include "csvlayout.h"

#include <algorithm>
#include <charconv>
#include <map>
#include <set>
#include <system_error>

#include <fmt/format.h>
#include <fmt/ranges.h>

#include "aldermoor/vexdoc/colorspace.h"

#include "vocabulary.h"

namespace Aldermoor::Tool {
namespace {

using Role = CsvColumn::Role;

// The wavelength, nm, of a heading such as "380", "380nm", "380 nm", "R380" or "380.0".
std::optional<double> WavelengthOf(std::string_view heading) {
  constexpr std::size_t kLeastDigits = 3;
  const std::size_t last = heading.find_last_not_of(' ');
  heading = heading.substr(0, last + 1);
  heading.remove_prefix(std::min(heading.find_first_not_of(' '), heading.size()));
  if (heading.starts_with('R')) {
    heading.remove_prefix(1);
  }
  if (heading.ends_with("nm")) {
    heading.remove_suffix(2);
    heading.remove_suffix(heading.ends_with(' ') ? 1 : 0);
  }
  double wavelength = 0.0;
  const char* const end = heading.data() + heading.size();
  const auto [stop, error] =
      std::from_chars(heading.data(), end, wavelength, std::chars_format::fixed);
  const std::size_t digits = std::min(heading.find_first_not_of("0123456789"), heading.size());
  if (error != std::errc() || stop != end || digits < kLeastDigits || digits > kLeastDigits + 1) {
    return std::nullopt;
  }
  return wavelength;
}

// A label as it is typed without its marks: "L" for "L*" and "L(hx)", "u" for "u' 1976".
std::string PlainLabel(const std::string& label) {
  return label.substr(0, label.find_first_of("*'( "));
}

// Places of the channels of `color_space` among the headings; nothing if one is missing.
std::optional<std::vector<std::size_t>> FindSpace(const std::string& color_space,
                                                  const std::vector<CsvCell>& headings) {
  std::vector<std::size_t> places;
  for (const std::string& label : ChannelLabels(color_space)) {
    const auto find = [&headings](const std::string& text) {
      return std::find_if(headings.begin(), headings.end(),
                          [&text](const CsvCell& cell) { return cell.text == text; });
    };
    auto found = find(label);
    found = found == headings.end() ? find(PlainLabel(label)) : found;
    if (found == headings.end()) {
      return std::nullopt;
    }
    places.push_back(static_cast<std::size_t>(found - headings.begin()));
  }
  return places;
}

std::vector<std::string> AllSpaces() {
  const auto words = WordsFor(kTypeKey);
  return {words.begin(), words.end()};
}

bool IsChannelHeading(const std::string& text) {
  static const std::set<std::string> headings = [] {
    std::set<std::string> all;
    for (const std::string& color_space : AllSpaces()) {
      for (const std::string& label : ChannelLabels(color_space)) {
        all.insert({label, PlainLabel(label)});
      }
    }
    return all;
  }();
  return headings.contains(text);
}

}  // namespace

const std::vector<std::string>& ChannelLabels(const std::string& color_space) {
  static std::map<std::string, std::vector<std::string>> known;
  std::vector<std::string>& labels = known[color_space];
  if (labels.empty()) {
    const std::vector<float> values(color_space == "CMYK" ? 4 : 3);
    const Vexdoc::ColorSpace channels(color_space, values);
    for (const auto& channel : channels.GetData()) {
      labels.push_back(channel.first);
    }
  }
  return labels;
}

std::string HeadingFor(const std::string& key) {
  const bool is_taken = key.empty() || key == kNameHeading || key == kSetHeading ||
                        key.starts_with(kSamplePrefix) || WavelengthOf(key) ||
                        IsChannelHeading(key);
  return is_taken ? kSamplePrefix + key : key;
}

CsvLayout::CsvLayout(const std::vector<CsvCell>& headings, const std::optional<std::string>& type,
                     CsvFaults& faults)
    : columns(headings.size()) {
  columns.front().role = Role::kName;
  if (headings.size() == 1 && headings.front().text.find_first_of(",;\t") != std::string::npos) {
    faults.Add(headings.front(), "a single column; expected another separator, see --separator");
  }
  FindBands(headings, faults);
  FindChannels(headings, type, faults);
  FindHeaderKeys(headings, faults);
  if (columns.front().role != Role::kName) {
    faults.Add(headings.front(), fmt::format("'{}' is no heading for the first column, which holds "
                                             "the names of the samples",
                                             headings.front().text));
  }
}

void CsvLayout::FindBands(const std::vector<CsvCell>& headings, CsvFaults& faults) {
  std::vector<double> missing;
  std::vector<std::string> extra;
  std::set<double> expected;
  for (int wavelength = kFirstBand; wavelength <= kLastBand; wavelength += kBandStep) {
    expected.insert(wavelength);
  }
  std::set<double> found;
  const CsvCell* first = nullptr;
  for (std::size_t i = 0; i < headings.size(); ++i) {
    const std::optional<double> wavelength = WavelengthOf(headings[i].text);
    if (!wavelength) {
      continue;
    }
    first = first == nullptr ? &headings[i] : first;
    if (!expected.contains(*wavelength) || !found.insert(*wavelength).second) {
      extra.push_back(headings[i].text);
    } else {
      columns[i] = {Role::kBand, static_cast<std::size_t>(*wavelength - kFirstBand) / kBandStep,
                    ""};
    }
  }
  if (first == nullptr) {
    return;
  }
  std::set_difference(expected.begin(), expected.end(), found.begin(), found.end(),
                      std::back_inserter(missing));
  has_spectrum = true;
  if (!missing.empty() || !extra.empty()) {
    faults.Add(*first, fmt::format("expected the 36 wavelengths from 380 to 730 nm by 10; {}{}{}",
                                   missing.empty() ? "" : "missing: ", fmt::join(missing, ", "),
                                   extra.empty()
                                       ? ""
                                       : fmt::format("{}too many: {}", missing.empty() ? "" : "; ",
                                                     fmt::join(extra, ", "))));
  }
}

void CsvLayout::FindChannels(const std::vector<CsvCell>& headings,
                             const std::optional<std::string>& type, CsvFaults& faults) {
  const std::vector<std::string> all = AllSpaces();
  if (type && std::find(all.begin(), all.end(), *type) == all.end()) {
    faults.Add(headings.front(), fmt::format("{} is '{}'; expected one of {}", kTypeKey, *type,
                                             fmt::join(all, ", ")));
    return;
  }
  std::vector<std::string> candidates;
  for (const std::string& space : type ? std::vector{*type} : all) {
    if (FindSpace(space, headings)) {
      candidates.push_back(space);
    }
  }
  if (candidates.size() > 1) {
    faults.Add(headings.front(), fmt::format("the columns fit {}; expected one of them in {}",
                                             fmt::join(candidates, ", "), kTypeKey));
  } else if (candidates.empty() && type) {
    faults.Add(headings.front(), fmt::format("expected the columns {} of {}",
                                             fmt::join(ChannelLabels(*type), ", "), *type));
  }
  if (candidates.size() != 1) {
    return;
  }
  color_space = candidates.front();
  const std::vector<std::size_t> places = *FindSpace(color_space, headings);
  for (std::size_t i = 0; i < places.size(); ++i) {
    columns[places[i]] = {Role::kChannel, i, ""};
  }
}

void CsvLayout::FindHeaderKeys(const std::vector<CsvCell>& headings, CsvFaults& faults) {
  std::set<std::string> keys = {kNameHeading};
  bool has_set = false;
  for (std::size_t i = 1; i < headings.size(); ++i) {
    if (columns[i].role != Role::kNone || WavelengthOf(headings[i].text)) {
      continue;
    }
    std::string key = headings[i].text;
    if (key == kSetHeading && !has_set) {
      has_set = true;
      columns[i].role = Role::kSet;
      continue;
    }
    if (headings[i].IsAbsent()) {
      continue;
    }
    if (IsChannelHeading(key)) {
      stray_channels.push_back(key);
    }
    key.erase(0, key.starts_with(kSamplePrefix) ? kSamplePrefix.size() : 0);
    if (!keys.insert(key).second || headings[i].text == kSetHeading) {
      faults.Add(headings[i], fmt::format("a second column for '{}'", key));
    }
    columns[i] = {Role::kHeader, 0, key};
  }
}

}  // namespace Aldermoor::Tool
