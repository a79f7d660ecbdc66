#include <algorithm>
#include <cmath>
#include <cstddef>
#include <limits>
#include <map>
#include <memory>
#include <numeric>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include <fmt/format.h>

#include "aldermoor/vexdoc/conditions.h"

#include "coloroptions.h"
#include "command.h"
#include "comparison.h"
#include "documents.h"
#include "jobs.h"
#include "options.h"
#include "output.h"
#include "records.h"
#include "samplepairs.h"
#include "samplerun.h"
#include "text.h"
#include "vocabulary.h"

namespace Aldermoor::Tool {
namespace {

struct Difference {
  float value;
  std::string set;
  std::string sample;
};

/// What is told of a file that has differences.
struct Statistics {
  explicit Statistics(const std::vector<Difference>& differences)
      : worst(*std::max_element(
            differences.begin(), differences.end(),
            [](const Difference& a, const Difference& b) { return a.value < b.value; })) {
    std::vector<float> sorted;
    for (const Difference& difference : differences) {
      sorted.push_back(difference.value);
    }
    std::sort(sorted.begin(), sorted.end());
    const std::size_t count = sorted.size();
    mean = std::accumulate(sorted.begin(), sorted.end(), 0.0F) / static_cast<float>(count);
    median =
        count % 2 == 1 ? sorted[count / 2] : (sorted[count / 2 - 1] + sorted[count / 2]) / 2.0F;
    // The nearest rank: the least of the differences that 95 % of them do not exceed.
    p95 = sorted[(count * 95 + 99) / 100 - 1];
  }

  float mean;
  float median;
  float p95;
  Difference worst;
};

/// Writes differences and what they come to.
class DiffReport {
 public:
  DiffReport(Format format, Output& output, bool with_file, bool only_summary,
             std::optional<float> limit, const std::map<std::string, std::string>& conditions)
      : with_file_(with_file), limit_(limit), has_summary_(only_summary || format != Format::kCsv) {
    if (only_summary) {
      summary_ = MakeRecordWriter(format, output, SummaryColumns(), conditions);
    } else {
      table_.emplace(format, output, with_file, std::vector<Column>{{"difference", 2}}, conditions);
    }
  }

  void Add(const Place& place, float difference) {
    differences_.push_back({difference, place.set, place.sample});
    if (table_) {
      table_->Add(place, {difference});
    }
  }

  /// Ends a file.  Returns whether it keeps the limit, if there is any.
  bool EndFile(const std::string& file, bool complete) {
    const bool passed = complete && std::all_of(differences_.begin(), differences_.end(),
                                                [this](const Difference& difference) {
                                                  return !limit_ || difference.value <= *limit_;
                                                });
    files_.push_back({file, std::exchange(differences_, {}), passed});
    return passed || !limit_;
  }

  void End() {
    if (table_ && has_summary_) {
      table_->GetWriter().BeginList("summary", SummaryColumns());
    }
    RecordWriter& writer = table_ ? table_->GetWriter() : *summary_;
    if (has_summary_) {
      for (const File& file : files_) {
        AddSummary(writer, file);
      }
    }
    writer.End();
  }

 private:
  struct File {
    std::string name;
    std::vector<Difference> differences;
    bool passed;
  };

  std::vector<Column> SummaryColumns() const {
    std::vector<Column> columns = {{"count"},      {"mean", 2},     {"median", 2},     {"p95", 2},
                                   {"maximum", 2}, {"maximum set"}, {"maximum sample"}};
    if (with_file_) {
      columns.insert(columns.begin(), {"file"});
    }
    if (limit_) {
      columns.push_back({"result"});
    }
    return columns;
  }

  void AddSummary(RecordWriter& writer, const File& file) const {
    std::vector<Cell> cells;
    if (with_file_) {
      cells.emplace_back(std::string_view(file.name));
    }
    cells.emplace_back(static_cast<float>(file.differences.size()));
    std::optional<Statistics> statistics;
    if (!file.differences.empty()) {
      statistics.emplace(file.differences);
    }
    constexpr float kNone = std::numeric_limits<float>::quiet_NaN();
    cells.emplace_back(statistics ? statistics->mean : kNone);
    cells.emplace_back(statistics ? statistics->median : kNone);
    cells.emplace_back(statistics ? statistics->p95 : kNone);
    cells.emplace_back(statistics ? statistics->worst.value : kNone);
    cells.emplace_back(statistics ? std::string_view(statistics->worst.set) : "");
    cells.emplace_back(statistics ? std::string_view(statistics->worst.sample) : "");
    if (limit_) {
      cells.emplace_back(std::string_view(file.passed ? "pass" : "fail"));
    }
    writer.Add(cells);
  }

  bool with_file_;
  std::optional<float> limit_;
  bool has_summary_;
  std::optional<SampleTable> table_;
  std::unique_ptr<RecordWriter> summary_;  // instead of the table
  std::vector<Difference> differences_;    // of the file at hand
  std::vector<File> files_;
};

class DiffCommand : public Command {
 public:
  void AddOptions(CLI::App& app) override {
    AddArgument(app, "REFERENCE", reference_, "Document to compare with; - is standard input");
    AddArguments(app, "SAMPLE", inputs_.paths, "Documents to compare");
    AddOption(app, "--formula", formula_, "WORD", "Difference formula: " + ShownWords(kFormulaKey));
    AddOption(app, "--weights", weights_, "N,...", "Weights: kL,kC,kH of 94 and 2000, l,c of CMC");
    AddOption(app, "--limit", limit_, "N", "Tell which files have no difference above this");
    AddFlag(app, "--summary", only_summary_, "Leave out the single differences");
    color_.AddViewingTo(app);
    filter_.AddTo(app);
    jobs_.AddTo(app);
    output_.AddTo(app, "table csv json");
  }

  ExitStatus Run() override {
    const Format format = output_.GetFormat();
    CheckInputs();
    const Comparison comparison = MakeComparison();
    std::map<std::string, std::string> conditions = comparison.request.GetAttributes();
    conditions.erase(kTypeKey);
    conditions[kFormulaKey] = formula_;
    if (!weights_.empty()) {
      conditions["weights"] = weights_;
    }
    Output output(output_.path);
    Vexdoc::VEX reference;
    LoadDocument(reference_, reference);
    DiffReport report(format, output, inputs_.paths.size() > 1, only_summary_, limit_, conditions);
    bool all_good = true;
    std::size_t documents = 0;
    const ExitStatus status =
        inputs_.ForEachDocument([&](const std::string& path, const Vexdoc::VEX& document) {
          ++documents;
          all_good &= Compare(comparison, reference, path, document, report);
        });
    if (documents == 0) {
      return status;  // the old output stays
    }
    report.End();
    output.Commit();
    return all_good ? status : Worse(status, ExitStatus::kSomeFailed);
  }

 private:
  void CheckInputs() const {
    InputOptions all = inputs_;
    all.paths.push_back(reference_);
    all.CheckStandardInput(color_.GetIlluminantFile());
    if (limit_ && !(*limit_ >= 0.0F)) {
      throw UsageError("--limit: a difference is 0 or above");
    }
  }

  Comparison MakeComparison() const {
    Comparison comparison;
    comparison.formula = ConditionValue("--formula", kFormulaKey, formula_);
    comparison.request = color_.MakeConditions();
    if (color_.illuminant == kEmission) {
      throw UsageError("--illuminant: differences are those of reflecting samples");
    }
    if (weights_.empty()) {
      return comparison;
    }
    const std::size_t count = formula_ == "CMC"                        ? 2
                              : formula_ == "94" || formula_ == "2000" ? 3
                                                                       : 0;
    auto numbers = ParseNumbers(weights_);
    if (count == 0 || !numbers || numbers->size() != count ||
        std::any_of(numbers->begin(), numbers->end(), [](float n) { return n <= 0.0F; })) {
      throw UsageError(fmt::format("--weights: the formula {} takes {}", formula_,
                                   count == 0 ? "no weights"
                                              : fmt::format("{} numbers above 0 with commas "
                                                            "between them",
                                                            count)));
    }
    numbers->resize(3);
    comparison.weights = {(*numbers)[0], (*numbers)[1], (*numbers)[2]};
    return comparison;
  }

  static constexpr std::size_t kPairsAtOnce = 65536;

  bool Compare(const Comparison& comparison, const Vexdoc::VEX& reference, const std::string& path,
               const Vexdoc::VEX& document, DiffReport& report) const {
    const SamplePairs matched(reference_, reference, path, document, filter_);
    bool complete = matched.ReportUnpaired();
    for (std::size_t first = 0; first < matched.pairs.size(); first += kPairsAtOnce) {
      const auto pairs = std::span(matched.pairs)
                             .subspan(first, std::min(kPairsAtOnce, matched.pairs.size() - first));
      const auto differences = comparison.BetweenSpectra(pairs, jobs_);
      for (std::size_t i = 0; i < pairs.size(); ++i) {
        const SamplePair& pair = pairs[i];
        const Place place{path, pair.set, pair.name};
        complete &= TryFor(place, *pair.sample, [&] {
          report.Add(place, differences[i] ? *differences[i]
                                           : comparison.Between(*pair.reference, *pair.sample));
        });
      }
    }
    return report.EndFile(path, complete) && complete;
  }

  std::string reference_;
  InputOptions inputs_;
  std::string formula_ = "2000";
  std::string weights_;
  std::optional<float> limit_;
  bool only_summary_ = false;
  ColorOptions color_;
  SampleFilter filter_;
  JobOptions jobs_;
  OutputOptions output_;
};

}  // namespace

std::unique_ptr<Command> MakeDiffCommand() {
  return std::make_unique<DiffCommand>();
}

}  // namespace Aldermoor::Tool
