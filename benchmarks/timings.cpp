#include "benchmarks/timings.h"

#include <ctime>
#include <stdexcept>
#include <utility>

#include "benchmarks/figures.h"

namespace Aldermoor::Benchmarks {

double ProcessorSeconds() {
  std::timespec time{};
  clock_gettime(CLOCK_PROCESS_CPUTIME_ID, &time);
  return static_cast<double>(time.tv_sec) + 1e-9 * static_cast<double>(time.tv_nsec);
}

benchmark::internal::Benchmark* RegisterPair(const std::string& name, Timed yardstick,
                                             Timed subject) {
  return benchmark::RegisterBenchmark(
      name.c_str(),
      [yardstick = std::move(yardstick), subject = std::move(subject)](benchmark::State& state) {
        double yardstick_seconds = 0.0;
        double subject_seconds = 0.0;
        for ([[maybe_unused]] auto _ : state) {
          yardstick_seconds += yardstick();
          subject_seconds += subject();
        }
        const auto count = static_cast<double>(state.iterations());
        state.counters[kSubjectCounter] = subject_seconds / count;
        state.counters[kYardstickCounter] = yardstick_seconds / count;
      });
}

bool Timings::ReportContext(const Context& /*context*/) {
  return true;
}

void Timings::ReportRuns(const std::vector<Run>& runs) {
  const auto counter = [](const Run& run, const char* name) {
    const auto found = run.counters.find(name);
    return found == run.counters.end() ? 0.0 : found->second.value;
  };
  for (const Run& run : runs) {
    if (run.run_type == Run::RT_Iteration && !run.error_occurred) {
      repetitions_[run.run_name.function_name].push_back(
          {run.cpu_accumulated_time / static_cast<double>(run.iterations),
           counter(run, kSubjectCounter), counter(run, kYardstickCounter)});
    }
  }
}

template <class Value>
double Timings::MedianOf(const std::string& name, Value value) const {
  const auto found = repetitions_.find(name);
  if (found == repetitions_.end()) {
    throw std::runtime_error("no result of the benchmark '" + name + "'");
  }
  std::vector<double> values;
  for (const Repetition& repetition : found->second) {
    values.push_back(value(repetition));
  }
  return Median(values);
}

double Timings::Seconds(const std::string& name) const {
  return MedianOf(name, [](const Repetition& r) { return r.seconds; });
}

double Timings::SubjectSeconds(const std::string& name) const {
  return MedianOf(name, [](const Repetition& r) { return r.subject; });
}

double Timings::YardstickSeconds(const std::string& name) const {
  return MedianOf(name, [](const Repetition& r) { return r.yardstick; });
}

double Timings::Ratio(const std::string& name) const {
  return MedianOf(name, [](const Repetition& r) { return r.subject / r.yardstick; });
}

}  // namespace Aldermoor::Benchmarks
