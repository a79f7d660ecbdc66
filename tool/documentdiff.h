#ifndef ALDERMOOR_TOOL_DOCUMENTDIFF_H
#define ALDERMOOR_TOOL_DOCUMENTDIFF_H

#include <cstddef>
#include <string>
#include <vector>

#include "aldermoor/vexdoc/vex.h"

namespace Aldermoor::Tool {

/// What XML has made of a document: the differences that must not be, and the digits that it
/// cannot carry.
class DocumentDiff {
 public:
  /// `written` is `source`, stored and loaded again.  Dates that a load put in and empty standard
  /// values, which are not stored, are no difference.
  DocumentDiff(const Vexdoc::VEX& source, const Vexdoc::VEX& written);

  /// One line each, with the place in front; at most a hundred.
  const std::vector<std::string>& GetDifferences() const { return differences_; }
  /// "3 of 864 values lose digits in XML, at most 4.9e-07 of the value"; empty if none does.
  std::string DigitsText() const;

 private:
  void CompareSet(const Vexdoc::SampleSet& source, const Vexdoc::SampleSet& written);
  void CompareSample(const Vexdoc::Sample& source, const Vexdoc::Sample& written);
  void CompareAttribute(const Vexdoc::SampleAttribute& source,
                        const Vexdoc::SampleAttribute& written);
  void CompareKind(const Vexdoc::SampleAttribute& source, const Vexdoc::SampleAttribute& written);
  void CompareHeader(const Vexdoc::Header& source, const Vexdoc::Header& written);
  void CompareConditions(const Vexdoc::Conditions& source, const Vexdoc::Conditions& written);
  void CompareUnknown(const Vexdoc::Sample& source, const Vexdoc::Sample& written);
  void CompareText(const char* what, const std::string& source, const std::string& written);
  void CompareNumbers(const char* what, const std::vector<float>& source,
                      const std::vector<float>& written);
  bool CompareCount(const char* what, std::size_t source, std::size_t written);
  void Add(const std::string& text);

  std::string place_;
  std::vector<std::string> differences_;
  std::size_t values_ = 0;
  std::size_t changed_ = 0;
  double greatest_change_ = 0.0;  // relative
};

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TOOL_DOCUMENTDIFF_H
