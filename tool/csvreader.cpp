#include "csvreader.h"

#include <algorithm>

#include <fmt/format.h>

#include "diagnostics.h"
#include "inputfile.h"

namespace Aldermoor::Tool {
namespace {

constexpr std::size_t kMaxFaultTexts = 100;
constexpr std::string_view kByteOrderMark = "\xEF\xBB\xBF";

bool IsContinuation(char byte) {
  return (static_cast<unsigned char>(byte) & 0xC0U) == 0x80U;
}

// The length of the character at `text`, or 0 if it is no UTF-8.  Source: Unicode 15, table 3-7.
std::size_t Utf8Length(std::string_view text) {
  const auto byte = [text](std::size_t i) {
    return i < text.size() ? static_cast<unsigned char>(text[i]) : 0U;
  };
  const unsigned int lead = byte(0);
  if (lead < 0x80) {
    return 1;
  }
  const std::size_t length = lead >= 0xF0 ? 4 : lead >= 0xE0 ? 3 : 2;
  const unsigned int least = lead == 0xE0 ? 0xA0 : lead == 0xF0 ? 0x90 : 0x80;
  const unsigned int most = lead == 0xED ? 0x9F : lead == 0xF4 ? 0x8F : 0xBF;
  bool is_good = lead >= 0xC2 && lead <= 0xF4 && byte(1) >= least && byte(1) <= most;
  for (std::size_t i = 2; i < length; ++i) {
    is_good = is_good && byte(i) >= 0x80 && byte(i) <= 0xBF;
  }
  return is_good ? length : 0;
}

// Why a document cannot hold `text`; null if it can.
const char* TextFault(std::string_view text) {
  while (!text.empty()) {
    const std::size_t length = Utf8Length(text);
    if (length == 0) {
      return "the cell holds bytes that are no UTF-8";
    }
    const auto c = static_cast<unsigned char>(text.front());
    const std::string_view character = text.substr(0, length);
    if ((c < 0x20 && c != '\t' && c != '\n' && c != '\r') || character == "\xEF\xBF\xBE" ||
        character == "\xEF\xBF\xBF") {
      return "the cell holds a control character, which a document cannot carry";
    }
    text.remove_prefix(length);
  }
  return nullptr;
}

}  // namespace

void CsvFaults::Add(const CsvCell& place, const std::string& text) {
  ++count_;
  if (texts_.size() < kMaxFaultTexts) {
    texts_.push_back(fmt::format("{}:{}: {}", place.line, place.column, text));
  }
}

void CsvFaults::ReportAll(const std::string& path) const {
  for (const std::string& text : texts_) {
    Report(fmt::format("{}:{}", ShownPath(path), text));
  }
  if (count_ > texts_.size()) {
    Report(fmt::format("{}: and {} more faults", ShownPath(path), count_ - texts_.size()));
  }
}

CsvReader::CsvReader(std::string_view text, char separator, CsvFaults& faults)
    : rest_(text), separator_(separator), faults_(faults) {
  if (rest_.starts_with(kByteOrderMark)) {
    rest_.remove_prefix(kByteOrderMark.size());
  }
}

bool CsvReader::Next(std::vector<CsvCell>& record) {
  while (!rest_.empty()) {
    ReadRecord(record);
    if (!std::all_of(record.begin(), record.end(),
                     [](const CsvCell& cell) { return cell.IsAbsent(); })) {
      return true;
    }
  }
  return false;
}

void CsvReader::ReadRecord(std::vector<CsvCell>& record) {
  record.clear();
  while (true) {
    ReadCell(record.emplace_back());
    if (rest_.empty() || rest_.front() != separator_) {
      break;
    }
    rest_.remove_prefix(1);
    ++column_;
  }
  EndLine();
}

void CsvReader::ReadCell(CsvCell& cell) {
  cell.line = line_;
  cell.column = column_;
  cell.quoted = rest_.starts_with('"');
  if (cell.quoted) {
    ReadQuoted(cell);
  } else {
    ReadPlain(cell);
  }
  if (const char* const fault = TextFault(cell.text)) {
    faults_.Add(cell, fault);
  }
}

void CsvReader::ReadQuoted(CsvCell& cell) {
  std::string quote;
  Take(quote);
  while (!rest_.empty()) {
    if (rest_.front() != '"') {
      Take(cell.text);
    } else if (rest_.starts_with("\"\"")) {
      Take(quote);
      Take(cell.text);
    } else {
      Take(quote);
      if (!IsAtCellEnd()) {
        faults_.Add(cell, "text follows the closing quote; expected a separator or the line's end");
        ReadPlain(cell);
      }
      return;
    }
  }
  faults_.Add(cell, "the quotes that begin here are never closed");
}

void CsvReader::ReadPlain(CsvCell& cell) {
  bool has_quote = false;
  while (!IsAtCellEnd()) {
    has_quote = has_quote || rest_.front() == '"';
    Take(cell.text);
  }
  if (has_quote && !cell.quoted) {
    faults_.Add(cell, "a quote inside a cell; expected quotes around the cell and the quote twice");
  }
}

void CsvReader::EndLine() {
  rest_.remove_prefix(rest_.starts_with("\r\n") ? 2 : std::min<std::size_t>(rest_.size(), 1));
  ++line_;
  column_ = 1;
}

// Moves one byte.
void CsvReader::Take(std::string& out) {
  const char c = rest_.front();
  out += c;
  rest_.remove_prefix(1);
  if (c == '\n' || (c == '\r' && !rest_.starts_with('\n'))) {
    ++line_;
    column_ = 1;
  } else if (!IsContinuation(c) && c != '\r') {
    ++column_;
  }
}

bool CsvReader::IsAtCellEnd() const {
  return rest_.empty() || rest_.front() == separator_ || rest_.front() == '\n' ||
         rest_.front() == '\r';
}

}  // namespace Aldermoor::Tool
