#include <cmath>
#include <limits>
#include <map>
#include <memory>
#include <optional>
#include <stdexcept>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include <fmt/format.h>
#include <fmt/ranges.h>

#include "aldermoor/measure/density.h"
#include "aldermoor/measure/paperwhite.h"
#include "aldermoor/measure/printcontrol.h"
#include "aldermoor/vexdoc/spectrum.h"

#include "command.h"
#include "documents.h"
#include "illuminant.h"
#include "options.h"
#include "output.h"
#include "records.h"
#include "samplerun.h"
#include "vocabulary.h"

namespace Aldermoor::Tool {
namespace {

using Measure::DensityChannel;
using Measure::DensityMode;

const std::string kStandardKey = "Colorimetric.DensityStandard";
const std::string kModeKey = "Colorimetric.DensityFilterMode";
constexpr int kDensityDecimals = 3;
constexpr float kAsPercent = 100.0F;
const std::string kShown = "the document";  // its name stands in front of the message

/// What densities are asked for.
struct Request {
  std::string standard_word = "DIN";
  std::string mode_word = "Auto";
  bool absolute = false;
  float yule_nielsen = 1.0F;

  Measure::DensityOptions options;
  DensityMode mode = DensityMode::Auto;

  std::map<std::string, std::string> GetConditions() const {
    return {{kStandardKey, standard_word},
            {kModeKey, mode_word},
            {"relative to paper", options.paper_relative ? "yes" : "no"}};
  }

  /// The channel in which fields are compared with `field`: its own if none is asked for.
  DensityMode ModeFor(const Vexdoc::Spectrum& field) const {
    return mode == DensityMode::Auto
               ? static_cast<DensityMode>(Measure::DensityOf(field, mode, options).channel)
               : mode;
  }
};

std::string WordOf(DensityMode mode) {
  return mode == DensityMode::Max ? "Max" : Measure::NameOf(static_cast<DensityChannel>(mode));
}

/// The density that is reported, and the channel or wavelength to which it belongs.
std::pair<float, std::string> Reported(const Vexdoc::Spectrum& field, const Request& request) {
  if (request.mode == DensityMode::Max) {
    const auto densest = Measure::MaximumDensityOf(field, request.options.paper_relative);
    return {densest.value, fmt::format("{}nm", densest.wavelength)};
  }
  const auto density = Measure::DensityOf(field, request.mode, request.options);
  return {density.value, Measure::NameOf(density.channel)};
}

/// Densities of every sample, and how it compares with the solid of its channel.
class DensityJob : public SampleJob {
 public:
  DensityJob(const Request& request, const std::optional<SpectrumPath>& paper,
             const std::vector<SpectrumPath>& solids, Format format, Output& output, bool with_file)
      : request_(request),
        paper_path_(paper),
        solid_paths_(solids),
        table_(format, output, with_file, Columns(!solids.empty()), request.GetConditions()) {}

  void Begin(const std::string& /*path*/, const Vexdoc::VEX& document) override {
    solids_.clear();
    if (paper_path_) {
      paper_.emplace(paper_path_->FindIn(document, kShown));
    }
    for (const SpectrumPath& solid_path : solid_paths_) {
      const Vexdoc::Spectrum solid = solid_path.FindIn(document, kShown);
      const DensityMode mode = request_.ModeFor(solid);
      if (!solids_.try_emplace(mode, Solid{solid_path.sample, solid}).second) {
        throw std::runtime_error(fmt::format("--solid: '{}' and '{}' are both of channel {}",
                                             solids_.at(mode).name, solid_path.sample,
                                             WordOf(mode)));
      }
    }
  }

  void Add(const Place& place, const Vexdoc::Sample& sample) override {
    const Vexdoc::Spectrum& field = ReflectanceOf(sample);
    const Measure::Densities all = Measure::DensitiesOf(field, request_.options);
    const auto [density, channel] = Reported(field, request_);
    std::vector<Cell> cells = {all.black,  all.cyan, all.magenta,
                               all.yellow, density,  std::string_view(channel)};
    if (!solid_paths_.empty()) {
      AddComparison(field, cells);
    }
    table_.Add(place, cells);
  }

  void End() override { table_.GetWriter().End(); }

 private:
  struct Solid {
    std::string name;
    Vexdoc::Spectrum spectrum;
  };

  static std::vector<Column> Columns(bool with_solid) {
    constexpr int kDecimals = kDensityDecimals;
    std::vector<Column> columns = {{"Black", kDecimals},   {"Cyan", kDecimals},
                                   {"Magenta", kDecimals}, {"Yellow", kDecimals},
                                   {"density", kDecimals}, {"channel"}};
    if (with_solid) {
      columns.insert(columns.end(), {{"solid"}, {"dot area %", 1}, {"contrast %", 1}});
    }
    return columns;
  }

  void AddComparison(const Vexdoc::Spectrum& field, std::vector<Cell>& cells) const {
    const DensityMode mode = request_.ModeFor(field);
    const auto solid = solids_.find(mode);
    if (solid == solids_.end()) {
      constexpr float kNone = std::numeric_limits<float>::quiet_NaN();
      cells.insert(cells.end(), {std::string_view(), kNone, kNone});
      return;
    }
    const Vexdoc::Spectrum& spectrum = solid->second.spectrum;
    cells.insert(cells.end(),
                 {std::string_view(solid->second.name),
                  kAsPercent * Measure::DotArea(spectrum, field, mode, request_.options.standard,
                                                request_.yule_nielsen),
                  kAsPercent * Measure::PrintContrast(spectrum, field, mode, request_.options)});
  }

  const Request& request_;
  const std::optional<SpectrumPath>& paper_path_;
  const std::vector<SpectrumPath>& solid_paths_;
  std::optional<Measure::PaperWhite> paper_;
  std::map<DensityMode, Solid> solids_;  // of the document at hand
  SampleTable table_;
};

/// The fields of which trapping is computed.
struct TrappingFields {
  SpectrumPath first;
  SpectrumPath second;
  SpectrumPath overprint;
};

/// How an overprint takes its second ink.
class TrappingJob : public SampleJob {
 public:
  TrappingJob(const Request& request, const SpectrumPath& paper, const TrappingFields& fields,
              Format format, Output& output, bool with_file)
      : request_(request),
        paper_path_(paper),
        fields_(fields),
        table_(format, output, with_file, {{"first"}, {"second"}, {"channel"}, {"trapping %", 1}},
               request.GetConditions()) {}

  void Begin(const std::string& /*path*/, const Vexdoc::VEX& document) override {
    (void)fields_.overprint.FindIn(document, kShown);  // the others may be fine without it
    paper_.emplace(paper_path_.FindIn(document, kShown));
    first_ = fields_.first.FindIn(document, kShown);
    second_ = fields_.second.FindIn(document, kShown);
  }

  void Add(const Place& place, const Vexdoc::Sample& sample) override {
    const DensityMode mode = request_.ModeFor(second_);
    const float trapping =
        Measure::Trapping(first_, second_, ReflectanceOf(sample), mode, request_.options.standard);
    const std::string channel = WordOf(mode);
    table_.Add(place,
               {std::string_view(fields_.first.sample), std::string_view(fields_.second.sample),
                std::string_view(channel), kAsPercent * trapping});
  }

  void End() override { table_.GetWriter().End(); }

 private:
  const Request& request_;
  const SpectrumPath& paper_path_;
  const TrappingFields& fields_;
  std::optional<Measure::PaperWhite> paper_;
  Vexdoc::Spectrum first_;
  Vexdoc::Spectrum second_;
  SampleTable table_;
};

class DensityCommand : public Command {
 public:
  void AddOptions(CLI::App& app) override {
    inputs_.AddTo(app);
    AddOption(app, "--standard", request_.standard_word, "WORD",
              fmt::format("Standard: {}", fmt::join(Standards(), " ")));
    AddOption(app, "--filter", request_.mode_word, "WORD",
              "Channel that is reported: " + ShownWords(kModeKey));
    AddPath(app, "--paper", paper_, "Paper, to which densities are then relative");
    AddFlag(app, "--absolute", request_.absolute, "Leave densities absolute in spite of --paper");
    AddOption(app, "--solid", solids_, "SET/SAMPLE",
              "Solid, for dot area and contrast; may be repeated, one for each channel");
    AddOption(app, "--yule-nielsen", yule_nielsen_, "N", "Yule-Nielsen factor of the dot area");
    AddPath(app, "--first", first_, "For trapping: the solid that is printed first");
    AddPath(app, "--second", second_, "For trapping: the solid that is printed on it");
    AddPath(app, "--overprint", overprint_, "For trapping: the field with both");
    filter_.AddTo(app);
    output_.AddTo(app, "table csv json");
  }

  ExitStatus Run() override {
    const Format format = output_.GetFormat();
    CompleteRequest();
    const std::optional<SpectrumPath> paper = PathOf("--paper", paper_);
    const bool with_file = inputs_.paths.size() > 1;
    if (first_ || second_ || overprint_) {
      const TrappingFields fields = MakeTrappingFields();
      SampleFilter overprint;
      overprint.set = fields.overprint.set;
      overprint.sample = fields.overprint.sample;
      Output output(output_.path);
      TrappingJob job(request_, *paper, fields, format, output, with_file);
      return RunOverSamples(job, inputs_, overprint, output);
    }
    std::vector<SpectrumPath> solids;
    for (const std::string& solid : solids_) {
      solids.push_back(*PathOf("--solid", solid));
    }
    Output output(output_.path);
    DensityJob job(request_, paper, solids, format, output, with_file);
    return RunOverSamples(job, inputs_, filter_, output);
  }

 private:
  // Without "User": the program has no way to set its curves.
  static std::vector<std::string_view> Standards() {
    std::vector<std::string_view> words = WordsFor(kStandardKey);
    std::erase(words, "User");
    return words;
  }

  static void AddPath(CLI::App& app, const char* option, std::optional<std::string>& path,
                      const char* help) {
    AddOption(app, option, path, "SET/SAMPLE", help);
  }

  static std::optional<SpectrumPath> PathOf(const std::string& option,
                                            const std::optional<std::string>& text) {
    return text ? std::optional(SpectrumPath::ParseWithin(*text, option)) : std::nullopt;
  }

  void CompleteRequest() {
    inputs_.CheckStandardInput();
    CheckWord("--standard", request_.standard_word, Standards());
    request_.options.standard = Measure::DensityStandardOf(request_.standard_word);
    request_.options.paper_relative = paper_ && !request_.absolute;
    request_.mode =
        Measure::DensityModeOf(ConditionValue("--filter", kModeKey, request_.mode_word));
    request_.yule_nielsen = yule_nielsen_.value_or(1.0F);
    if (!(request_.yule_nielsen > 0.0F) || !std::isfinite(request_.yule_nielsen)) {
      throw UsageError("--yule-nielsen: the factor is a number above 0");
    }
    if (yule_nielsen_ && solids_.empty()) {
      throw UsageError("--yule-nielsen is for the dot area, which needs --solid");
    }
    if (!paper_ && (!solids_.empty() || first_ || request_.absolute)) {
      throw UsageError(fmt::format("{} needs --paper", !solids_.empty() ? "--solid"
                                                       : first_         ? "--first"
                                                                        : "--absolute"));
    }
    if (solids_.size() > 1 && request_.mode != DensityMode::Auto) {
      throw UsageError("--solid can be repeated with --filter Auto only");
    }
  }

  TrappingFields MakeTrappingFields() const {
    if (!first_ || !second_ || !overprint_) {
      throw UsageError("trapping needs --first, --second and --overprint together");
    }
    if (!solids_.empty() || filter_.IsSet() || request_.absolute) {
      throw UsageError("trapping goes without --solid, --set, --sample and --absolute");
    }
    return {*PathOf("--first", first_), *PathOf("--second", second_),
            *PathOf("--overprint", overprint_)};
  }

  InputOptions inputs_;
  Request request_;
  std::optional<std::string> paper_;
  std::vector<std::string> solids_;
  std::optional<float> yule_nielsen_;
  std::optional<std::string> first_;
  std::optional<std::string> second_;
  std::optional<std::string> overprint_;
  SampleFilter filter_;
  OutputOptions output_;
};

}  // namespace

std::unique_ptr<Command> MakeDensityCommand() {
  return std::make_unique<DensityCommand>();
}

}  // namespace Aldermoor::Tool
