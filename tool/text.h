#ifndef ALDERMOOR_TOOL_TEXT_H
#define ALDERMOOR_TOOL_TEXT_H

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

/// How texts and numbers are shown; texts are UTF-8.
namespace Aldermoor::Tool {

/// The columns of a terminal that `text` takes: none for combining marks, two for East Asian wide
/// characters and pictographs.
std::size_t DisplayWidth(std::string_view text);

/// `text` with every run of control characters and blanks around it replaced by one blank, so that
/// a name cannot break a line or steer a terminal.
std::string OnOneLine(std::string_view text);

/// Appends the shortest text that reads back to the same float: "nan", "inf" where it is no number.
void AppendNumber(std::string& out, float value);

/// Appends one field, in quotes where it needs them.  Source: RFC 4180, 2.5 to 2.7.
void AppendCsvField(std::string& out, std::string_view text);

/// Appends a quoted JSON string.  Bytes that are no UTF-8 become U+FFFD.
void AppendJsonString(std::string& out, std::string_view text);
/// As AppendNumber; what is no number is null.
void AppendJsonNumber(std::string& out, float value);

/// The parts of `list` between commas; one empty part for an empty list.
std::vector<std::string_view> SplitAtCommas(std::string_view list);
/// Finite numbers between commas, or nothing if there is anything else.
std::optional<std::vector<float>> ParseNumbers(std::string_view list);

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TOOL_TEXT_H
