#include "benchmarks/attributebenchmark.h"

#include <array>
#include <string>
#include <vector>

#include "aldermoor/tristim/hxcolorvector.h"
#include "aldermoor/tristim/hxmeasureconditions.h"
#include "aldermoor/tristim/hxspectrum.h"
#include "aldermoor/tristim/internals/colormath.h"
#include "aldermoor/tristim/internals/tristimfilter.h"
#include "aldermoor/tristim/tristimservice.h"
#include "aldermoor/vexdoc/colorimetrybridge.h"
#include "aldermoor/vexdoc/colorspace.h"
#include "aldermoor/vexdoc/internals/conditionmanager.h"
#include "aldermoor/vexdoc/sample.h"

namespace Aldermoor::Benchmarks {
namespace {

using benchmark::DoNotOptimize;
using Tristim::HXMeasureConditions;
using Tristim::HXSpectrum;
using Tristim::TristimService;
using Tristim::Internals::TristimFilter;
using Vexdoc::Conditions;
using Vexdoc::Spectrum;
using Vexdoc::Internals::ConditionManager;

constexpr double kTargetMicroseconds = 2.0;
constexpr double kMicro = 1e-6;
constexpr const char* kType = "VEXColorVector";

Conditions SpectrumConditions() {
  Conditions conditions;
  conditions.AddAttribute("Physical.NumberOfDataPointsSpectrum", "36");
  conditions.AddAttribute("Physical.SpectrumType", "Remission");
  conditions.AddAttribute("Physical.WavelengthSpectrumMax", "730nm");
  conditions.AddAttribute("Physical.WavelengthSpectrumMin", "380nm");
  return conditions;
}

Conditions TargetConditions(const std::string& illumination) {
  Conditions conditions;
  conditions.AddAttribute("ColorSpaceDescription.Type", "CIELab");
  conditions.AddAttribute("Colorimetric.Illumination", illumination);
  conditions.AddAttribute("Colorimetric.Observer", "TwoDegree");
  return conditions;
}

std::vector<float> Reflectances() {
  std::vector<float> values;
  for (int band = 0; band < 36; ++band) {
    values.push_back(0.1F + 0.02F * static_cast<float>(band));
  }
  return values;
}

/// A sample with one spectrum, and what the steps of a request to it pass on to each other.
struct Request {
  Spectrum spectrum{SpectrumConditions(), Reflectances()};
  Conditions target = TargetConditions("D50");
  Conditions other_target = TargetConditions("A");
  Vexdoc::Sample sample{"Sample"};
  HXMeasureConditions own_typed = Vexdoc::ToMeasureConditions(*spectrum.GetConditions());
  HXMeasureConditions target_typed = Vexdoc::ToMeasureConditions(target);
  HXSpectrum measured{spectrum.GetData(), own_typed};
  Tristim::HXColorVector computed = TristimService::GetVector(measured, target_typed);
  HXMeasureConditions::KeyedWords result_words =
      computed.GetMeasureConditions().GetMeasureConditions();
  std::vector<float> result_values{computed[0], computed[1], computed[2]};

  Request() { sample.AddElement(SharedSpectrum()); }

  Utilities::Tools::SmartPointer<Vexdoc::SampleAttribute> SharedSpectrum() const {
    return Utilities::Tools::SmartPointer<Vexdoc::SampleAttribute>(new Spectrum(spectrum));
  }
};

void Kernel(const Request& request) {
  const TristimFilter& filter = TristimFilter::Get();
  const auto xyz = Tristim::Internals::XyzFromSpectrum({filter[0], filter[1], filter[2]},
                                                       request.measured.GetBands().data());
  DoNotOptimize(Tristim::Internals::LabFromXyz(
      xyz, {filter.GetFilterSum(0), filter.GetFilterSum(1), filter.GetFilterSum(2)}));
}

struct Step {
  const char* name;
  void (*run)(Request& request);
};

constexpr Step kWhole = {"colour of a sample, weights at hand", [](Request& r) {
                           DoNotOptimize(r.sample.GetSampleAttribute(kType, r.target, false));
                         }};
constexpr Step kTransform = {"transform", [](Request& r) {
                               DoNotOptimize(r.spectrum.TransformTo(kType, r.target));
                             }};
constexpr Step kSwitching = {
    "two colours of a sample", [](Request& r) {
      DoNotOptimize(r.sample.GetSampleAttribute(kType, r.target, false));
      DoNotOptimize(r.sample.GetSampleAttribute(kType, r.other_target, false));
    }};

constexpr std::array<Step, 10> kSteps = {{
    {"conditions of the target to types",
     [](Request& r) {
       DoNotOptimize(Vexdoc::ToMeasureConditions(r.target));
     }},
    {"conditions of the spectrum to types",
     [](Request& r) {
       DoNotOptimize(Vexdoc::ToMeasureConditions(*r.spectrum.GetConditions()));
     }},
    {"HXSpectrum from values and conditions",
     [](Request& r) {
       DoNotOptimize(HXSpectrum(r.spectrum.GetData(), r.own_typed));
     }},
    {"TristimService::GetVector",
     [](Request& r) {
       DoNotOptimize(TristimService::GetVector(r.measured, r.target_typed));
     }},
    {"  of it the kernel, XYZ and Lab",
     [](Request& r) {
       Kernel(r);
     }},
    {"ToColorVector",
     [](Request& r) {
       DoNotOptimize(Vexdoc::ToColorVector(r.computed));
     }},
    {"  of it conditions of the result to words",
     [](Request& r) {
       DoNotOptimize(r.computed.GetMeasureConditions().GetMeasureConditions());
     }},
    {"  of it the block of these conditions",
     [](Request& r) {
       DoNotOptimize(ConditionManager::GetInstance().FindConditions(r.result_words));
     }},
    {"  of it an attribute's header with its times",
     [](Request&) {
       DoNotOptimize(Vexdoc::ColorVector());
     }},
    {"  of it the channels with their labels",
     [](Request& r) {
       DoNotOptimize(Vexdoc::ColorSpace("CIELab", r.result_values));
     }},
}};

void Register(const Step& step) {
  benchmark::RegisterBenchmark(step.name, [step](benchmark::State& state) {
    Request request;
    step.run(request);  // builds the weights
    for ([[maybe_unused]] auto _ : state) {
      step.run(request);
    }
  });
}

}  // namespace

void RegisterAttributeBenchmarks() {
  Register(kWhole);
  Register(kTransform);
  Register(kSwitching);
  for (const Step& step : kSteps) {
    Register(step);
  }
}

Figures AttributeResults(const Timings& timings) {
  const auto microseconds = [&timings](const Step& step) {
    return timings.Seconds(step.name) / kMicro;
  };
  const double whole = microseconds(kWhole);
  Figures figures = {{kWhole.name, whole, "us", kTargetMicroseconds}};
  for (const Step& step : kSteps) {
    figures.push_back({std::string("  ") + step.name, microseconds(step), "us", {}});
  }
  figures.push_back(
      {"  GetSampleAttribute's own search", whole - microseconds(kTransform), "us", {}});
  figures.push_back(
      {"colour of a sample, another illuminant each time", microseconds(kSwitching) / 2, "us", {}});
  return figures;
}

}  // namespace Aldermoor::Benchmarks
