#ifndef ALDERMOOR_TOOL_ILLUMINANT_H
#define ALDERMOOR_TOOL_ILLUMINANT_H

#include <string>
#include <string_view>

#include "aldermoor/vexdoc/spectrum.h"
#include "aldermoor/vexdoc/vex.h"

namespace Aldermoor::Tool {

/// The first character of an illuminant that is a spectrum of a document.
inline constexpr char kSpectrumMark = '@';

/// The parts of "@FILE:SET/SAMPLE", or of "SET/SAMPLE" for a document that is read anyway.
struct SpectrumPath {
  std::string option;  // for messages
  std::string file;    // empty for the second form
  std::string set;
  std::string sample;

  /// FILE ends at the last ":" that has a "/" behind it, SET at the first "/" after that; SAMPLE
  /// may hold both.  Throws: UsageError if a part is missing.
  static SpectrumPath Parse(std::string_view text, const std::string& option = "--illuminant");
  /// The second form: SET ends at the first "/".
  static SpectrumPath ParseWithin(std::string_view text, const std::string& option);

  /// Throws: InputError if the file cannot be read; UsageError if it holds no such spectrum or one
  /// without 36 values.
  Vexdoc::Spectrum Load() const;
  /// The spectrum in `document`, which `shown` names.  Throws: UsageError as Load.
  Vexdoc::Spectrum FindIn(const Vexdoc::VEX& document, const std::string& shown) const;
};

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TOOL_ILLUMINANT_H
