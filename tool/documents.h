#ifndef ALDERMOOR_TOOL_DOCUMENTS_H
#define ALDERMOOR_TOOL_DOCUMENTS_H

#include <cstddef>
#include <functional>
#include <optional>
#include <string>
#include <type_traits>
#include <vector>

#include "aldermoor/vexdoc/loadoptions.h"
#include "aldermoor/vexdoc/vex.h"

#include "exitstatus.h"

namespace CLI {
class App;
}

namespace Aldermoor::Tool {

/// Calls `load`, which reads `path`, and turns what it throws into messages.
/// Throws: InputError with the place of the fault in front, as far as it is known; RefusedError for
/// spectra whose wavelengths are not those of their conditions, with `completer`, the name of what
/// takes the range from the points, if that can be done.
Vexdoc::LoadReport TryLoad(const std::string& path, const std::function<Vexdoc::LoadReport()>& load,
                           const std::string& completer = "'aldermoor convert --complete'");

/// Reads a document, from standard input for "-", and from the cache beside the file unless
/// "--no-cache" was given, and notes it as an input.
/// Throws: InputError, also for what TryLoad refuses.
Vexdoc::LoadReport LoadDocument(const std::string& path, Vexdoc::VEX& document,
                                Vexdoc::WavelengthUse wavelengths = Vexdoc::WavelengthUse::kRefuse);

/// The option "--no-cache" of the commands that read with LoadDocument.  Shared state: what it says
/// holds for the whole run of the program.
void AddNoCacheFlag(CLI::App& app);
/// Whether it was given.
bool IgnoresCaches();

/// The argument "FILE...".
struct InputOptions {
  std::vector<std::string> paths;

  void AddTo(CLI::App& app);

  /// Reads the documents one after the other and calls `visit(path, document)`, or with the report
  /// behind it, for each; reports one that cannot be read and goes on.  Returns kUnreadable if
  /// there was such a one.
  template <class Visit>
  ExitStatus ForEachDocument(
      Visit visit, Vexdoc::WavelengthUse wavelengths = Vexdoc::WavelengthUse::kRefuse) const {
    ExitStatus status = ExitStatus::kDone;
    for (const std::string& path : paths) {
      Vexdoc::VEX document;
      if (const auto report = LoadOrReport(path, document, wavelengths)) {
        if constexpr (std::is_invocable_v<Visit, const std::string&, Vexdoc::VEX&>) {
          visit(path, document);
        } else {
          visit(path, document, *report);
        }
      } else {
        status = ExitStatus::kUnreadable;
      }
    }
    return status;
  }

  /// Notes all as inputs, `other` included.
  /// Throws: UsageError if standard input is named more than once.
  void CheckStandardInput(const std::string& other = "") const;

 private:
  static std::optional<Vexdoc::LoadReport> LoadOrReport(const std::string& path,
                                                        Vexdoc::VEX& document,
                                                        Vexdoc::WavelengthUse wavelengths);
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
