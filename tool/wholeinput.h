#ifndef ALDERMOOR_TOOL_WHOLEINPUT_H
#define ALDERMOOR_TOOL_WHOLEINPUT_H

#include <string>

#include "aldermoor/vexdoc/vex.h"

#include "settings.h"

namespace CLI {
class App;
}

namespace Aldermoor::Tool {

/// Reading XML files for the commands that write documents, with the options "--complete" and
/// "--strict": nothing that a file says gets lost without a word.
class WholeInput {
 public:
  void AddTo(CLI::App& app);

  bool IsAskedFor() const { return completes_ || is_strict_; }

  /// Reads the XML file `path`, "-" for standard input, and not its cache.  Tells what ranges were
  /// taken from points, and what of the file does not come into the document.  With `given`, also
  /// completes the conditions, and tells that.
  /// Throws: what LoadStored does; RefusedError if conditions are still missing after a completion,
  /// and with "--strict" if anything gets lost.
  void Load(const std::string& path, Vexdoc::VEX& document,
            const KindConditions* given = nullptr) const;

 private:
  bool completes_ = false;
  bool is_strict_ = false;
};

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TOOL_WHOLEINPUT_H
