#include <iterator>
#include <memory>
#include <string>
#include <vector>

#include <fmt/format.h>
#include <fmt/ranges.h>

#include "command.h"
#include "diagnostics.h"
#include "documents.h"
#include "inputfile.h"
#include "options.h"
#include "output.h"
#include "wholeinput.h"
#include "xmldocument.h"

namespace Aldermoor::Tool {
namespace {

// The header of the result is that of the first document; dates always differ.
void ReportLostHeader(const std::string& path, const Vexdoc::VEX& first, const Vexdoc::VEX& other) {
  std::vector<std::string> lost;
  for (const auto& [key, value] : other.GetAttributes()) {
    if (key != Vexdoc::Header::kCreatedKey && key != Vexdoc::Header::kModifiedKey &&
        !value.empty() && first.GetAttribute(key) != value) {
      lost.push_back(key);
    }
  }
  if (!lost.empty()) {
    Report(
        fmt::format("{}: the values of its header are left out where the first document has "
                    "others: {}",
                    ShownPath(path), fmt::join(lost, ", ")));
  }
}

class MergeCommand : public Command {
 public:
  void AddOptions(CLI::App& app) override {
    inputs_.AddTo(app);
    AddRequiredOutputOption(app, output_);
    whole_.AddTo(app);
    AddFlag(app, "--no-cache", no_cache_, "Leave the cache beside the file as it is");
  }

  ExitStatus Run() override {
    inputs_.CheckStandardInput();
    Vexdoc::VEX merged;
    whole_.Load(inputs_.paths.front(), merged);
    const auto header = merged.GetAttributes();
    for (auto path = std::next(inputs_.paths.begin()); path != inputs_.paths.end(); ++path) {
      Vexdoc::VEX document;
      whole_.Load(*path, document);
      ReportLostHeader(*path, merged, document);
      for (const auto& [key, set] : document.GetSampleSets()) {
        const std::string name = set->GetName();
        const std::string kept = merged.AddSampleSet(*set);
        if (kept != name) {
          Report(fmt::format("{}: the set '{}' becomes '{}'", ShownPath(*path), name, kept));
        }
      }
    }
    ForgetDates(merged);
    for (const auto& [key, value] : header) {
      merged.SetAttribute(key, value);
    }
    return SaveChecked(merged, output_, !no_cache_, false);
  }

 private:
  InputOptions inputs_;
  std::string output_;
  WholeInput whole_;
  bool no_cache_ = false;
};

}  // namespace

std::unique_ptr<Command> MakeMergeCommand() {
  return std::make_unique<MergeCommand>();
}

}  // namespace Aldermoor::Tool
