#ifndef ALDERMOOR_TOOL_CSVDOCUMENT_H
#define ALDERMOOR_TOOL_CSVDOCUMENT_H

#include <cstddef>
#include <optional>
#include <string>

#include "aldermoor/vexdoc/vex.h"

#include "settings.h"

/// Documents as CSV: a sample is a row, see docs/csv.md.
namespace Aldermoor::Tool {

// Comment lines in front of the headings are settings; these say of what.
inline const std::string kDocumentPrefix = "Document.";
inline const std::string kSetKey = "Set";
inline const std::string kSetPrefix = "Set.";

struct CsvOptions {
  char separator = ',';
  bool percent = false;      // reading: spectra are in percent
  bool skip_faulty = false;  // leave out what is at fault
  std::optional<std::string> set;
  ConditionOption conditions;
};

/// Fills `document`, which is empty, from the CSV file `path`, "-" for standard input.  Reports
/// every fault with its place; returns how many rows were left out for one.
/// Throws: InputError if the file cannot be read, or has faults that are not to be skipped;
/// UsageError for options that do not fit it.
std::size_t ReadCsv(const std::string& path, const CsvOptions& options, Vexdoc::VEX& document);

/// The document as CSV; numbers are the shortest texts that read back to the same float.
struct CsvText {
  std::string text;
  std::size_t faults = 0;  // what a row cannot carry; each was reported
};
CsvText WriteCsv(const Vexdoc::VEX& document, const CsvOptions& options);

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TOOL_CSVDOCUMENT_H
