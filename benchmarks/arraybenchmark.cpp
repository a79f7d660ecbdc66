#include "benchmarks/arraybenchmark.h"

#include <algorithm>
#include <array>
#include <chrono>
#include <memory>
#include <random>
#include <span>
#include <string>
#include <thread>
#include <utility>
#include <vector>

#include <lcms2.h>

#include "aldermoor/measure/context.h"

namespace Aldermoor::Benchmarks {
namespace {

using benchmark::DoNotOptimize;
using Measure::Context;
using Measure::kBands;

constexpr std::size_t kFew = 1000;
constexpr std::size_t kMany = 1000000;
constexpr double kMega = 1e6;

constexpr const char* kXyzFew = "XYZ from 1,000 spectra";
constexpr const char* kXyzMany = "XYZ from 1,000,000 spectra";
constexpr const char* kLabFew = "Lab from 1,000 spectra";
constexpr const char* kLabOfXyz = "Lab from 1,000 XYZ";

std::vector<float> Random(std::size_t count, float low, float high, unsigned seed) {
  std::mt19937 random(seed);
  std::uniform_real_distribution<float> value(low, high);
  std::vector<float> values(count);
  for (float& v : values) {
    v = value(random);
  }
  return values;
}

Vexdoc::Conditions Words(const std::string& space, const std::string& formula = "CIELab") {
  Vexdoc::Conditions conditions;
  conditions.AddAttribute("ColorSpaceDescription.Type", space);
  conditions.AddAttribute("ColorSpaceDescription.DeltaEFormula", formula);
  conditions.AddAttribute("Colorimetric.Illumination", "D50");
  return conditions;
}

/// The least that a conversion can do: every value read once, three sums written for each row.
void Read(std::span<const float> spectra, std::span<float> colors) {
  constexpr std::size_t kRows = 4;  // as many sums as fit the registers
  constexpr std::size_t kSums = 3 * kRows;
  const float* row = spectra.data();
  for (std::size_t i = 0; i + kSums <= colors.size(); i += kSums) {
    std::array<float, kSums> sums{};
    for (std::size_t k = 0; k < kBands / 3; ++k, row += kSums) {
      for (std::size_t j = 0; j < kSums; ++j) {
        sums[j] += row[j];
      }
    }
    std::copy(sums.begin(), sums.end(), colors.data() + i);
  }
}

/// So often that the clock is fine enough.
template <class Action>
double SecondsEach(std::size_t times, Action action) {
  return SecondsOf([&] {
           for (std::size_t i = 0; i < times; ++i) {
             action();
           }
         }) /
         static_cast<double>(times);
}

void RegisterSpectra(const char* name, std::size_t rows, const char* space) {
  const auto spectra = std::make_shared<std::vector<float>>(Random(rows * kBands, 0.0F, 1.0F, 1));
  const auto colors = std::make_shared<std::vector<float>>(3 * rows);
  const Context context(Words(space));
  const std::size_t times = kMany / rows;
  RegisterPair(
      name,
      [spectra, colors, times] {
        return SecondsEach(times, [&] {
          Read(*spectra, *colors);
          benchmark::ClobberMemory();
        });
      },
      [spectra, colors, context, times] {
        return SecondsEach(times, [&] {
          context.ConvertSpectra(*spectra, *colors);
          benchmark::ClobberMemory();
        });
      });
}

std::vector<cmsCIELab> ToLcms(const std::vector<float>& labs) {
  std::vector<cmsCIELab> result;
  for (std::size_t i = 0; i < labs.size(); i += 3) {
    result.push_back({static_cast<double>(labs[i]), static_cast<double>(labs[i + 1]),
                      static_cast<double>(labs[i + 2])});
  }
  return result;
}

/// Random colours, and others some units away.
std::pair<std::vector<float>, std::vector<float>> Pairs(std::size_t count) {
  std::vector<float> first = Random(3 * count, -60.0F, 60.0F, 2);
  const std::vector<float> steps = Random(3 * count, -4.0F, 4.0F, 3);
  std::vector<float> second(first.size());
  for (std::size_t i = 0; i < first.size(); ++i) {
    first[i] += i % 3 == 0 ? 50.0F - first[i] / 5.0F : 0.0F;
    second[i] = first[i] + steps[i];
  }
  return {first, second};
}

void RegisterLabOfXyz() {
  const auto xyz = std::make_shared<std::vector<float>>(Random(3 * kFew, 0.5F, 95.0F, 4));
  const auto lab = std::make_shared<std::vector<float>>(3 * kFew);
  std::vector<cmsCIEXYZ> lcms;
  for (std::size_t i = 0; i < xyz->size(); i += 3) {
    lcms.push_back({static_cast<double>((*xyz)[i]) / 100.0,
                    static_cast<double>((*xyz)[i + 1]) / 100.0,
                    static_cast<double>((*xyz)[i + 2]) / 100.0});
  }
  const Context context(Words("CIELab"), Words("CIEXYZ"));
  RegisterPair(
      kLabOfXyz,
      [lcms] {
        return SecondsOf([&] {
          for (const cmsCIEXYZ& color : lcms) {
            cmsCIELab result;
            cmsXYZ2Lab(cmsD50_XYZ(), &result, &color);
            DoNotOptimize(result);
          }
        });
      },
      [xyz, lab, context] {
        return SecondsEach(50, [&] {
          context.ConvertColors(*xyz, *lab);
          benchmark::ClobberMemory();
        });
      });
}

struct Formula {
  const char* name;
  const char* word;
  double (*lcms)(const cmsCIELab& first, const cmsCIELab& second);
  double times;  // that the arrays are to be quicker
};

constexpr Formula kFormulas[] = {
    {"CIEDE2000, 1,000 pairs of an array", "2000",
     [](const cmsCIELab& first, const cmsCIELab& second) {
       return cmsCIE2000DeltaE(&first, &second, 1.0, 1.0, 1.0);
     },
     3.0},
    {"CMC, 1,000 pairs of an array", "CMC",
     [](const cmsCIELab& first, const cmsCIELab& second) {
       return cmsCMCdeltaE(&first, &second, 2.0, 1.0);
     },
     4.0},
    {"CIE94, 1,000 pairs of an array", "94",
     [](const cmsCIELab& first, const cmsCIELab& second) {
       return cmsCIE94DeltaE(&first, &second);
     },
     8.0},
};

void RegisterFormula(const Formula& formula) {
  const auto [first, second] = Pairs(kFew);
  const auto lcms_first = ToLcms(first);
  const auto lcms_second = ToLcms(second);
  const Context context(Words("CIELab", formula.word), Words("CIELab"));
  const auto run = formula.lcms;
  RegisterPair(
      formula.name,
      [lcms_first, lcms_second, run] {
        return SecondsOf([&] {
          for (std::size_t i = 0; i < kFew; ++i) {
            DoNotOptimize(run(lcms_first[i], lcms_second[i]));
          }
        });
      },
      [first, second, context] {
        std::array<float, kFew> differences;
        return SecondsEach(50, [&] {
          context.CompareColors(first, second, differences);
          benchmark::ClobberMemory();
        });
      });
}

double ClockSeconds(std::size_t threads, const Context& context, const std::vector<float>& first,
                    const std::vector<float>& second) {
  const auto work = [&] {
    std::vector<float> differences(first.size() / 3);
    for (int i = 0; i < 2000; ++i) {
      context.CompareColors(first, second, differences);
      benchmark::ClobberMemory();
    }
  };
  const auto start = std::chrono::steady_clock::now();
  {
    std::vector<std::jthread> others;
    for (std::size_t i = 1; i < threads; ++i) {
      others.emplace_back(work);
    }
    work();
  }
  return std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
}

/// How much more two threads do than one, in time on the clock: the median of several turns.
double GainOfTwoThreads() {
  const auto [first, second] = Pairs(kFew);
  const Context context(Words("CIELab", "2000"), Words("CIELab"));
  std::vector<double> gains;
  for (int turn = 0; turn < 9; ++turn) {
    const double one = ClockSeconds(1, context, first, second);
    gains.push_back(2.0 * one / ClockSeconds(2, context, first, second));
  }
  return Median(gains);
}

}  // namespace

void RegisterArrayBenchmarks() {
  RegisterSpectra(kXyzFew, kFew, "CIEXYZ");
  RegisterSpectra(kXyzMany, kMany, "CIEXYZ");
  RegisterSpectra(kLabFew, kFew, "CIELab");
  RegisterLabOfXyz();
  for (const Formula& formula : kFormulas) {
    RegisterFormula(formula);
  }
}

Figures ArrayResults(const Timings& timings) {
  const auto rate = [&](const char* name, std::size_t rows) {
    return static_cast<double>(rows) / timings.SubjectSeconds(name) / kMega;
  };
  const auto of_yardstick = [&](const char* name) {
    return 1.0 / timings.Ratio(name);
  };
  Figures figures = {
      {"XYZ from spectra, 1,000 of them", rate(kXyzFew, kFew), "M/s", 140.0, true},
      {"XYZ from spectra, 1,000,000", rate(kXyzMany, kMany), "M/s", {}},
      {"- / bare reading and writing", of_yardstick(kXyzMany), "times", 0.9, true},
      {"Lab from spectra, 1,000", rate(kLabFew, kFew), "M/s", 45.0, true},
      {"Lab from XYZ, array", rate(kLabOfXyz, kFew), "M/s", 65.0, true},
      {"- / Little CMS", of_yardstick(kLabOfXyz), "times", {}},
  };
  for (const Formula& formula : kFormulas) {
    const std::string name = formula.name;
    figures.push_back({name, rate(formula.name, kFew), "M/s", {}});
    figures.push_back({name.substr(0, name.find(',')) + " / Little CMS", of_yardstick(formula.name),
                       "times", formula.times, true});
  }
  figures.push_back({"CIEDE2000, two threads / one", GainOfTwoThreads(), "times", 1.9, true});
  return figures;
}

}  // namespace Aldermoor::Benchmarks
