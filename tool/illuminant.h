#ifndef ALDERMOOR_TOOL_ILLUMINANT_H
#define ALDERMOOR_TOOL_ILLUMINANT_H

#include <string>
#include <string_view>

#include "aldermoor/vexdoc/spectrum.h"

namespace Aldermoor::Tool {

/// The first character of an illuminant that is a spectrum of a document.
inline constexpr char kSpectrumMark = '@';

/// The parts of "@FILE:SET/SAMPLE".
struct SpectrumPath {
  std::string file;
  std::string set;
  std::string sample;

  /// FILE ends at the last ":" that has a "/" behind it, SET at the first "/" after that; SAMPLE
  /// may hold both.  Throws: UsageError if a part is missing.
  static SpectrumPath Parse(std::string_view text);

  /// Throws: InputError if the file cannot be read; UsageError if it holds no such spectrum or one
  /// that cannot serve as an illuminant.
  Vexdoc::Spectrum Load() const;
};

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TOOL_ILLUMINANT_H
