#include "completion.h"

#include <cstddef>
#include <map>
#include <string>

#include <fmt/format.h>
#include <fmt/ranges.h>

#include "diagnostics.h"

namespace Aldermoor::Tool {
namespace {

using Counts = std::map<std::string, std::size_t>;

struct Kind {
  const char* one;
  const char* many;

  std::string Count(std::size_t count) const {
    return fmt::format("{} {}", count, count == 1 ? one : many);
  }
};

constexpr Kind kSpectrum = {"spectrum", "spectra"};
constexpr Kind kColor = {"colour", "colours"};

void ReportGiven(const Texts& given, const Counts& taken, const Kind& kind) {
  for (const auto& [key, value] : given) {
    const auto found = taken.find(key);
    Report(found == taken.end()
               ? fmt::format("--condition {}={} is not needed by any {}", key, value, kind.one)
               : fmt::format("{}={} taken for {}", key, value, kind.Count(found->second)));
  }
}

}  // namespace

bool ReportMissing(const Vexdoc::CompletionReport& report, const std::string& remedy) {
  for (const auto& missing : report.missing) {
    Report(fmt::format(
        "set '{}', sample '{}': the conditions of a {} lack {}; {} KEY=VALUE gives them",
        missing.set, missing.sample, (missing.is_spectrum ? kSpectrum : kColor).one,
        fmt::join(missing.keys, ", "), remedy));
  }
  if (const std::size_t more = report.missing_count - report.missing.size(); more > 0) {
    Report(fmt::format("and {} more like them", more));
  }
  return report.missing_count == 0;
}

bool ReportCompletion(const Vexdoc::CompletionReport& report, const KindConditions& given) {
  if (!ReportMissing(report, "--condition")) {
    return false;
  }
  for (const auto& [points, spectra] : report.counted) {
    Report(fmt::format("{} set to {}, the number of values, for {}", kPointCountKey, points,
                       kSpectrum.Count(spectra)));
  }
  ReportGiven(given.spectrum, report.spectra, kSpectrum);
  ReportGiven(given.color, report.colors, kColor);
  return true;
}

}  // namespace Aldermoor::Tool
