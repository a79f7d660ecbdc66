#ifndef ALDERMOOR_TOOL_COLOROPTIONS_H
#define ALDERMOOR_TOOL_COLOROPTIONS_H

#include <optional>
#include <string>
#include <vector>

#include "aldermoor/vexdoc/conditions.h"

namespace CLI {
class App;
}

namespace Aldermoor::Tool {

/// The options that say under what a colour is asked for: "--space", "--illuminant",
/// "--observer", "--white-base" and "--condition".
struct ColorOptions {
  std::string space = "CIELab";
  std::string illuminant = "D50";
  std::string observer = "TwoDegree";
  std::optional<std::string> white_base;
  std::vector<std::string> conditions;

  void AddTo(CLI::App& app);

  /// The file of an illuminant that is a spectrum of a document, else empty.
  std::string GetIlluminantFile() const;

  /// The request.  "--condition" is applied in order and last.
  /// Throws: UsageError for what is not in the vocabulary; InputError if the document of an
  /// illuminant cannot be read.
  Vexdoc::Conditions MakeConditions() const;

 private:
  void ApplyIlluminant(Vexdoc::Conditions& request) const;
  void ApplyConditions(Vexdoc::Conditions& request) const;
};

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TOOL_COLOROPTIONS_H
