#include <cstddef>
#include <exception>
#include <filesystem>
#include <memory>
#include <optional>
#include <sstream>
#include <stdexcept>
#include <string>
#include <string_view>
#include <system_error>
#include <utility>
#include <vector>

#include <fmt/format.h>

#include "aldermoor/measure/judgement.h"
#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/conditions.h"
#include "aldermoor/vexdoc/spectrum.h"
#include "aldermoor/vexdoc/vex.h"

#include "coloroptions.h"
#include "command.h"
#include "diagnostics.h"
#include "documents.h"
#include "options.h"
#include "output.h"
#include "records.h"
#include "requestedcolor.h"
#include "samplerun.h"
#include "text.h"
#include "vocabulary.h"

namespace Aldermoor::Tool {
namespace {

constexpr std::size_t kChannels = 3;
constexpr int kReflectanceDecimals = 4;
const std::string kSetOfArguments = "colours";

/// A spectrum that was found for a colour.
struct Found {
  std::string set;
  std::string sample;
  Vexdoc::Spectrum spectrum;
};

std::string BandName(std::size_t band) {
  return std::to_string(380 + 10 * band);
}

void WriteRecords(Format format, Output& output, const std::vector<Found>& all,
                  const Vexdoc::Conditions& request) {
  std::vector<Column> columns;
  for (std::size_t band = 0; band < kBands; ++band) {
    columns.push_back({BandName(band)});
  }
  SampleTable table(format, output, false, columns, request.GetAttributes());
  for (const Found& found : all) {
    const std::vector<float>& values = found.spectrum.GetData();
    table.Add({"", found.set, found.sample}, {values.begin(), values.end()});
  }
  table.GetWriter().End();
}

// 36 columns fit on no screen.
void WriteTable(Output& output, const std::vector<Found>& all) {
  std::vector<Column> columns = {{"nm"}};
  for (const Found& found : all) {
    columns.push_back({OnOneLine(found.sample), kReflectanceDecimals});
  }
  const auto writer = MakeRecordWriter(Format::kTable, output, columns, {});
  for (std::size_t band = 0; band < kBands; ++band) {
    const std::string wavelength = BandName(band);
    std::vector<Cell> record = {std::string_view(wavelength)};
    for (const Found& found : all) {
      record.emplace_back(found.spectrum.GetData()[band]);
    }
    writer->Add(record);
  }
  writer->End();
}

void WriteDocument(Output& output, const std::vector<Found>& all) {
  Vexdoc::VEX document("spectra");
  for (const Found& found : all) {
    Vexdoc::Sample sample(found.sample);
    sample.AddSampleAttribute(Utilities::Tools::SmartPointer<Vexdoc::SampleAttribute>(
        new Vexdoc::Spectrum(found.spectrum)));
    document.AddSample(found.set, sample);
  }
  std::ostringstream text;
  document.Store(text);
  output.Write(text.str());
}

// Also under two names; of files that are still to be made, by their paths.
bool IsSameFile(const std::string& a, const std::string& b) {
  namespace fs = std::filesystem;
  std::error_code error;
  if (a == b || fs::equivalent(a, b, error)) {
    return true;
  }
  const fs::path whole = fs::weakly_canonical(fs::absolute(a), error);
  return !whole.empty() && whole == fs::weakly_canonical(fs::absolute(b), error);
}

class SpectrumCommand : public Command {
 public:
  void AddOptions(CLI::App& app) override {
    AddOptionalArguments(app, "COLOUR", colors_,
                         "Channel values with commas between them, such as 50,20,10");
    AddOption(app, "--input", input_, "FILE", "Take the colours of the samples of this document");
    AddOption(app, "--space", color_.space, "WORD", fmt::format("Colour space: {}", kSpaces));
    color_.AddViewingTo(app);
    AddOption(app, "--save", save_, "FILE", "Write the spectra as a document too");
    filter_.AddTo(app);
    output_.AddTo(app, "table csv json");
  }

  ExitStatus Run() override {
    const Format format = output_.GetFormat();
    const Vexdoc::Conditions request = MakeRequest();
    if (save_ && IsSameFile(*save_, output_.path)) {
      throw UsageError("--save and --output name the same file");
    }
    const auto arguments = ParseColors();
    Output output(output_.path);
    std::optional<Output> saved;
    if (save_) {
      saved.emplace(*save_);
    }
    std::vector<Found> all;
    const bool complete =
        input_ ? FromDocument(request, all) : FromArguments(request, arguments, all);
    if (all.empty()) {
      return ExitStatus::kSomeFailed;  // the old output stays
    }
    if (format == Format::kTable) {
      WriteTable(output, all);
    } else {
      WriteRecords(format, output, all, request);
    }
    if (saved) {
      WriteDocument(*saved, all);
      saved->Commit();
    }
    output.Commit();
    return complete ? ExitStatus::kDone : ExitStatus::kSomeFailed;
  }

 private:
  // The ones that can be taken to CIELab.
  static constexpr std::string_view kSpaces = "CIELab CIEXYZ RGB";

  Vexdoc::Conditions MakeRequest() const {
    if (colors_.empty() == !input_) {
      throw UsageError("either colours or --input are needed");
    }
    if (!input_ && filter_.IsSet()) {
      throw UsageError("--set and --sample need --input");
    }
    InputOptions all;
    all.paths = {input_.value_or("")};
    all.CheckStandardInput(color_.GetIlluminantFile());
    CheckWord("--space", color_.space, SplitWords(kSpaces));
    Vexdoc::Conditions request = color_.MakeConditions();
    if (color_.illuminant == kEmission) {
      throw UsageError("--illuminant: the spectra are those of reflecting samples");
    }
    return request;
  }

  std::vector<std::vector<float>> ParseColors() const {
    std::vector<std::vector<float>> all;
    for (const std::string& text : colors_) {
      const auto numbers = ParseNumbers(text);
      if (!numbers || numbers->size() != kChannels) {
        throw UsageError(
            fmt::format("'{}' is not of {} numbers with commas between them", text, kChannels));
      }
      all.push_back(*numbers);
    }
    return all;
  }

  bool FromArguments(const Vexdoc::Conditions& request,
                     const std::vector<std::vector<float>>& arguments,
                     std::vector<Found>& all) const {
    bool complete = true;
    for (std::size_t i = 0; i < arguments.size(); ++i) {
      try {
        const Vexdoc::ColorVector color(request, arguments[i]);
        all.push_back({kSetOfArguments, colors_[i], Measure::SpectrumOfColor(color)});
      } catch (const std::exception& e) {
        Report(fmt::format("{}: no reflectance spectrum was found: {}", colors_[i], e.what()));
        complete = false;
      }
    }
    return complete;
  }

  bool FromDocument(const Vexdoc::Conditions& request, std::vector<Found>& all) const {
    Vexdoc::VEX document;
    LoadDocument(*input_, document);
    bool complete = true;
    const std::size_t matched = filter_.ForEachSample(
        document,
        [&](const std::string& set, const std::string& name, const Vexdoc::Sample& sample) {
          complete &= TryFor({*input_, set, name}, sample, [&] {
            const Vexdoc::ColorVector color = RequestedColor(sample, request);
            all.push_back({set, name, Measure::SpectrumOfColor(color)});
          });
        });
    if (matched == 0 && filter_.IsSet()) {
      Report(filter_.NoMatchText());
      complete = false;
    }
    return complete;
  }

  std::vector<std::string> colors_;
  std::optional<std::string> input_;
  ColorOptions color_;
  std::optional<std::string> save_;
  SampleFilter filter_;
  OutputOptions output_;
};

}  // namespace

std::unique_ptr<Command> MakeSpectrumCommand() {
  return std::make_unique<SpectrumCommand>();
}

}  // namespace Aldermoor::Tool
