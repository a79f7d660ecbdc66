#ifndef ALDERMOOR_TOOL_RECORDS_H
#define ALDERMOOR_TOOL_RECORDS_H

#include <map>
#include <memory>
#include <span>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

#include "output.h"

namespace CLI {
class App;
}

namespace Aldermoor::Tool {

enum class Format { kTable, kCsv, kJson };

/// The options "--format" and "--output".
struct OutputOptions {
  std::string format = "table";
  std::string path = kStandardStream;

  /// `formats` are the words that "--format" takes.
  void AddTo(CLI::App& app, const std::string& formats);
  /// Throws: UsageError.
  Format GetFormat() const;

 private:
  std::string formats_;
};

/// A text or a number of a record.
using Cell = std::variant<std::string_view, float>;

struct Column {
  std::string name;
  int decimals = 0;  // of numbers in a table; csv and json hold the shortest exact text
};

/// Writes records of named fields, one after the other.
class RecordWriter {
 public:
  RecordWriter() = default;
  RecordWriter(const RecordWriter&) = delete;
  RecordWriter& operator=(const RecordWriter&) = delete;
  virtual ~RecordWriter() = default;

  /// One cell for each column.
  virtual void Add(std::span<const Cell> record) = 0;
  /// Ends the records so far and begins others.  In json they stand under `name`, in the other
  /// formats behind an empty line.
  virtual void BeginList(const std::string& name, std::vector<Column> columns) = 0;
  virtual void End() = 0;
};

/// `conditions` stand in front of the records in a format that has a place for them.  `output` is
/// kept by reference.
std::unique_ptr<RecordWriter> MakeRecordWriter(
    Format format, Output& output, std::vector<Column> columns,
    const std::map<std::string, std::string>& conditions);

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TOOL_RECORDS_H
