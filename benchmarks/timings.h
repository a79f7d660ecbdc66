#ifndef ALDERMOOR_BENCHMARKS_TIMINGS_H
#define ALDERMOOR_BENCHMARKS_TIMINGS_H

#include <functional>
#include <map>
#include <string>
#include <vector>

#include <benchmark/benchmark.h>

namespace Aldermoor::Benchmarks {

/// Counters of a benchmark that times two operations in turn, in seconds an iteration.
inline constexpr const char* kSubjectCounter = "subject";
inline constexpr const char* kYardstickCounter = "yardstick";

/// Processor time of this process, in seconds.
double ProcessorSeconds();

/// Processor time of `action`, in seconds.
template <class Action>
double SecondsOf(Action action) {
  const double start = ProcessorSeconds();
  action();
  return ProcessorSeconds() - start;
}

/// An operation that times itself, so that what it prepares and clears away does not count; in
/// seconds.
using Timed = std::function<double()>;

/// Registers a subject right after its yardstick, so that both meet the machine in the same state.
benchmark::internal::Benchmark* RegisterPair(const std::string& name, Timed yardstick,
                                             Timed subject);

/// Collects what the benchmarks of a run report, by the names under which they were registered.
///
/// Time is that of the processor, so that other work on the machine disturbs it little; the library
/// has no threads.  Every value is the median of the repetitions.
class Timings : public benchmark::BenchmarkReporter {
 public:
  bool ReportContext(const Context& context) override;
  void ReportRuns(const std::vector<Run>& runs) override;

  /// In seconds an iteration.
  /// Throws: std::runtime_error if no benchmark of that name ran to its end.
  double Seconds(const std::string& name) const;

  /// Of a benchmark with two operations.  The ratio is taken within each repetition, so what slows
  /// the machine down for longer than that is not part of it.
  /// Throws: std::runtime_error if no such benchmark of that name ran to its end.
  double SubjectSeconds(const std::string& name) const;
  double YardstickSeconds(const std::string& name) const;
  double Ratio(const std::string& name) const;

 private:
  struct Repetition {
    double seconds;
    double subject;
    double yardstick;
  };

  template <class Value>
  double MedianOf(const std::string& name, Value value) const;

  std::map<std::string, std::vector<Repetition>> repetitions_;
};

}  // namespace Aldermoor::Benchmarks

#endif  // ALDERMOOR_BENCHMARKS_TIMINGS_H
