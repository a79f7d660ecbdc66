// Times and memory of loading and saving documents, times of the colour engine, of asking samples
// for colours and of whole arrays, and of the program and the Python package, in one run.
//
// Options: "--tsv" for lines to be read by programs, and those of Google Benchmark.

#include <algorithm>
#include <exception>
#include <iostream>
#include <string_view>
#include <vector>

#include "aldermoor/vexdoc/xmlplatform.h"

#include "benchmarks/arraybenchmark.h"
#include "benchmarks/attributebenchmark.h"
#include "benchmarks/enginebenchmark.h"
#include "benchmarks/loadbenchmark.h"
#include "benchmarks/outside.h"
#include "benchmarks/peakmemory.h"
#include "benchmarks/storebenchmark.h"

namespace Aldermoor::Benchmarks {
namespace {

/// Repetitions of all benchmarks in one shuffled order, so that a slow spell of the machine hits
/// both sides of a comparison.  What the user says afterwards counts.
bool Initialise(int argc, char** argv) {
  static char interleaving[] = "--benchmark_enable_random_interleaving=true";
  static char repetitions[] = "--benchmark_repetitions=9";
  static char least_time[] = "--benchmark_min_time=0.05";
  std::vector<char*> arguments = {argv[0], interleaving, repetitions, least_time};
  arguments.insert(arguments.end(), argv + 1, argv + argc);
  int count = static_cast<int>(arguments.size());
  benchmark::Initialize(&count, arguments.data());
  return !benchmark::ReportUnrecognizedArguments(count, arguments.data());
}

int Run(int argc, char** argv) {
  const auto is_tsv = [](const char* argument) {
    return argument == std::string_view("--tsv");
  };
  char** const end = std::remove_if(argv + 1, argv + argc, is_tsv);
  const bool tsv = end != argv + argc;
  if (!Initialise(static_cast<int>(end - argv), argv)) {
    return 2;
  }
  const Vexdoc::XMLPlatform platform;
  const Workspace workspace;
  const LoadBenchmark load(workspace);
  const StoreBenchmark store(workspace);
  RegisterAttributeBenchmarks();
  RegisterEngineBenchmarks();
  RegisterArrayBenchmarks();
  std::cerr << "times, all benchmarks interleaved ..." << std::endl;
  Timings timings;
  benchmark::RunSpecifiedBenchmarks(&timings);
  Figures figures = load.Results(timings);
  for (const Figures& more : {store.Results(timings), AttributeResults(timings),
                              EngineResults(timings), ArrayResults(timings), OutsideResults()}) {
    figures.insert(figures.end(), more.begin(), more.end());
  }
  if (tsv) {
    PrintTsv(std::cout, figures);
  } else {
    PrintTable(std::cout, figures);
  }
  return 0;
}

}  // namespace
}  // namespace Aldermoor::Benchmarks

int main(int argc, char** argv) {
  using namespace Aldermoor::Benchmarks;
  try {
    return IsChild(argc, argv) ? RunChild(argv) : Run(argc, argv);
  } catch (const std::exception& e) {
    std::cerr << argv[0] << ": " << e.what() << std::endl;
    return 1;
  }
}
