#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "aldermoor/measure/judgement.h"
#include "aldermoor/vexdoc/conditions.h"
#include "aldermoor/vexdoc/spectrum.h"

#include "coloroptions.h"
#include "command.h"
#include "documents.h"
#include "illuminant.h"
#include "options.h"
#include "output.h"
#include "records.h"
#include "samplepairs.h"
#include "samplerun.h"
#include "text.h"
#include "vocabulary.h"

namespace Aldermoor::Tool {
namespace {

/// A light under which pairs are compared.
struct TestLight {
  std::string word;
  Vexdoc::Conditions conditions;
};

class MetamerismCommand : public Command {
 public:
  void AddOptions(CLI::App& app) override {
    AddArgument(app, "A", first_, "Document of the first samples; - is standard input");
    AddArgument(app, "B", second_, "Document of the second samples");
    AddOption(app, "--reference", reference_, "WORD",
              "Illuminant under which the pairs match: " + IlluminantHelp());
    AddOption(app, "--test", tests_, "WORD,...",
              "Named illuminants under which they may not, with commas between them");
    AddOption(app, "--observer", observer_, "WORD", "Observer: " + ShownWords(kObserverKey));
    filter_.AddTo(app);
    output_.AddTo(app, "table csv json");
  }

  ExitStatus Run() override {
    const Format format = output_.GetFormat();
    CheckStandardInput();
    Vexdoc::Conditions conditions;
    conditions.AddAttribute(kObserverKey, ConditionValue("--observer", kObserverKey, observer_));
    SetReflectionIlluminant(conditions, "--reference", reference_);
    const std::vector<TestLight> lights = MakeTestLights(conditions);
    Output output(output_.path);
    Vexdoc::VEX first;
    Vexdoc::VEX second;
    LoadDocument(first_, first);
    LoadDocument(second_, second);
    const SamplePairs matched(first_, first, second_, second, filter_);
    bool complete = matched.ReportUnpaired();
    std::vector<Column> columns;
    for (const TestLight& light : lights) {
      columns.push_back({light.word, 2});
    }
    SampleTable table(format, output, false, columns, conditions.GetAttributes());
    for (const SamplePair& pair : matched.pairs) {
      complete &= AddPair(table, pair, conditions, lights);
    }
    table.GetWriter().End();
    output.Commit();
    return complete ? ExitStatus::kDone : ExitStatus::kSomeFailed;
  }

 private:
  void CheckStandardInput() const {
    InputOptions all;
    all.paths = {first_, second_};
    all.CheckStandardInput(IlluminantFile(reference_));
  }

  std::vector<TestLight> MakeTestLights(const Vexdoc::Conditions& reference) const {
    std::vector<TestLight> lights;
    for (const std::string_view word : SplitAtCommas(tests_)) {
      if (word.starts_with(kSpectrumMark)) {
        throw UsageError("--test: a test light needs a name; a spectrum can be the reference only");
      }
      TestLight& light = lights.emplace_back(TestLight{std::string(word), reference});
      SetReflectionIlluminant(light.conditions, "--test", light.word);
    }
    return lights;
  }

  bool AddPair(SampleTable& table, const SamplePair& pair, const Vexdoc::Conditions& conditions,
               const std::vector<TestLight>& lights) const {
    const Place place{second_, pair.set, pair.name};
    return TryFor(place, *pair.sample, [&] {
      const Vexdoc::Spectrum& first =
          OnReference([&]() -> const Vexdoc::Spectrum& { return ReflectanceOf(*pair.reference); });
      const Vexdoc::Spectrum& second = ReflectanceOf(*pair.sample);
      std::vector<Cell> cells;
      for (const TestLight& light : lights) {
        cells.emplace_back(Measure::MetamerismIndex(first, second, conditions, light.conditions));
      }
      table.Add(place, cells);
    });
  }

  std::string first_;
  std::string second_;
  std::string reference_ = "D65";
  std::string tests_ = "A,F11";
  std::string observer_ = "TwoDegree";
  SampleFilter filter_;
  OutputOptions output_;
};

}  // namespace

std::unique_ptr<Command> MakeMetamerismCommand() {
  return std::make_unique<MetamerismCommand>();
}

}  // namespace Aldermoor::Tool
