#include "csvdocument.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <deque>
#include <filesystem>
#include <set>
#include <system_error>
#include <vector>

#include <fmt/format.h>
#include <fmt/ranges.h>

#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/spectrum.h"
#include "aldermoor/vexdoc/wavelengthrange.h"

#include "csvlayout.h"
#include "csvreader.h"
#include "diagnostics.h"
#include "exitstatus.h"
#include "inputfile.h"
#include "output.h"
#include "vocabulary.h"
#include "xmldocument.h"

namespace Aldermoor::Tool {
namespace {

using Utilities::Tools::SmartPointer;
using Role = CsvColumn::Role;

constexpr double kPercent = 100.0;
constexpr float kHighestReflectance = 1.5F;  // above it, percent are likely

Vexdoc::Conditions ToConditions(const Texts& texts) {
  Vexdoc::Conditions conditions;
  for (const auto& [key, value] : texts) {
    conditions.AddAttribute(key, value);
  }
  return conditions;
}

// What is wrong with the number in `text`; null if `value` has taken it.
const char* ParseNumber(const std::string& text, bool percent, float& value) {
  const char* const end = text.data() + text.size();
  // Half a unit of a percent figure must not be rounded twice.
  double exact = 0.0;
  const auto result =
      percent ? std::from_chars(text.data(), end, exact) : std::from_chars(text.data(), end, value);
  if (percent) {
    value = static_cast<float>(exact / kPercent);
  }
  if (result.ec == std::errc::invalid_argument || result.ptr != end) {
    return "is no number; expected a number such as 0.5";
  }
  if (result.ec != std::errc()) {
    return "does not fit single precision; expected 1e-38 to 3e38";
  }
  return std::isfinite(value) ? nullptr : "is not finite; expected a number such as 0.5";
}

struct SetEntry {
  SmartPointer<Vexdoc::SampleSet> set;
  Texts header;
  std::set<std::string> names;  // of the samples
};

class CsvImport {
 public:
  CsvImport(const std::string& path, const CsvOptions& options, Vexdoc::VEX& document)
      : path_(path),
        options_(options),
        document_(document),
        text_(ReadBytes(path, FileForm::kCsv)),
        reader_(text_, options.separator, faults_) {}

  // Returns the number of rows that were left out.
  std::size_t Run() {
    std::vector<CsvCell> record;
    if (!ReadSettings(record)) {
      throw InputError(fmt::format("{}: no line with the headings", ShownPath(path_)));
    }
    const std::optional<CsvLayout> layout = Prepare(record);
    const std::size_t faults_of_head = faults_.Count();
    std::size_t skipped = 0;
    while (layout) {
      const std::size_t before = faults_.Count();
      if (!reader_.Next(record)) {
        break;
      }
      AddRow(*layout, record, before);
      skipped += faults_.Count() > before ? 1U : 0U;
    }
    faults_.ReportAll(path_);
    if (faults_of_head > 0 || (faults_.Count() > 0 && !options_.skip_faulty)) {
      throw InputError(fmt::format("{}: {} fault{}; nothing is written", ShownPath(path_),
                                   faults_.Count(), faults_.Count() == 1 ? "" : "s"));
    }
    Finish();
    return skipped;
  }

 private:
  // Reads the comment lines; `record` then holds the headings.
  bool ReadSettings(std::vector<CsvCell>& record) {
    while (reader_.Next(record)) {
      if (!record.front().text.starts_with('#')) {
        return true;
      }
      const std::string& text = record.front().text;
      const std::size_t begin = std::min(text.find_first_not_of(' ', 1), text.size());
      const std::optional<Setting> setting = Setting::Parse(std::string_view(text).substr(begin));
      if (!setting) {
        continue;  // a remark
      }
      for (std::size_t i = 1; i < record.size(); ++i) {
        if (!record[i].IsAbsent()) {
          faults_.Add(record[i],
                      "a setting ends at the separator; expected quotes around the line");
          break;
        }
      }
      AddSetting(record.front(), *setting);
    }
    return false;
  }

  void AddSetting(const CsvCell& cell, const Setting& setting) {
    const std::string& key = setting.key;
    if (key.starts_with(kDocumentPrefix)) {
      header_[key.substr(kDocumentPrefix.size())] = setting.value;
    } else if (key == kSetKey) {
      if (set_places_.contains(setting.value)) {
        faults_.Add(cell, fmt::format("the set '{}' a second time", setting.value));
      }
      FindSet(setting.value);
    } else if (key.starts_with(kSetPrefix)) {
      if (sets_.empty()) {
        faults_.Add(cell, "a value of a set; expected a line # Set=NAME in front");
      } else {
        sets_.back().header[key.substr(kSetPrefix.size())] = setting.value;
      }
    } else {
      try {
        conditions_.Add("this setting", setting);
      } catch (const UsageError& e) {
        faults_.Add(cell, e.what());
      }
    }
  }

  // What the columns are; nothing if no row can be read.
  std::optional<CsvLayout> Prepare(const std::vector<CsvCell>& headings) {
    if (options_.set && !sets_.empty()) {
      throw UsageError(fmt::format("--set is for a file that does not name its sets, as {} does",
                                   ShownPath(path_)));
    }
    options_.conditions.ApplyTo(conditions_);
    const auto type = conditions_.color.find(kTypeKey);
    const auto named = type == conditions_.color.end() ? std::nullopt : std::optional(type->second);
    CsvLayout layout(headings, named, faults_);
    const auto has_set = std::any_of(layout.columns.begin(), layout.columns.end(),
                                     [](const auto& column) { return column.role == Role::kSet; });
    if (sets_.size() > 1 && !has_set) {
      faults_.Add(headings.front(), "several sets are named; expected a column 'Set'");
    }
    if (layout.has_spectrum) {
      CompleteSpectrum(headings.front());
    }
    if (!layout.color_space.empty()) {
      CompleteColor(headings.front(), layout.color_space);
    }
    if (faults_.Count() > 0) {
      return std::nullopt;
    }
    ReportDoubts(layout);
    spectrum_conditions_ = ToConditions(conditions_.spectrum);
    color_conditions_ = ToConditions(conditions_.color);
    return layout;
  }

  void ReportDoubts(const CsvLayout& layout) const {
    if (!layout.stray_channels.empty()) {
      Report(fmt::format("{}: warning: no colour space has all of its channels; header values: {}",
                         ShownPath(path_), fmt::join(layout.stray_channels, ", ")));
    } else if (!layout.has_spectrum && layout.color_space.empty()) {
      Report(fmt::format("{}: warning: no column is a wavelength or a channel of a colour",
                         ShownPath(path_)));
    }
  }

  // The columns say the range; the type is that of a reflecting surface unless it is given.
  void CompleteSpectrum(const CsvCell& place) {
    Texts& conditions = conditions_.spectrum;
    conditions.emplace(kSpectrumTypeKey, "Remission");
    conditions.emplace(kPointCountKey, std::to_string(kBands));
    conditions.emplace(kWavelengthMinKey, fmt::format("{}nm", kFirstBand));
    conditions.emplace(kWavelengthMaxKey, fmt::format("{}nm", kLastBand));
    if (conditions[kPointCountKey] != std::to_string(kBands) ||
        Vexdoc::NanometresOf(conditions[kWavelengthMinKey]) != kFirstBand ||
        Vexdoc::NanometresOf(conditions[kWavelengthMaxKey]) != kLastBand) {
      faults_.Add(place, "the conditions name other wavelengths; expected 36 from 380 to 730 nm");
    }
  }

  void CompleteColor(const CsvCell& place, const std::string& color_space) {
    conditions_.color.emplace(kTypeKey, color_space);
    if (color_space == "RGB" || color_space == "CMYK") {
      return;
    }
    for (const std::string& key : {kIlluminationKey, kObserverKey}) {
      if (!conditions_.color.contains(key)) {
        faults_.Add(place,
                    fmt::format("{} of the colours is not given; expected a line # {}=WORD or "
                                "--condition {}=WORD, one of {}",
                                key, key, key, fmt::join(WordsFor(key), ", ")));
      }
    }
  }

  // `faults_before` are those before the record was read.
  void AddRow(const CsvLayout& layout, const std::vector<CsvCell>& record,
              std::size_t faults_before) {
    const std::size_t expected = layout.columns.size();
    if (record.size() != expected) {
      faults_.Add(record[std::min(expected, record.size() - 1)],
                  fmt::format("expected {} cells in the row, found {}", expected, record.size()));
      return;
    }
    const SmartPointer<Vexdoc::Sample> sample(new Vexdoc::Sample(record.front().text));
    AddMeasured(layout, record, *sample);
    ForgetDates(*sample);
    const std::string* set_name = nullptr;
    for (std::size_t i = 1; i < record.size(); ++i) {
      const CsvColumn& column = layout.columns[i];
      const bool is_absent = record[i].IsAbsent();
      if (column.role == Role::kHeader && !is_absent) {
        sample->SetAttribute(column.key, record[i].text);
      } else if (column.role == Role::kSet) {
        set_name = &record[i].text;
        if (is_absent) {
          faults_.Add(record[i], "expected the name of a set");
        }
      } else if (column.role == Role::kNone && !is_absent) {
        faults_.Add(record[i], "a value in a column without heading");
      }
    }
    if (faults_.Count() == faults_before) {
      AddSample(sample, set_name);
    }
  }

  void AddMeasured(const CsvLayout& layout, const std::vector<CsvCell>& record,
                   Vexdoc::Sample& sample) {
    const auto numbers = [&](Role role, std::size_t count) {
      const std::size_t before = faults_.Count();
      std::vector<float> found = Numbers(layout, record, role, count);
      return faults_.Count() == before ? found : std::vector<float>();
    };
    if (layout.has_spectrum) {
      if (const auto bands = numbers(Role::kBand, kBands); !bands.empty()) {
        AddAttribute(sample, new Vexdoc::Spectrum(spectrum_conditions_, bands));
      }
    }
    if (!layout.color_space.empty()) {
      const std::size_t channels = ChannelLabels(layout.color_space).size();
      if (const auto color = numbers(Role::kChannel, channels); !color.empty()) {
        AddAttribute(sample, new Vexdoc::ColorVector(color_conditions_, color));
      }
    }
  }

  // The numbers of one kind in the order of their indices; none if all their cells are empty.
  std::vector<float> Numbers(const CsvLayout& layout, const std::vector<CsvCell>& record, Role role,
                             std::size_t count) {
    std::vector<float> numbers(count);
    std::vector<const CsvCell*> empty;
    for (std::size_t i = 0; i < record.size(); ++i) {
      if (layout.columns[i].role != role) {
        continue;
      }
      if (record[i].text.empty()) {
        empty.push_back(&record[i]);
        continue;
      }
      float& number = numbers[layout.columns[i].index];
      const bool percent = options_.percent && role == Role::kBand;
      if (const char* const fault = ParseNumber(record[i].text, percent, number)) {
        faults_.Add(record[i], fmt::format("'{}' {}", record[i].text, fault));
      }
      has_low_band_ = has_low_band_ || (role == Role::kBand && number <= kHighestReflectance);
      has_band_ = has_band_ || role == Role::kBand;
    }
    if (empty.size() == count) {
      return {};
    }
    for (const CsvCell* const cell : empty) {
      faults_.Add(*cell, fmt::format("a value is missing; expected all {} or none", count));
    }
    return numbers;
  }

  static void AddAttribute(Vexdoc::Sample& sample, Vexdoc::SampleAttribute* attribute) {
    const SmartPointer<Vexdoc::SampleAttribute> owned(attribute);
    ForgetDates(*owned);
    sample.AddSampleAttribute(owned);
  }

  // Equal names stay, as they do in a file; the library would number them.
  void AddSample(const SmartPointer<Vexdoc::Sample>& sample, const std::string* set_name) {
    SetEntry& entry = set_name != nullptr ? FindSet(*set_name)
                      : sets_.empty()     ? FindSet(options_.set.value_or(Stem()))
                                          : sets_.front();
    const std::string name = sample->GetName();
    if (!entry.names.insert(name).second) {
      sample->SetName(fmt::format("{}\n{}", name, ++repeated_));
    }
    entry.set->AddElement(sample);
    sample->SetName(name);
  }

  SetEntry& FindSet(const std::string& name) {
    const auto [place, is_new] = set_places_.try_emplace(name, sets_.size());
    if (is_new) {
      sets_.push_back({SmartPointer<Vexdoc::SampleSet>(new Vexdoc::SampleSet(name)), {}, {}});
    }
    return sets_[place->second];
  }

  std::string Stem() const {
    return path_ == kStandardStream ? "Samples" : std::filesystem::path(path_).stem().string();
  }

  void Finish() {
    if (has_band_ && !has_low_band_ && !options_.percent) {
      Report(fmt::format("{}: warning: every spectral value is above {}; --percent is for percent",
                         ShownPath(path_), kHighestReflectance));
    }
    for (const SetEntry& entry : sets_) {
      document_.AddElement(entry.set);
      ForgetDates(*entry.set);
      SetHeader(*entry.set, entry.header);
    }
    document_.SetName(Stem());
    ForgetDates(document_);
    SetHeader(document_, header_);
  }

  static void SetHeader(Vexdoc::Header& element, const Texts& header) {
    for (const auto& [key, value] : header) {
      element.SetAttribute(key, value);
    }
  }

  const std::string& path_;
  const CsvOptions& options_;
  Vexdoc::VEX& document_;
  std::string text_;
  CsvFaults faults_;
  CsvReader reader_;
  Texts header_;
  KindConditions conditions_;
  Vexdoc::Conditions spectrum_conditions_;
  Vexdoc::Conditions color_conditions_;
  std::deque<SetEntry> sets_;
  std::map<std::string, std::size_t> set_places_;
  std::size_t repeated_ = 0;
  bool has_band_ = false;
  bool has_low_band_ = false;
};

}  // namespace

std::size_t ReadCsv(const std::string& path, const CsvOptions& options, Vexdoc::VEX& document) {
  return CsvImport(path, options, document).Run();
}

}  // namespace Aldermoor::Tool
