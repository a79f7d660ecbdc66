#include <algorithm>
#include <map>
#include <set>
#include <string_view>
#include <utility>
#include <vector>

#include <fmt/format.h>

#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/completion.h"
#include "aldermoor/vexdoc/spectrum.h"
#include "aldermoor/vexdoc/wavelengthrange.h"

#include "csvdocument.h"
#include "csvlayout.h"
#include "diagnostics.h"
#include "text.h"
#include "vocabulary.h"

namespace Aldermoor::Tool {
namespace {

using Vexdoc::ColorVector;
using Vexdoc::Header;
using Vexdoc::Sample;
using Vexdoc::SampleAttribute;
using Vexdoc::SampleSet;
using Vexdoc::Spectrum;

constexpr const char* kStandardKeys[] = {Header::kDescriptionKey, Header::kCreatorKey,
                                         Header::kCreatedKey, Header::kModifiedKey};

bool IsStandard(const std::string& key) {
  return key == Header::kNameKey || std::find(std::begin(kStandardKeys), std::end(kStandardKeys),
                                              key) != std::end(kStandardKeys);
}

// An empty standard value is as good as none in a document.
bool IsShown(const std::string& key, const std::string& value) {
  return key != Header::kNameKey && (!IsStandard(key) || !value.empty());
}

/// What of a sample goes into its row.
struct Row {
  const SampleSet* set = nullptr;
  const Sample* sample = nullptr;
  const Spectrum* spectrum = nullptr;
  const ColorVector* color = nullptr;
};

class CsvExport {
 public:
  CsvExport(const Vexdoc::VEX& document, char separator)
      : document_(document), separator_(separator) {}

  CsvText Run() {
    Collect();
    ReportLosses();
    WriteSettings();
    WriteHeadings();
    for (const Row& row : rows_) {
      WriteRow(row);
    }
    return {std::move(out_), faults_};
  }

 private:
  void Collect() {
    std::set<std::string> names;
    for (const auto& [key, set] : document_.GetSampleSets()) {
      if (!names.insert(set->GetName()).second) {
        Fault(fmt::format("a second set '{}'", set->GetName()));
        continue;
      }
      sets_.push_back(set.Get());
      for (const auto& [sample_key, sample] : set->GetSamples()) {
        Row& row = rows_.emplace_back(Row{set.Get(), sample.Get()});
        for (const auto& [attribute_key, attribute] : sample->GetElements()) {
          Take(row, *attribute);
        }
        for (const auto& [name, value] : sample->GetAttributes()) {
          if (IsShown(name, value)) {
            keys_.insert(name);
          }
        }
      }
    }
  }

  void Take(Row& row, const SampleAttribute& attribute) {
    std::string fault;
    if (const auto* const spectrum = dynamic_cast<const Spectrum*>(&attribute)) {
      fault = TakeSpectrum(row, *spectrum);
    } else if (const auto* const color = dynamic_cast<const ColorVector*>(&attribute)) {
      fault = TakeColor(row, *color);
    } else {
      fault = attribute.GetType() == "VEXRecipe" ? "a recipe" : "an attribute of an unknown kind";
    }
    if (!fault.empty()) {
      Fault(fmt::format("set '{}', sample '{}': {}", row.set->GetName(), row.sample->GetName(),
                        fault));
      return;
    }
    for (const auto& [key, value] : attribute.GetAttributes()) {
      if (IsStandard(key) && key != Header::kDescriptionKey && key != Header::kCreatorKey) {
        has_lost_name_ = has_lost_name_ || !value.empty();
      }
    }
  }

  // Returns why the row cannot carry it.
  std::string TakeSpectrum(Row& row, const Spectrum& spectrum) {
    const Vexdoc::Conditions& conditions = *spectrum.GetConditions();
    if (row.spectrum != nullptr) {
      return "a second spectrum";
    }
    if (spectrum.GetData().size() != kBands) {
      return fmt::format("a spectrum of {} values", spectrum.GetData().size());
    }
    const std::string first = conditions.GetAttribute(kWavelengthMinKey, "380nm");
    const std::string last = conditions.GetAttribute(kWavelengthMaxKey, "730nm");
    if (Vexdoc::NanometresOf(first) != kFirstBand || Vexdoc::NanometresOf(last) != kLastBand) {
      return fmt::format("a spectrum from {} to {}, expected 380nm to 730nm", first, last);
    }
    std::string fault = CommonFault(spectrum, spectrum_conditions_, "spectrum");
    if (fault.empty()) {
      row.spectrum = &spectrum;
      spectrum_conditions_ = &conditions;
      is_color_first_ = is_color_first_ || row.color != nullptr;
    }
    return fault;
  }

  std::string TakeColor(Row& row, const ColorVector& color) {
    const Vexdoc::Conditions& conditions = *color.GetConditions();
    if (row.color != nullptr) {
      return "a second colour";
    }
    const std::string type = conditions.GetAttribute(kTypeKey, "");
    const auto words = WordsFor(kTypeKey);
    if (std::find(words.begin(), words.end(), type) == words.end()) {
      return fmt::format("a colour in '{}'", type);
    }
    std::vector<std::string> labels;
    for (const auto& channel : color.GetDatastore()) {
      labels.push_back(channel.first);
    }
    if (labels != ChannelLabels(type)) {
      return fmt::format("a colour with other channels than those of {}", type);
    }
    std::string fault = CommonFault(color, color_conditions_, "colour");
    if (fault.empty()) {
      row.color = &color;
      color_conditions_ = &conditions;
    }
    return fault;
  }

  // `common` are the conditions of the kind so far, null before the first one.
  static std::string CommonFault(const SampleAttribute& attribute, const Vexdoc::Conditions* common,
                                 const char* kind) {
    for (const auto& [key, value] : attribute.GetAttributes()) {
      const bool is_silent =
          key == Header::kNameKey || key == Header::kCreatedKey || key == Header::kModifiedKey;
      if (!is_silent && IsShown(key, value)) {
        return fmt::format("a {} with a header value '{}' of its own", kind, key);
      }
    }
    const Vexdoc::Conditions& own = *attribute.GetConditions();
    if (own.HasCustomIllumination() || own.GetAttribute(kIlluminationKey, "") == kUserdefined) {
      return fmt::format("a {} under an illuminant of the user's own", kind);
    }
    if (common == nullptr || *common == own) {
      return "";
    }
    std::string keys;
    for (const auto& [key, value] : own.GetAttributes()) {
      if (!common->HasAttribute(key) || common->GetAttribute(key) != value) {
        keys += (keys.empty() ? "" : ", ") + key;
      }
    }
    for (const auto& [key, value] : common->GetAttributes()) {
      if (!own.HasAttribute(key)) {
        keys += (keys.empty() ? "" : ", ") + key;
      }
    }
    return fmt::format("a {} under other conditions than the first one ({})", kind, keys);
  }

  void Fault(const std::string& text) {
    constexpr std::size_t kMaxReported = 100;
    if (++faults_ <= kMaxReported) {
      Report(text + "; CSV cannot carry it");
    } else if (faults_ == kMaxReported + 1) {
      Report("and more");
    }
  }

  void ReportLosses() const {
    if (has_lost_name_) {
      Report("names and dates of spectra and colours have no place in CSV and are left out");
    }
    if (is_color_first_) {
      Report("colours that stand in front of a spectrum come behind it from CSV");
    }
  }

  void WriteSettings() {
    WriteSetting(kDocumentPrefix + Header::kNameKey, document_.GetName());
    WriteHeader(kDocumentPrefix, document_);
    for (const SampleSet* const set : sets_) {
      WriteSetting(kSetKey, set->GetName());
      WriteHeader(kSetPrefix, *set);
    }
    if (spectrum_conditions_ != nullptr) {
      WriteConditions(*spectrum_conditions_, "Spectrum.", &Vexdoc::IsConditionOfSpectra,
                      color_conditions_);
    }
    if (color_conditions_ != nullptr) {
      WriteConditions(*color_conditions_, "Color.", &Vexdoc::IsConditionOfColors,
                      spectrum_conditions_);
    }
  }

  // All but the name.
  void WriteHeader(const std::string& prefix, const Header& header) {
    for (const auto& [key, value] : header.GetAttributes()) {
      if (IsShown(key, value)) {
        WriteSetting(prefix + key, value);
      }
    }
  }

  // With a prefix where the bare key would be read otherwise, or into the other kind too.
  void WriteConditions(const Vexdoc::Conditions& conditions, const std::string& prefix,
                       bool (*is_of_kind)(std::string_view), const Vexdoc::Conditions* other) {
    for (const auto& [key, value] : conditions.GetAttributes()) {
      const bool is_bare =
          is_of_kind(key) && IsInVocabulary(key, value) && (key != kCustomKey || other == nullptr);
      WriteSetting((is_bare ? "" : prefix) + key, value);
    }
  }

  void WriteSetting(const std::string& key, const std::string& value) {
    if (key.find('=') != std::string::npos) {
      Fault(fmt::format("a key with '=' in it, '{}'", key));
      return;
    }
    Cell(fmt::format("# {}={}", key, value));
    EndRow();
  }

  void WriteHeadings() {
    Cell(kNameHeading);
    if (sets_.size() > 1) {
      Cell(kSetHeading);
    }
    for (const char* const key : kStandardKeys) {
      if (keys_.erase(key) > 0) {
        columns_.emplace_back(key);
      }
    }
    columns_.insert(columns_.end(), keys_.begin(), keys_.end());
    for (const std::string& key : columns_) {
      Cell(HeadingFor(key));
    }
    if (spectrum_conditions_ != nullptr) {
      for (int wavelength = kFirstBand; wavelength <= kLastBand; wavelength += kBandStep) {
        Cell(std::to_string(wavelength));
      }
    }
    if (color_conditions_ != nullptr) {
      for (const std::string& label : ChannelLabels(color_conditions_->GetAttribute(kTypeKey))) {
        Cell(label);
      }
    }
    EndRow();
  }

  void WriteRow(const Row& row) {
    Cell(row.sample->GetName());
    if (sets_.size() > 1) {
      Cell(row.set->GetName());
    }
    const auto& header = row.sample->GetAttributes();
    for (const std::string& key : columns_) {
      const auto found = header.find(key);
      if (found != header.end() && IsShown(key, found->second)) {
        Cell(found->second);
      } else {
        Separate();
      }
    }
    if (spectrum_conditions_ != nullptr) {
      for (std::size_t i = 0; i < kBands; ++i) {
        Separate();
        if (row.spectrum != nullptr) {
          AppendNumber(out_, row.spectrum->GetData()[i]);
        }
      }
    }
    if (color_conditions_ != nullptr) {
      const std::string type = color_conditions_->GetAttribute(kTypeKey);
      for (std::size_t i = 0; i < ChannelLabels(type).size(); ++i) {
        Separate();
        if (row.color != nullptr) {
          AppendNumber(out_, row.color->GetDatastore()[i].second);
        }
      }
    }
    EndRow();
  }

  // An empty text is not the same as no value.
  void Cell(const std::string& text) {
    Separate();
    const char special[] = {separator_, '"', '\r', '\n', '\0'};
    if (!text.empty() && text.find_first_of(special) == std::string::npos) {
      out_ += text;
      return;
    }
    out_ += '"';
    for (const char c : text) {
      out_.append(c == '"' ? 2 : 1, c);
    }
    out_ += '"';
  }

  void Separate() {
    if (!is_row_start_) {
      out_ += separator_;
    }
    is_row_start_ = false;
  }

  void EndRow() {
    out_ += '\n';
    is_row_start_ = true;
  }

  const Vexdoc::VEX& document_;
  char separator_;
  std::vector<const SampleSet*> sets_;
  std::vector<Row> rows_;
  std::set<std::string> keys_;  // of the samples' headers
  const Vexdoc::Conditions* spectrum_conditions_ = nullptr;
  const Vexdoc::Conditions* color_conditions_ = nullptr;
  std::vector<std::string> columns_;
  bool has_lost_name_ = false;
  bool is_color_first_ = false;
  std::size_t faults_ = 0;
  std::string out_;
  bool is_row_start_ = true;
};

}  // namespace

CsvText WriteCsv(const Vexdoc::VEX& document, const CsvOptions& options) {
  return CsvExport(document, options.separator).Run();
}

}  // namespace Aldermoor::Tool
