#include <cstddef>
#include <memory>
#include <span>
#include <string>
#include <vector>

#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/sample.h"

#include "colorbatch.h"
#include "coloroptions.h"
#include "command.h"
#include "documents.h"
#include "jobs.h"
#include "output.h"
#include "records.h"
#include "samplerun.h"
#include "vocabulary.h"

namespace Aldermoor::Tool {
namespace {

// Digits that are worth reading in a table: chromaticities are of the order of 1, the rest of 100.
int DecimalsOf(const std::string& space, std::size_t channel) {
  const bool chromaticity = space == "CIExyY" || space == "CIEuvY1960" || space == "CIEuvY1976";
  return chromaticity && channel < 2 ? 4 : space == "RGB" || space == "CMYK" ? 1 : 2;
}

// The channels of the colour space that is asked for, as the library labels them.
std::vector<Column> ChannelColumns(const Vexdoc::Conditions& request) {
  const std::string space = request.GetAttribute(kTypeKey);
  const std::vector<float> zeros(space == "CMYK" ? 4 : 3);
  const Vexdoc::ColorVector black(request, zeros);
  std::vector<Column> columns;
  for (const auto& [label, value] : black.GetDatastore()) {
    columns.push_back({label, DecimalsOf(space, columns.size())});
  }
  return columns;
}

/// Asks every sample for one colour and writes what comes back.
class ColorJob : public SampleJob {
 public:
  ColorJob(const Vexdoc::Conditions& request, const JobOptions& jobs, Format format, Output& output,
           bool with_file)
      : columns_(ChannelColumns(request)),
        batch_(request, columns_.size(), jobs),
        table_(format, output, with_file, columns_, request.GetAttributes()) {}

  void Add(const Place& place, const Vexdoc::Sample& sample) override {
    batch_.Add(place, sample);
    if (batch_.IsFull()) {
      EndDocument();
    }
  }

  void EndDocument() override {
    batch_.Flush([this](const Place& place, std::span<const float> color) {
      cells_.assign(color.begin(), color.end());
      table_.Add(place, cells_);
    });
  }

  void End() override { table_.GetWriter().End(); }

 private:
  const std::vector<Column> columns_;
  ColorBatch batch_;
  std::vector<Cell> cells_;  // reused
  SampleTable table_;
};

class ColorCommand : public Command {
 public:
  void AddOptions(CLI::App& app) override {
    inputs_.AddTo(app);
    color_.AddTo(app);
    filter_.AddTo(app);
    jobs_.AddTo(app);
    output_.AddTo(app, "table csv json");
  }

  ExitStatus Run() override {
    const Format format = output_.GetFormat();
    inputs_.CheckStandardInput(color_.GetIlluminantFile());
    const Vexdoc::Conditions request = color_.MakeConditions();
    Output output(output_.path);
    ColorJob job(request, jobs_, format, output, inputs_.paths.size() > 1);
    return RunOverSamples(job, inputs_, filter_, output);
  }

 private:
  InputOptions inputs_;
  ColorOptions color_;
  SampleFilter filter_;
  JobOptions jobs_;
  OutputOptions output_;
};

}  // namespace

std::unique_ptr<Command> MakeColorCommand() {
  return std::make_unique<ColorCommand>();
}

}  // namespace Aldermoor::Tool
