#ifndef ALDERMOOR_TOOL_DOCUMENTS_H
#define ALDERMOOR_TOOL_DOCUMENTS_H

#include <cstddef>
#include <optional>
#include <string>
#include <vector>

#include "aldermoor/vexdoc/vex.h"

#include "exitstatus.h"

namespace CLI {
class App;
}

namespace Aldermoor::Tool {

/// Reads a document, from standard input for "-", and from the cache beside the file unless
/// "--no-cache" was given.
/// Throws: InputError with the place of the fault in front, as far as it is known.
void LoadDocument(const std::string& path, Vexdoc::VEX& document);

/// The option "--no-cache" of the commands that read with LoadDocument.  Shared state: what it says
/// holds for the whole run of the program.
void AddNoCacheFlag(CLI::App& app);

/// The argument "FILE...".
struct InputOptions {
  std::vector<std::string> paths;

  void AddTo(CLI::App& app);

  /// Reads the documents one after the other and calls `visit(path, document)` for each; reports
  /// one that cannot be read and goes on.  Returns kUnreadable if there was such a one.
  template <class Visit>
  ExitStatus ForEachDocument(Visit visit) const {
    ExitStatus status = ExitStatus::kDone;
    for (const std::string& path : paths) {
      Vexdoc::VEX document;
      if (TryLoad(path, document)) {
        visit(path, document);
      } else {
        status = ExitStatus::kUnreadable;
      }
    }
    return status;
  }

  /// Throws: UsageError if standard input is named more than once, `other` included.
  void CheckStandardInput(const std::string& other = "") const;

 private:
  static bool TryLoad(const std::string& path, Vexdoc::VEX& document);
};

/// The options "--set" and "--sample".
struct SampleFilter {
  std::optional<std::string> set;
  std::optional<std::string> sample;

  void AddTo(CLI::App& app);

  bool IsSet() const { return set || sample; }
  bool TakesSet(const std::string& name) const { return !set || *set == name; }
  bool TakesSample(const std::string& name) const { return !sample || *sample == name; }
  /// For messages: "no sample 'x' in a set 'y'".
  std::string NoMatchText() const;

  /// Calls `visit(set name, sample name, sample)` for every sample that passes, and returns how
  /// many there were.
  template <class Visit>
  std::size_t ForEachSample(const Vexdoc::VEX& document, Visit visit) const {
    std::size_t count = 0;
    for (const auto& [set_name, samples] : document.GetSampleSets()) {
      if (!TakesSet(set_name)) {
        continue;
      }
      for (const auto& [sample_name, element] : samples->GetSamples()) {
        if (TakesSample(sample_name)) {
          ++count;
          visit(set_name, sample_name, *element);
        }
      }
    }
    return count;
  }
};

/// "a spectrum of 35 values, a Recipe" and so on: what a sample holds, for messages.
std::string DescribeAttributes(const Vexdoc::Sample& sample);

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TOOL_DOCUMENTS_H
