#ifndef ALDERMOOR_TOOL_SAMPLERUN_H
#define ALDERMOOR_TOOL_SAMPLERUN_H

#include <exception>
#include <map>
#include <memory>
#include <string>
#include <vector>

#include "aldermoor/vexdoc/sample.h"
#include "aldermoor/vexdoc/spectrum.h"
#include "aldermoor/vexdoc/vex.h"

#include "documents.h"
#include "exitstatus.h"
#include "output.h"
#include "records.h"
#include "vocabulary.h"

namespace Aldermoor::Tool {

/// Where a sample stands.
struct Place {
  const std::string& file;
  const std::string& set;
  const std::string& sample;
};

/// Tells that the sample gives no result, with the reason and what it holds.
void ReportFailure(const Place& place, const Vexdoc::Sample& sample, const std::exception& reason);

/// Runs `work` and reports what it throws as the failure of this sample; only a failure of the
/// output passes.  Returns whether nothing was thrown.
template <class Work>
bool TryFor(const Place& place, const Vexdoc::Sample& sample, Work work) {
  try {
    work();
    return true;
  } catch (const OutputError&) {
    throw;
  } catch (const std::exception& e) {
    ReportFailure(place, sample, e);
    return false;
  }
}

/// The first spectrum of the sample, or none.  The sample keeps it.
const Vexdoc::Spectrum* FindSpectrum(const Vexdoc::Sample& sample);
/// The first spectrum of the sample.  Throws: std::runtime_error if there is none or if it has
/// other than 36 values, or if these are not from 380 to 730 nm.
const Vexdoc::Spectrum& SpectrumOf(const Vexdoc::Sample& sample);
/// The same, of something that reflects.  Throws: also if its conditions say that it is a light.
const Vexdoc::Spectrum& ReflectanceOf(const Vexdoc::Sample& sample);

/// Records of samples: "file" if there are several, "set", "sample" and further columns.
class SampleTable {
 public:
  SampleTable(Format format, Output& output, bool with_file, const std::vector<Column>& columns,
              const std::map<std::string, std::string>& conditions);

  /// One cell for each of the further columns.
  void Add(const Place& place, const std::vector<Cell>& cells);
  RecordWriter& GetWriter() { return *writer_; }

 private:
  bool with_file_;
  std::vector<Cell> record_;  // reused
  std::unique_ptr<RecordWriter> writer_;
};

/// What is done with each sample of some documents.
class SampleJob {
 public:
  SampleJob() = default;
  SampleJob(const SampleJob&) = delete;
  SampleJob& operator=(const SampleJob&) = delete;
  virtual ~SampleJob() = default;

  /// Called before the samples of a document.  What it throws is reported, and the document left
  /// out.
  virtual void Begin(const std::string& /*path*/, const Vexdoc::VEX& /*document*/) {}
  /// What it throws is reported as the failure of this sample.
  virtual void Add(const Place& place, const Vexdoc::Sample& sample) = 0;
  /// Called behind the samples of a document, which is gone after that.
  virtual void EndDocument() {}
  /// Called once, if any document could be read.
  virtual void End() = 0;
};

/// Runs `job` over every sample that passes, and commits the output if any document could be read.
ExitStatus RunOverSamples(SampleJob& job, const InputOptions& inputs, const SampleFilter& filter,
                          Output& output);

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TOOL_SAMPLERUN_H
