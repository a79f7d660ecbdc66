#include <cstddef>
#include <memory>
#include <string>

#include <fmt/format.h>

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

// Removes the children for which `takes(child)` is false; the header stays as it is.
template <class Node, class Takes>
void KeepOnly(Node& node, Takes takes) {
  const auto header = node.GetAttributes();
  const auto& elements = node.GetElements();
  for (auto i = elements.begin(); i != elements.end();) {
    i = takes(*i->second) ? std::next(i) : node.RemoveElement(i);
  }
  ForgetDates(node);
  for (const auto& [key, value] : header) {
    node.SetAttribute(key, value);
  }
}

class ExtractCommand : public Command {
 public:
  void AddOptions(CLI::App& app) override {
    AddArgument(app, "FILE", input_, "Document to read; - is standard input");
    filter_.AddTo(app);
    AddRequiredOutputOption(app, output_);
    whole_.AddTo(app);
    AddFlag(app, "--no-cache", no_cache_, "Leave the cache beside the file as it is");
  }

  ExitStatus Run() override {
    if (!filter_.IsSet()) {
      throw UsageError("--set or --sample must say what to extract");
    }
    Vexdoc::VEX document;
    whole_.Load(input_, document);
    KeepOnly(document, [this](Vexdoc::SampleSet& set) {
      if (!filter_.TakesSet(set.GetName())) {
        return false;
      }
      KeepOnly(set, [this](const Vexdoc::Sample& sample) {
        return filter_.TakesSample(sample.GetName());
      });
      return set.Size() > 0 ||
             !filter_.sample;  // a set that was asked for by its name may be empty
    });
    if (document.Size() == 0) {
      Report(fmt::format("{}: {}", ShownPath(input_), filter_.NoMatchText()));
      return ExitStatus::kSomeFailed;
    }
    return SaveChecked(document, output_, !no_cache_, false);
  }

 private:
  std::string input_;
  std::string output_;
  SampleFilter filter_;
  WholeInput whole_;
  bool no_cache_ = false;
};

}  // namespace

std::unique_ptr<Command> MakeExtractCommand() {
  return std::make_unique<ExtractCommand>();
}

}  // namespace Aldermoor::Tool
