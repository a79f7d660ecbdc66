#include "records.h"

#include <algorithm>
#include <cstddef>
#include <utility>

#include <fmt/format.h>

#include "exitstatus.h"
#include "options.h"
#include "text.h"
#include "vocabulary.h"

namespace Aldermoor::Tool {
namespace {

using Conditions = std::map<std::string, std::string>;

std::string Rounded(float value, int decimals) {
  std::string text = fmt::format("{:.{}f}", value, decimals);
  // A tiny value below 0 reads as 0, and the sign of a NaN says nothing.
  if (text == "-nan" || (text.starts_with('-') && text.find_first_not_of("-0.") == text.npos)) {
    text.erase(0, 1);
  }
  return text;
}

class CsvWriter : public RecordWriter {
 public:
  CsvWriter(Output& output, const std::vector<Column>& columns) : output_(output) {
    WriteNames(columns);
  }

  void Add(std::span<const Cell> record) override {
    for (const Cell& cell : record) {
      Separate();
      if (const auto* const text = std::get_if<std::string_view>(&cell)) {
        AppendCsvField(line_, *text);
      } else {
        AppendNumber(line_, std::get<float>(cell));
      }
    }
    EndLine();
  }

  void BeginList(const std::string& /*name*/, std::vector<Column> columns) override {
    EndLine();
    WriteNames(columns);
  }

  void End() override {}

 private:
  void WriteNames(const std::vector<Column>& columns) {
    for (const Column& column : columns) {
      Separate();
      AppendCsvField(line_, column.name);
    }
    EndLine();
  }

  void Separate() {
    if (!first_) {
      line_ += ',';
    }
    first_ = false;
  }

  void EndLine() {
    line_ += '\n';
    output_.Write(line_);
    line_.clear();
    first_ = true;
  }

  Output& output_;
  std::string line_;
  bool first_ = true;
};

class JsonWriter : public RecordWriter {
 public:
  JsonWriter(Output& output, const std::vector<Column>& columns, const Conditions& conditions)
      : output_(output) {
    SetKeys(columns);
    std::string head = "{\n  \"conditions\": {";
    const char* separator = "\n    ";
    for (const auto& [key, value] : conditions) {
      head += std::exchange(separator, ",\n    ");
      AppendJsonString(head, key);
      head += ": ";
      AppendJsonString(head, value);
    }
    output_.Write(head + "\n  },\n  \"results\": [");
  }

  void Add(std::span<const Cell> record) override {
    line_ = std::exchange(separator_, ",\n    ");
    for (std::size_t i = 0; i < record.size(); ++i) {
      line_ += keys_[i];
      if (const auto* const text = std::get_if<std::string_view>(&record[i])) {
        AppendJsonString(line_, *text);
      } else {
        AppendJsonNumber(line_, std::get<float>(record[i]));
      }
    }
    line_ += '}';
    output_.Write(line_);
  }

  void BeginList(const std::string& name, std::vector<Column> columns) override {
    keys_.clear();
    SetKeys(columns);
    separator_ = kFirst;
    line_ = "\n  ],\n  ";
    AppendJsonString(line_, name);
    output_.Write(line_ + ": [");
  }

  void End() override { output_.Write("\n  ]\n}\n"); }

 private:
  static constexpr const char* kFirst = "\n    ";

  void SetKeys(const std::vector<Column>& columns) {
    for (const Column& column : columns) {
      std::string& key = keys_.emplace_back(keys_.empty() ? "{" : ", ");
      AppendJsonString(key, column.name);
      key += ": ";
    }
  }

  Output& output_;
  std::vector<std::string> keys_;  // each with what stands in front of and behind it
  const char* separator_ = kFirst;
  std::string line_;
};

/// Keeps the records until the end, since every one of them may widen a column.
class TableWriter : public RecordWriter {
 public:
  TableWriter(Output& output, std::vector<Column> columns) : output_(output) {
    SetColumns(std::move(columns));
  }

  void Add(std::span<const Cell> record) override {
    for (std::size_t i = 0; i < record.size(); ++i) {
      if (const auto* const text = std::get_if<std::string_view>(&record[i])) {
        cells_.push_back(OnOneLine(*text));
      } else {
        number_[i] = true;
        cells_.push_back(Rounded(std::get<float>(record[i]), columns_[i].decimals));
      }
      widths_[i] = std::max(widths_[i], DisplayWidth(cells_.back()));
    }
  }

  void BeginList(const std::string& /*name*/, std::vector<Column> columns) override {
    End();
    EndLine();
    SetColumns(std::move(columns));
  }

  void End() override {
    for (std::size_t i = 0; i < columns_.size(); ++i) {
      Pad(i, columns_[i].name);
    }
    EndLine();
    for (std::size_t at = 0; at < cells_.size(); ++at) {
      const std::size_t column = at % columns_.size();
      Pad(column, cells_[at]);
      if (column + 1 == columns_.size()) {
        EndLine();
      }
    }
  }

 private:
  void SetColumns(std::vector<Column> columns) {
    columns_ = std::move(columns);
    number_.assign(columns_.size(), false);
    widths_.clear();
    for (const Column& column : columns_) {
      widths_.push_back(DisplayWidth(column.name));
    }
    cells_.clear();
  }

  void Pad(std::size_t column, const std::string& text) {
    const std::size_t fill = widths_[column] - DisplayWidth(text);
    line_.append(column == 0 ? 0 : 2, ' ');
    line_.append(number_[column] ? fill : 0, ' ');
    line_ += text;
    line_.append(number_[column] ? 0 : fill, ' ');
  }

  void EndLine() {
    line_.erase(line_.find_last_not_of(' ') + 1);
    line_ += '\n';
    output_.Write(line_);
    line_.clear();
  }

  Output& output_;
  std::vector<Column> columns_;
  std::vector<bool> number_;  // whether a column holds numbers, which are aligned to the right
  std::vector<std::size_t> widths_;
  std::vector<std::string> cells_;
  std::string line_;
};

}  // namespace

void OutputOptions::AddTo(CLI::App& app, const std::string& formats) {
  formats_ = formats;
  AddOption(app, "--format", format, "WORD", "How to write the results: " + formats);
  AddOutputOption(app, path, "Write to this file instead of standard output (-)");
}

Format OutputOptions::GetFormat() const {
  CheckWord("--format", format, SplitWords(formats_));
  return format == "csv" ? Format::kCsv : format == "json" ? Format::kJson : Format::kTable;
}

std::unique_ptr<RecordWriter> MakeRecordWriter(Format format, Output& output,
                                               std::vector<Column> columns,
                                               const Conditions& conditions) {
  switch (format) {
    case Format::kCsv:
      return std::make_unique<CsvWriter>(output, columns);
    case Format::kJson:
      return std::make_unique<JsonWriter>(output, columns, conditions);
    case Format::kTable:
      break;
  }
  return std::make_unique<TableWriter>(output, std::move(columns));
}

}  // namespace Aldermoor::Tool
