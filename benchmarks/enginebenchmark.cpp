#include "benchmarks/enginebenchmark.h"

#include <array>
#include <cmath>
#include <random>
#include <stdexcept>
#include <string>
#include <vector>

#include <lcms2.h>

#include "aldermoor/tristim/hxcolorvector.h"
#include "aldermoor/tristim/hxspectrum.h"
#include "aldermoor/tristim/internals/colorrenderingcalculator.h"
#include "aldermoor/tristim/internals/colortemperature.h"
#include "aldermoor/tristim/internals/deltaemath.h"
#include "aldermoor/tristim/internals/densitycalculator.h"
#include "aldermoor/tristim/tristimexception.h"
#include "aldermoor/tristim/tristimservice.h"

namespace Aldermoor::Benchmarks {
namespace {

using benchmark::DoNotOptimize;
using Tristim::HXColorVector;
using Tristim::HXMeasureConditions;
using Tristim::HXSpectrum;
using Tristim::TristimService;
using Tristim::Internals::Quadruple;
using Tristim::Internals::Triple;

constexpr double kMicro = 1e-6;
constexpr double kNano = 1e-9;
constexpr std::size_t kPairs = 1000;
constexpr int kSpectra = 1000;
constexpr int kAnsiT = 5;
constexpr Triple kWhite = {96.42F, 100.0F, 82.49F};

constexpr const char* kTemperature = "colour temperature";
constexpr const char* kRendering = "colour rendering index";
constexpr const char* kDensity = "density vector";
constexpr const char* kDelta = "CIEDE2000, 1,000 pairs";
constexpr const char* kLab = "Lab from XYZ, 1,000 colours";

HXSpectrum Lamp() {
  HXMeasureConditions emission;
  emission.SetMeasureCondition("Colorimetric.Illumination", "Emission");
  HXSpectrum lamp = Tristim::Internals::ColorTemperature().GetPlanckRadiator(4000.0F, emission);
  lamp[20] = 1.5F * lamp[20];  // off the locus
  return lamp;
}

std::vector<Quadruple> RandomLabs(std::size_t count, unsigned seed) {
  std::mt19937 random(seed);
  std::uniform_real_distribution<float> lightness(5.0F, 95.0F);
  std::uniform_real_distribution<float> chroma(-60.0F, 60.0F);
  std::vector<Quadruple> labs(count);
  for (Quadruple& lab : labs) {
    lab = {lightness(random), chroma(random), chroma(random), 0.0F};
  }
  return labs;
}

cmsCIELab ToLcms(const Quadruple& lab) {
  return {static_cast<double>(lab[0]), static_cast<double>(lab[1]), static_cast<double>(lab[2])};
}

std::vector<cmsCIELab> ToLcms(const std::vector<Quadruple>& labs) {
  std::vector<cmsCIELab> result;
  for (const Quadruple& lab : labs) {
    result.push_back(ToLcms(lab));
  }
  return result;
}

// Smooth reflectances: a level and three waves, all within 0.05 and 0.95.
HXSpectrum RandomSurface(std::mt19937& random) {
  std::uniform_real_distribution<float> unit(0.0F, 1.0F);
  std::array<float, 3> size{};
  std::array<float, 3> phase{};
  for (std::size_t i = 0; i < size.size(); ++i) {
    size[i] = 0.15F * unit(random);
    phase[i] = 6.28F * unit(random);
  }
  HXSpectrum::Bands values;
  for (std::size_t band = 0; band < values.size(); ++band) {
    float value = 0.5F;
    for (std::size_t i = 0; i < size.size(); ++i) {
      value += size[i] * std::sin(phase[i] + static_cast<float>(band * (i + 1)) * 0.17F);
    }
    values[band] = value;
  }
  return HXSpectrum(values.data());
}

double MedianOfReconstructions() {
  std::mt19937 random(20041);
  std::vector<double> seconds;
  while (seconds.size() < kSpectra) {
    const HXColorVector lab =
        TristimService::GetVector(RandomSurface(random), HXMeasureConditions());
    seconds.push_back(SecondsOf([&lab] { DoNotOptimize(TristimService::GetSpectrum(lab)); }));
  }
  return Median(seconds);
}

template <class Action>
void Register(const char* name, Action action) {
  benchmark::RegisterBenchmark(name, [action](benchmark::State& state) {
    for ([[maybe_unused]] auto _ : state) {
      action();
    }
  });
}

void RegisterDelta() {
  const auto first = RandomLabs(kPairs, 1);
  const auto second = RandomLabs(kPairs, 2);
  const auto lcms_first = ToLcms(first);
  const auto lcms_second = ToLcms(second);
  RegisterPair(
      kDelta,
      [lcms_first, lcms_second] {
        return SecondsOf([&] {
          for (std::size_t i = 0; i < kPairs; ++i) {
            DoNotOptimize(cmsCIE2000DeltaE(&lcms_first[i], &lcms_second[i], 1.0, 1.0, 1.0));
          }
        });
      },
      [first, second] {
        return SecondsOf([&] {
          for (std::size_t i = 0; i < kPairs; ++i) {
            DoNotOptimize(Tristim::Internals::DeltaE2000(first[i], second[i], {1.0F, 1.0F, 1.0F}));
          }
        });
      });
}

void RegisterLab() {
  std::vector<Triple> colors;
  std::vector<cmsCIEXYZ> lcms_colors;
  for (const Quadruple& lab : RandomLabs(kPairs, 3)) {
    const Triple xyz = Tristim::Internals::XyzFromLab({lab[0], lab[1], lab[2]}, kWhite);
    colors.push_back(xyz);
    lcms_colors.push_back({static_cast<double>(xyz[0]) / 100.0, static_cast<double>(xyz[1]) / 100.0,
                           static_cast<double>(xyz[2]) / 100.0});
  }
  RegisterPair(
      kLab,
      [lcms_colors] {
        return SecondsOf([&] {
          for (const cmsCIEXYZ& xyz : lcms_colors) {
            cmsCIELab lab;
            cmsXYZ2Lab(cmsD50_XYZ(), &lab, &xyz);
            DoNotOptimize(lab);
          }
        });
      },
      [colors] {
        return SecondsOf([&] {
          for (const Triple& xyz : colors) {
            DoNotOptimize(Tristim::Internals::LabFromXyz(xyz, kWhite));
          }
        });
      });
}

}  // namespace

void RegisterEngineBenchmarks() {
  const HXSpectrum lamp = Lamp();
  Register(kTemperature, [lamp] {
    if (TristimService::GetColorTemperature(lamp) < 0.0F) {
      throw std::runtime_error("the lamp has no colour temperature");
    }
  });
  Register(kRendering, [lamp] {
    float index = 0.0F;
    std::string reference;
    DoNotOptimize(TristimService::GetColorRenderingIndex(lamp, index, reference));
    DoNotOptimize(index);
  });
  std::mt19937 random(7);
  const HXSpectrum surface = RandomSurface(random);
  Register(kDensity, [surface] {
    Tristim::Internals::HXDensity density;
    DoNotOptimize(
        Tristim::Internals::DensityCalculator::GetDensityVector(surface, kAnsiT, false, density));
    DoNotOptimize(density);
  });
  RegisterDelta();
  RegisterLab();
}

Figures EngineResults(const Timings& timings) {
  constexpr double kPairTarget = 200.0;  // ns, 5 million a second
  return {
      {kTemperature, timings.Seconds(kTemperature) / kMicro, "us", 60.0},
      {std::string(kRendering) + ", with its temperature", timings.Seconds(kRendering) / kMicro,
       "us", 60.0},
      {"reconstruction, median of 1,000 surface colours", MedianOfReconstructions() / kMicro, "us",
       150.0},
      {kDensity, timings.Seconds(kDensity) / kNano, "ns", 150.0},
      {"CIEDE2000, a pair", timings.SubjectSeconds(kDelta) / kPairs / kNano, "ns", kPairTarget},
      {"CIEDE2000 / Little CMS", timings.Ratio(kDelta), "ratio", {}},
      {"Lab from XYZ, a colour", timings.SubjectSeconds(kLab) / kPairs / kNano, "ns", {}},
      {"Lab from XYZ / Little CMS", timings.Ratio(kLab), "ratio", {}},
  };
}

}  // namespace Aldermoor::Benchmarks
