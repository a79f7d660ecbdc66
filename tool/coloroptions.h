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

/// Sets the illuminant `word`, a spectrum of a document too, that was given with `option`.
/// Throws: UsageError for what is not in the vocabulary; InputError if the document cannot be read.
void SetIlluminant(Vexdoc::Conditions& request, const std::string& option, const std::string& word);
/// The same for what reflects light, so without "Emission".
void SetReflectionIlluminant(Vexdoc::Conditions& request, const std::string& option,
                             const std::string& word);
/// The file of an illuminant that is a spectrum of a document, else empty.
std::string IlluminantFile(const std::string& word);
/// What an option for an illuminant takes, for its help.
std::string IlluminantHelp();

/// The options that say under what a colour is asked for: "--space", "--illuminant",
/// "--observer", "--white-base" and "--condition".
struct ColorOptions {
  std::string space = "CIELab";
  std::string illuminant = "D50";
  std::string observer = "TwoDegree";
  std::optional<std::string> white_base;
  std::vector<std::string> conditions;

  void AddTo(CLI::App& app);
  /// Only "--illuminant" and "--observer".
  void AddViewingTo(CLI::App& app);

  std::string GetIlluminantFile() const { return IlluminantFile(illuminant); }

  /// The request.  "--condition" is applied in order and last.
  /// Throws: UsageError for what is not in the vocabulary; InputError if the document of an
  /// illuminant cannot be read.
  Vexdoc::Conditions MakeConditions() const;

 private:
  void ApplyConditions(Vexdoc::Conditions& request) const;
};

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TOOL_COLOROPTIONS_H
