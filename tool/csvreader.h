#ifndef ALDERMOOR_TOOL_CSVREADER_H
#define ALDERMOOR_TOOL_CSVREADER_H

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

namespace Aldermoor::Tool {

/// A cell with the place of its first character: physical line and character, both from 1.
struct CsvCell {
  std::string text;
  bool quoted = false;
  std::size_t line = 1;
  std::size_t column = 1;

  /// Whether nothing stands between two separators; `""` is an empty text.
  bool IsAbsent() const { return text.empty() && !quoted; }
};

/// What is wrong with a CSV file, place by place.  The first hundred are kept, all are counted.
class CsvFaults {
 public:
  void Add(const CsvCell& place, const std::string& text);
  std::size_t Count() const { return count_; }
  /// Writes "<path>:<line>:<column>: <text>" for each to standard error.
  void ReportAll(const std::string& path) const;

 private:
  std::vector<std::string> texts_;
  std::size_t count_ = 0;
};

/// Splits a text into records of cells.  Source: RFC 4180; any separator, lines end in CR LF, LF or
/// CR, a byte order mark is passed over.
///
/// Faults of the form, and text that a document cannot hold, go to `faults`.
class CsvReader {
 public:
  /// Keeps a view of `text` and a reference to `faults`.
  CsvReader(std::string_view text, char separator, CsvFaults& faults);

  /// The next record that is not blank; false at the end.
  bool Next(std::vector<CsvCell>& record);

 private:
  void ReadRecord(std::vector<CsvCell>& record);
  void ReadCell(CsvCell& cell);
  void ReadQuoted(CsvCell& cell);
  void ReadPlain(CsvCell& cell);
  void EndLine();
  void Take(std::string& out);
  bool IsAtCellEnd() const;

  std::string_view rest_;
  char separator_;
  CsvFaults& faults_;
  std::size_t line_ = 1;
  std::size_t column_ = 1;
};

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TOOL_CSVREADER_H
