#include <memory>
#include <optional>
#include <string>

#include "aldermoor/measure/judgement.h"
#include "aldermoor/vexdoc/conditions.h"
#include "aldermoor/vexdoc/spectrum.h"

#include "coloroptions.h"
#include "command.h"
#include "documents.h"
#include "options.h"
#include "output.h"
#include "records.h"
#include "samplerun.h"
#include "vocabulary.h"

namespace Aldermoor::Tool {
namespace {

class ClassifyJob : public SampleJob {
 public:
  ClassifyJob(const Vexdoc::Conditions& asked, Format format, Output& output, bool with_file)
      : asked_(asked), table_(format, output, with_file, {{"family"}}, asked.GetAttributes()) {}

  void Add(const Place& place, const Vexdoc::Sample& sample) override {
    const Vexdoc::Spectrum& spectrum = ReflectanceOf(sample);
    Vexdoc::Conditions conditions = *spectrum.GetConditions();
    for (const auto& [key, value] : asked_.GetAttributes()) {
      conditions.AddAttribute(key, value);
    }
    if (asked_.HasCustomIllumination()) {
      conditions.SetCustomIllumination(asked_.GetCustomIllumination());
    }
    const std::string family =
        Measure::ColorFamily(Vexdoc::Spectrum(conditions, spectrum.GetData()));
    table_.Add(place, {family});
  }

  void End() override { table_.GetWriter().End(); }

 private:
  const Vexdoc::Conditions& asked_;  // in place of what the sample says
  SampleTable table_;
};

class ClassifyCommand : public Command {
 public:
  void AddOptions(CLI::App& app) override {
    inputs_.AddTo(app);
    AddOption(app, "--illuminant", illuminant_, "WORD",
              "Illuminant in place of that of the sample's conditions: " + IlluminantHelp());
    AddOption(app, "--observer", observer_, "WORD",
              "Observer in place of that of the sample's conditions: " + ShownWords(kObserverKey));
    filter_.AddTo(app);
    output_.AddTo(app, "table csv json");
  }

  ExitStatus Run() override {
    const Format format = output_.GetFormat();
    inputs_.CheckStandardInput(illuminant_ ? IlluminantFile(*illuminant_) : "");
    Vexdoc::Conditions asked;
    if (illuminant_) {
      SetReflectionIlluminant(asked, "--illuminant", *illuminant_);
    }
    if (observer_) {
      asked.AddAttribute(kObserverKey, ConditionValue("--observer", kObserverKey, *observer_));
    }
    Output output(output_.path);
    ClassifyJob job(asked, format, output, inputs_.paths.size() > 1);
    return RunOverSamples(job, inputs_, filter_, output);
  }

 private:
  InputOptions inputs_;
  std::optional<std::string> illuminant_;
  std::optional<std::string> observer_;
  SampleFilter filter_;
  OutputOptions output_;
};

}  // namespace

std::unique_ptr<Command> MakeClassifyCommand() {
  return std::make_unique<ClassifyCommand>();
}

}  // namespace Aldermoor::Tool
