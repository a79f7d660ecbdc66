#include <algorithm>
#include <memory>
#include <string>

#include <fmt/format.h>

#include "command.h"
#include "csvdocument.h"
#include "diagnostics.h"
#include "inputfile.h"
#include "options.h"
#include "output.h"
#include "vocabulary.h"
#include "wholeinput.h"
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
    whole_.AddTo(app);
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
      KindConditions given;
      csv_.conditions.ApplyTo(given);
      whole_.Load(input_, document, &given);
    }
    return Worse(status,
                 to_csv ? SaveCsv(document) : SaveChecked(document, output_, !no_cache_, true));
  }

 private:
  void CheckOptions(bool from_csv, bool to_csv) {
    CheckWord("--separator", separator_, {"comma", "semicolon", "tab"});
    csv_.separator = separator_ == "comma" ? ',' : separator_ == "tab" ? '\t' : ';';
    if (!from_csv && (csv_.percent || csv_.set)) {
      throw UsageError("--percent and --set are for a CSV file that is read");
    }
    if (from_csv && whole_.IsAskedFor()) {
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
  WholeInput whole_;
  CsvOptions csv_;
};

}  // namespace

std::unique_ptr<Command> MakeConvertCommand() {
  return std::make_unique<ConvertCommand>();
}

}  // namespace Aldermoor::Tool
