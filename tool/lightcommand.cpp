#include <array>
#include <limits>
#include <memory>
#include <optional>
#include <stdexcept>
#include <string>
#include <string_view>

#include "aldermoor/measure/light.h"
#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/conditions.h"
#include "aldermoor/vexdoc/spectrum.h"

#include "command.h"
#include "documents.h"
#include "output.h"
#include "records.h"
#include "samplerun.h"
#include "vocabulary.h"

namespace Aldermoor::Tool {
namespace {

constexpr std::string_view kObserver = "TwoDegree";
constexpr float kNone = std::numeric_limits<float>::quiet_NaN();

// The spectrum as that of a lamp.  Most documents say nothing of it, and lamps that were measured
// by way of a white tile say that they reflect.
Vexdoc::Spectrum AsLight(const Vexdoc::Spectrum& spectrum) {
  Vexdoc::Conditions conditions = *spectrum.GetConditions();
  conditions.AddAttribute(kIlluminationKey, kEmission);
  conditions.AddAttribute(kObserverKey, std::string(kObserver));
  conditions.RemoveAttribute(kWhiteBaseKey);
  return {conditions, spectrum.GetData()};
}

// The first two channels in a colour space, and the third.
std::array<float, 3> ColorOf(Vexdoc::Spectrum& light, const char* space) {
  Vexdoc::Conditions request = *light.GetConditions();
  request.AddAttribute(kTypeKey, space);
  const auto result = light.TransformTo("VEXColorVector", request);
  const auto& channels = dynamic_cast<const Vexdoc::ColorVector&>(*result).GetDatastore();
  return {channels.at(0).second, channels.at(1).second, channels.at(2).second};
}

class LightJob : public SampleJob {
 public:
  LightJob(Format format, Output& output, bool with_file)
      : table_(format, output, with_file,
               {{"CCT K"},
                {"Ra"},
                {"valid"},
                {"reference"},
                {"x", 4},
                {"y", 4},
                {"u'", 4},
                {"v'", 4},
                {"read as"},
                {"observer"}},
               {{kIlluminationKey, kEmission}, {kObserverKey, std::string(kObserver)}}) {}

  void Add(const Place& place, const Vexdoc::Sample& sample) override {
    Vexdoc::Spectrum light = AsLight(SpectrumOf(sample));
    const auto [x, y, luminance] = ColorOf(light, "CIExyY");
    const auto [u, v, same] = ColorOf(light, "CIEuvY1976");
    if (!(luminance > 0.0F)) {
      throw std::runtime_error("the spectrum gives no light");
    }
    const std::optional<float> temperature = Measure::ColorTemperature(light);
    Measure::ColorRendering rendering;
    if (temperature) {  // without one there is nothing to take the rendering against
      rendering = Measure::ColorRenderingOf(light);
    }
    const std::string reference = !temperature                  ? ""
                                  : rendering.reference.empty() ? "black body"
                                                                : rendering.reference;
    table_.Add(place, {temperature.value_or(kNone), temperature ? rendering.index : kNone,
                       std::string_view(rendering.valid ? "yes" : "no"), reference, x, y, u, v,
                       kEmission, kObserver});
  }

  void End() override { table_.GetWriter().End(); }

 private:
  SampleTable table_;
};

class LightCommand : public Command {
 public:
  void AddOptions(CLI::App& app) override {
    inputs_.AddTo(app);
    filter_.AddTo(app);
    output_.AddTo(app, "table csv json");
  }

  ExitStatus Run() override {
    const Format format = output_.GetFormat();
    inputs_.CheckStandardInput();
    Output output(output_.path);
    LightJob job(format, output, inputs_.paths.size() > 1);
    return RunOverSamples(job, inputs_, filter_, output);
  }

 private:
  InputOptions inputs_;
  SampleFilter filter_;
  OutputOptions output_;
};

}  // namespace

std::unique_ptr<Command> MakeLightCommand() {
  return std::make_unique<LightCommand>();
}

}  // namespace Aldermoor::Tool
