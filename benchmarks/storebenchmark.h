#ifndef ALDERMOOR_BENCHMARKS_STOREBENCHMARK_H
#define ALDERMOOR_BENCHMARKS_STOREBENCHMARK_H

#include <list>
#include <string>

#include "aldermoor/vexdoc/vex.h"

#include "benchmarks/documents.h"
#include "benchmarks/figures.h"
#include "benchmarks/timings.h"

namespace Aldermoor::Benchmarks {

/// Saving in both forms, loading from the cache, finding and walking, in documents of different
/// sizes, beside the least that each could cost.
class StoreBenchmark {
 public:
  /// Makes the documents and their files, measures memory, and registers what is to be timed.
  explicit StoreBenchmark(const Workspace& workspace);
  StoreBenchmark(const StoreBenchmark&) = delete;
  StoreBenchmark& operator=(const StoreBenchmark&) = delete;

  /// The figures in order; the loads of XML must be among the times too.
  Figures Results(const Timings& timings) const;

 private:
  struct Subject {
    std::string name;
    unsigned samples = 0;
    std::string path;  // its file, with a cache
    std::string cache_path;
    std::string cache_bytes;
    double memory_ratio = 0;  // peak of a load from the cache to the tree loaded; 0 if not taken
    Vexdoc::VEX document;
  };

  void Register(const Subject& subject, int repetitions);

  std::list<Subject> subjects_;
};

}  // namespace Aldermoor::Benchmarks

#endif  // ALDERMOOR_BENCHMARKS_STOREBENCHMARK_H
