#include <algorithm>
#include <memory>
#include <sstream>
#include <string>

#include <fmt/format.h>

#include "aldermoor/vexdoc/inspection.h"

#include "command.h"
#include "completion.h"
#include "csvdocument.h"
#include "diagnostics.h"
#include "faults.h"
#include "inputfile.h"
#include "options.h"
#include "output.h"
#include "vocabulary.h"
#include "xmldocument.h"

namespace Aldermoor::Tool {
namespace {

// The form of a file, by the word of an option or the extension of its name.
bool IsCsv(const std::string& path, const std::string& option, const std::string& word) {
  if (!word.empty()) {
    CheckWord(option, word, {"xml", "csv"});
    return word == "csv";
  }
  std::string end = path.substr(path.size() - std::min<std::size_t>(path.size(), 4));
  std::transform(end.begin(), end.end(), end.begin(),
                 [](char c) { return c >= 'A' && c <= 'Z' ? static_cast<char>(c + 32) : c; });
  return end == ".csv";
}

// Tells what stands in XML and does not come into the document; returns whether there is any.
bool ReportLosses(const std::string& path, const std::string& text) {
  std::istringstream in(text);
  bool has_losses = false;
  for (const Vexdoc::Fault& fault : Vexdoc::CheckXML(in)) {
    if (fault.loss == Vexdoc::Fault::Loss::kContent) {
      has_losses = true;
      Report(FaultText(path, fault));
    }
  }
  return has_losses;
}

class ConvertCommand : public Command {
 public:
  void AddOptions(CLI::App& app) override {
    AddArgument(app, "IN", input_, "What to read; - is standard input");
    AddArgument(app, "OUT", output_, "What to write; - is standard output");
    AddOption(app, "--from", from_, "WORD",
              "Form of IN, if its name does not end in .csv or .xml: xml csv");
    AddOption(app, "--to", to_, "WORD", "Form of OUT, likewise");
    AddFlag(app, "--no-cache", no_cache_, "Leave the cache beside an XML file as it is");
    csv_.conditions.AddTo(app);
    complete_.AddTo(app);
    AddFlag(app, "--strict", is_strict_, "Write nothing if something in an XML file is not read");
    AddOption(app, "--separator", separator_, "WORD",
              "Between the cells of CSV: comma semicolon tab");
    AddFlag(app, "--percent", csv_.percent, "The spectra of the CSV file are in percent");
    AddOption(app, "--set", csv_.set, "NAME",
              "Name of the set for a CSV file that does not name one");
    AddFlag(app, "--skip-faulty", csv_.skip_faulty,
            "Leave out rows with faults, and what CSV cannot carry");
  }

  ExitStatus Run() override {
    const bool from_csv = IsCsv(input_, "--from", from_);
    const bool to_csv = IsCsv(output_, "--to", to_);
    CheckOptions(from_csv, to_csv);
    Vexdoc::VEX document;
    ExitStatus status = ExitStatus::kDone;
    if (from_csv) {
      if (const std::size_t skipped = ReadCsv(input_, csv_, document); skipped > 0) {
        Report(fmt::format("{} row{} left out", skipped, skipped == 1 ? "" : "s"));
        status = ExitStatus::kSomeFailed;
      }
    } else {
      LoadWhole(document);
    }
    return Worse(status,
                 to_csv ? SaveCsv(document) : SaveChecked(document, output_, !no_cache_, true));
  }

 private:
  // Completes the document, and tells what is lost on the way into it.
  void LoadWhole(Vexdoc::VEX& document) const {
    KindConditions given;
    csv_.conditions.ApplyTo(given);
    const std::string text = ReadBytes(input_);
    Vexdoc::LoadOptions options;
    options.wavelengths = complete_.GetUse();
    options.completion = Vexdoc::Completion{given.spectrum, given.color};
    const Vexdoc::LoadReport report = LoadStored(input_, text, document, options);
    ReportRanges(input_, report);
    if (!ReportCompletion(report.completion, given)) {
      throw RefusedError(
          fmt::format("{}: conditions are missing; nothing is written", ShownPath(input_)));
    }
    if (ReportLosses(input_, text) && is_strict_) {
      throw RefusedError(fmt::format("{}: --strict; nothing is written", ShownPath(input_)));
    }
  }

  void CheckOptions(bool from_csv, bool to_csv) {
    CheckWord("--separator", separator_, {"comma", "semicolon", "tab"});
    csv_.separator = separator_ == "comma" ? ',' : separator_ == "tab" ? '\t' : ';';
    if (!from_csv && (csv_.percent || csv_.set)) {
      throw UsageError("--percent and --set are for a CSV file that is read");
    }
    if (from_csv && (complete_.is_set || is_strict_)) {
      throw UsageError("--complete and --strict are for an XML file that is read");
    }
    if (!from_csv && !to_csv && csv_.skip_faulty) {
      throw UsageError("--skip-faulty is for CSV");
    }
  }

  ExitStatus SaveCsv(const Vexdoc::VEX& document) const {
    const CsvText csv = WriteCsv(document, csv_);
    if (csv.faults > 0 && !csv_.skip_faulty) {
      Report(fmt::format("{}: nothing is written; --skip-faulty leaves it out",
                         output_ == kStandardStream ? "<standard output>" : output_));
      return ExitStatus::kSomeFailed;
    }
    Output output(output_, FileForm::kCsv);
    output.Write(csv.text);
    output.Commit();
    return csv.faults > 0 ? ExitStatus::kSomeFailed : ExitStatus::kDone;
  }

  std::string input_;
  std::string output_;
  std::string from_;
  std::string to_;
  std::string separator_ = "comma";
  bool no_cache_ = false;
  CompleteOption complete_;
  bool is_strict_ = false;
  CsvOptions csv_;
};

}  // namespace

std::unique_ptr<Command> MakeConvertCommand() {
  return std::make_unique<ConvertCommand>();
}

}  // namespace Aldermoor::Tool
