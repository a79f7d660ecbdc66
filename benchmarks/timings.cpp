#include "benchmarks/timings.h"

#include <stdexcept>

#include "benchmarks/figures.h"

namespace Aldermoor::Benchmarks {

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
