#include "benchmarks/loadbenchmark.h"

#include <array>
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

constexpr std::array<Size, 4> kSizes = {
    {{1000, 3, 9}, {10000, 1, 5}, {100000, 1, 1}, {200000, 1, 1}}};

// Every load starts as the first one of a process does.  Letting go of the document loaded is not
// part of loading it.
double SecondsOfLoad(const Document& document, Source source) {
  ForgetConditions();
  Vexdoc::VEX vex;
  return SecondsOf([&] { Load(vex, document, source); });
}

std::string Label(const Document& document, Source source) {
  return "load " + document.name + " from " + NameOf(source);
}

benchmark::internal::Benchmark* Register(const std::string& name, const Document& document,
                                         Source source) {
  return RegisterPair(
      name, [&document, source] { return SecondsOf([&] { Parse(document, source); }); },
      [&document, source] { return SecondsOfLoad(document, source); });
}

}  // namespace

std::string LoadBenchmark::CostLabel(const std::string& document) {
  return "load one of " + document;
}

LoadBenchmark::LoadBenchmark(const Workspace& workspace) {
  compared_.push_back(workspace.Keep("10,000 samples", SamplesText(10000)));
  compared_.push_back(workspace.Keep("100,000 header values", HeaderValuesText(100000)));
  compared_.push_back(workspace.Keep("100,000 conditions", ConditionsText(100000)));
  for (const Document& document : compared_) {
    Compare(document);
  }
  for (const Size& size : kSizes) {
    scaled_.push_back({SamplesName(size.samples), "", SamplesText(size.samples)});
  }
  for (std::size_t i = 0; i < scaled_.size(); ++i) {
    Register(CostLabel(scaled_[i].name), scaled_[i], Source::kStream)
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
    Register(label, document, source)->Iterations(1);
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
    const std::string label = CostLabel(scaled_[i].name);
    const double cost = timings.SubjectSeconds(label) / kSizes[i].samples / kMicro;
    figures.push_back({label, cost, "us", {}});
    figures.push_back({label + " / bare parse", timings.Ratio(label), "ratio", {}});
  }
  return figures;
}

}  // namespace Aldermoor::Benchmarks
