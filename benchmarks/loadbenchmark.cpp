#include "benchmarks/loadbenchmark.h"

#include <array>
#include <ctime>
#include <iostream>
#include <string>

#include "benchmarks/operations.h"
#include "benchmarks/peakmemory.h"

namespace Aldermoor::Benchmarks {
namespace {

constexpr double kTimeTarget = 1.5;
constexpr double kMemoryTarget = 1.2;
constexpr double kMega = 1e6;
constexpr double kMilli = 1e-3;
constexpr double kMicro = 1e-6;

constexpr std::array<Source, 2> kSources = {Source::kStream, Source::kFile};
/// Repetitions and iterations fall with the size, which takes seconds and gigabytes in the end.
struct Size {
  unsigned samples;
  int iterations;
  int repetitions;
};

constexpr std::array<Size, 3> kSizes = {{{1000, 3, 9}, {10000, 1, 5}, {100000, 1, 1}}};

double ProcessorSeconds() {
  std::timespec time{};
  clock_gettime(CLOCK_PROCESS_CPUTIME_ID, &time);
  return static_cast<double>(time.tv_sec) + 1e-9 * static_cast<double>(time.tv_nsec);
}

// Every load starts as the first one of a process does.  Letting go of the document loaded is not
// part of loading it.
double SecondsOfLoad(const Document& document, Source source) {
  ForgetConditions();
  Vexdoc::VEX vex;
  const double start = ProcessorSeconds();
  Load(vex, document, source);
  return ProcessorSeconds() - start;
}

double SecondsOfParse(const Document& document, Source source) {
  const double start = ProcessorSeconds();
  Parse(document, source);
  return ProcessorSeconds() - start;
}

// A load right after a bare parse, so that both meet the machine in the same state.
void TimePair(benchmark::State& state, const Document& document, Source source) {
  double load = 0.0;
  double parse = 0.0;
  for ([[maybe_unused]] auto _ : state) {
    parse += SecondsOfParse(document, source);
    load += SecondsOfLoad(document, source);
  }
  const auto count = static_cast<double>(state.iterations());
  state.counters[kSubjectCounter] = load / count;
  state.counters[kYardstickCounter] = parse / count;
}

std::string Label(const Document& document, Source source) {
  return "load " + document.name + " from " + NameOf(source);
}

benchmark::internal::Benchmark* RegisterPair(const std::string& name, const Document& document,
                                             Source source) {
  return benchmark::RegisterBenchmark(name.c_str(), [&document, source](benchmark::State& state) {
    TimePair(state, document, source);
  });
}

std::string CostLabel(const Document& document) {
  return "load one of " + document.name;
}

std::string Thousands(unsigned count) {
  return std::to_string(count / 1000) + ",000";
}

}  // namespace

LoadBenchmark::LoadBenchmark(const Workspace& workspace) {
  compared_.push_back(workspace.Keep("10,000 samples", SamplesText(10000)));
  compared_.push_back(workspace.Keep("100,000 header values", HeaderValuesText(100000)));
  compared_.push_back(workspace.Keep("100,000 conditions", ConditionsText(100000)));
  for (const Document& document : compared_) {
    Compare(document);
  }
  for (const Size& size : kSizes) {
    scaled_.push_back({Thousands(size.samples) + " samples", "", SamplesText(size.samples)});
  }
  for (std::size_t i = 0; i < scaled_.size(); ++i) {
    RegisterPair(CostLabel(scaled_[i]), scaled_[i], Source::kStream)
        ->Iterations(kSizes[i].iterations)
        ->Repetitions(kSizes[i].repetitions);
  }
}

void LoadBenchmark::Compare(const Document& document) {
  for (const Source source : kSources) {
    const std::string label = Label(document, source);
    std::cerr << "memory: " << label << " ..." << std::endl;
    memory_.push_back(
        {PeakMemory(Task::kLoad, document, source), PeakMemory(Task::kParse, document, source)});
    RegisterPair(label, document, source)->Iterations(1);
  }
}

Figures LoadBenchmark::Results(const Timings& timings) const {
  Figures figures;
  auto memory = memory_.begin();
  for (const Document& document : compared_) {
    for (const Source source : kSources) {
      const std::string label = Label(document, source);
      const double load = timings.SubjectSeconds(label) / kMilli;
      const double parse = timings.YardstickSeconds(label) / kMilli;
      const double memory_ratio = memory->load / memory->parse;
      figures.push_back({label + ": time", load, "ms", {}});
      figures.push_back({label + ": time of bare parse", parse, "ms", {}});
      figures.push_back(
          {label + ": time / bare parse", timings.Ratio(label), "ratio", kTimeTarget});
      figures.push_back({label + ": memory", memory->load / kMega, "MB", {}});
      figures.push_back({label + ": memory of bare parse", memory->parse / kMega, "MB", {}});
      figures.push_back({label + ": memory / bare parse", memory_ratio, "ratio", kMemoryTarget});
      ++memory;
    }
  }
  for (std::size_t i = 0; i < scaled_.size(); ++i) {
    const std::string label = CostLabel(scaled_[i]);
    const double cost = timings.SubjectSeconds(label) / kSizes[i].samples / kMicro;
    figures.push_back({label, cost, "us", {}});
    figures.push_back({label + " / bare parse", timings.Ratio(label), "ratio", {}});
  }
  return figures;
}

}  // namespace Aldermoor::Benchmarks
