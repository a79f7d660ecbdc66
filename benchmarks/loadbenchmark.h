#ifndef ALDERMOOR_BENCHMARKS_LOADBENCHMARK_H
#define ALDERMOOR_BENCHMARKS_LOADBENCHMARK_H

#include <string>
#include <vector>

#include "benchmarks/documents.h"
#include "benchmarks/figures.h"
#include "benchmarks/timings.h"

namespace Aldermoor::Benchmarks {

/// Loading of documents, compared with the bare parse of the same bytes, and the cost of a sample
/// in documents of different sizes.
class LoadBenchmark {
 public:
  /// Measures memory, and registers what is to be timed.
  explicit LoadBenchmark(const Workspace& workspace);
  LoadBenchmark(const LoadBenchmark&) = delete;
  LoadBenchmark& operator=(const LoadBenchmark&) = delete;

  /// The figures in order, from the times of the registered benchmarks.
  Figures Results(const Timings& timings) const;

  /// The name under which the load of a document with many samples is registered.
  static std::string CostLabel(const std::string& document);

 private:
  struct Memory {
    double load;
    double parse;
  };

  void Compare(const Document& document);

  std::vector<Document> compared_;
  std::vector<Memory> memory_;  // of each compared document: from the stream, from the file
  std::vector<Document> scaled_;
};

}  // namespace Aldermoor::Benchmarks

#endif  // ALDERMOOR_BENCHMARKS_LOADBENCHMARK_H
