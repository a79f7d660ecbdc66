#include <cstddef>
#include <exception>
#include <map>
#include <memory>
#include <stdexcept>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include <CLI/CLI.hpp>
#include <fmt/format.h>

#include "aldermoor/utilities/tools/smartpointer.h"
#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/sample.h"
#include "aldermoor/vexdoc/spectrum.h"

#include "coloroptions.h"
#include "command.h"
#include "diagnostics.h"
#include "documents.h"
#include "output.h"
#include "records.h"
#include "vocabulary.h"

namespace Aldermoor::Tool {
namespace {

const std::string kColorVectorType = "VEXColorVector";

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

// A stored colour can be converted to another colour space but not to another illuminant, and the
// library hands it back under its own conditions.  Results in RGB and CMYK name none, and the
// colour of a light is its own whatever illuminant is asked for.
void CheckHoldsFor(const Vexdoc::Conditions& request, const Vexdoc::ColorVector& color) {
  const Vexdoc::Conditions& own = *color.GetConditions();
  const std::string space = own.GetAttribute(kTypeKey, "");
  if (space == "RGB" || space == "CMYK") {
    return;
  }
  for (const std::string* const key : {&kIlluminationKey, &kObserverKey, &kWhiteBaseKey}) {
    const auto wanted = request.GetAttributes().find(*key);
    if (wanted == request.GetAttributes().end()) {
      continue;
    }
    const auto found = own.GetAttributes().find(*key);
    if (key == &kIlluminationKey && found != own.GetAttributes().end() &&
        found->second == kEmission) {
      continue;
    }
    if (found == own.GetAttributes().end() || found->second != wanted->second) {
      throw std::runtime_error(
          fmt::format("the colour holds for {} '{}' and cannot be computed for '{}'", *key,
                      found == own.GetAttributes().end() ? "" : found->second, wanted->second));
    }
    if (found->second == kUserdefined &&
        (!own.HasCustomIllumination() ||
         own.GetCustomIllumination().GetData() != request.GetCustomIllumination().GetData())) {
      throw std::runtime_error("the colour holds for another user-defined illuminant");
    }
  }
}

/// Asks every sample that it is given for one colour and writes what comes back.
class ColorRun {
 public:
  ColorRun(const Vexdoc::Conditions& request, Format format, Output& output, bool with_file)
      : request_(request), with_file_(with_file) {
    std::vector<Column> columns = ChannelColumns(request);
    channels_ = columns.size();
    if (with_file) {
      leading_.push_back({"file"});
    }
    leading_.push_back({"set"});
    leading_.push_back({"sample"});
    columns.insert(columns.begin(), leading_.begin(), leading_.end());
    record_.resize(columns.size());
    writer_ = MakeRecordWriter(format, output, std::move(columns), request.GetAttributes());
  }

  void Add(const std::string& file, const std::string& set, const std::string& name,
           const Vexdoc::Sample& sample) {
    try {
      const auto result = sample.GetSampleAttribute(kColorVectorType, request_, false);
      const auto& color = dynamic_cast<const Vexdoc::ColorVector&>(*result);
      CheckHoldsFor(request_, color);
      Write(file, set, name, color);
    } catch (const OutputError&) {
      throw;
    } catch (const std::exception& e) {
      failed_ = true;
      const std::string content = DescribeAttributes(sample);
      Report(fmt::format("{}: {}/{}: {}{}{}{}", file, set, name, e.what(),
                         content.empty() ? "" : " (the sample holds ", content,
                         content.empty() ? "" : ")"));
    }
  }

  void End() { writer_->End(); }
  bool HasFailed() const { return failed_; }

 private:
  void Write(const std::string& file, const std::string& set, const std::string& name,
             const Vexdoc::ColorVector& color) {
    const auto& channels = color.GetDatastore();
    if (channels.size() != channels_) {
      throw std::runtime_error(fmt::format("the colour has {} channels", channels.size()));
    }
    auto cell = record_.begin();
    if (with_file_) {
      *cell++ = std::string_view(file);
    }
    *cell++ = std::string_view(set);
    *cell++ = std::string_view(name);
    for (const auto& channel : channels) {
      *cell++ = channel.second;
    }
    writer_->Add(record_);
  }

  const Vexdoc::Conditions& request_;
  bool with_file_;
  std::vector<Column> leading_;
  std::size_t channels_ = 0;
  std::vector<Cell> record_;  // reused
  std::unique_ptr<RecordWriter> writer_;
  bool failed_ = false;
};

class ColorCommand : public Command {
 public:
  void AddOptions(CLI::App& app) override {
    inputs_.AddTo(app);
    color_.AddTo(app);
    filter_.AddTo(app);
    output_.AddTo(app, "table csv json");
  }

  ExitStatus Run() override {
    const Format format = output_.GetFormat();
    inputs_.CheckStandardInput(color_.GetIlluminantFile());
    const Vexdoc::Conditions request = color_.MakeConditions();
    Output output(output_.path);
    ColorRun run(request, format, output, inputs_.paths.size() > 1);
    std::size_t documents = 0;
    std::size_t matched = 0;
    ExitStatus status =
        inputs_.ForEachDocument([&](const std::string& path, const Vexdoc::VEX& document) {
          ++documents;
          matched += AddDocument(run, path, document);
        });
    if (documents == 0) {
      return status;  // the old output stays
    }
    if (matched == 0 && filter_.IsSet()) {
      Report(filter_.NoMatchText());
      status = Worse(status, ExitStatus::kSomeFailed);
    }
    run.End();
    output.Commit();
    return run.HasFailed() ? Worse(status, ExitStatus::kSomeFailed) : status;
  }

 private:
  std::size_t AddDocument(ColorRun& run, const std::string& path,
                          const Vexdoc::VEX& document) const {
    const auto nothing = [](const auto&, const auto&, const auto&) {
    };
    Progress progress(filter_.ForEachSample(document, nothing));
    return filter_.ForEachSample(document, [&](const std::string& set, const std::string& name,
                                               const Vexdoc::Sample& sample) {
      run.Add(path, set, name, sample);
      progress.Step();
    });
  }

  InputOptions inputs_;
  ColorOptions color_;
  SampleFilter filter_;
  OutputOptions output_;
};

}  // namespace

std::unique_ptr<Command> MakeColorCommand() {
  return std::make_unique<ColorCommand>();
}

}  // namespace Aldermoor::Tool
