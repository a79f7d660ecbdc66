#ifndef ALDERMOOR_TOOL_CSVLAYOUT_H
#define ALDERMOOR_TOOL_CSVLAYOUT_H

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "csvreader.h"
#include "vocabulary.h"

/// What the columns of a CSV file are, by their headings.
namespace Aldermoor::Tool {

inline constexpr int kFirstBand = 380;  // nm
inline constexpr int kBandStep = 10;    // nm
inline constexpr int kLastBand = 730;   // nm

inline const std::string kNameHeading = "Name";
inline const std::string kSetHeading = "Set";
/// In front of a header key that would be read as something else.
inline const std::string kSamplePrefix = "Sample.";

struct CsvColumn {
  enum class Role { kName, kSet, kHeader, kBand, kChannel, kNone };

  Role role = Role::kNone;
  std::size_t index = 0;  // of the band or channel
  std::string key;        // of the header value
};

struct CsvLayout {
  std::vector<CsvColumn> columns;
  bool has_spectrum = false;
  std::string color_space;  // empty if there are no colours
  /// Headings like those of channels that make no colour; their columns are header values.
  std::vector<std::string> stray_channels;

  /// `type` is the colour space if it is known from elsewhere.  What is wrong with the headings
  /// goes to `faults`.
  CsvLayout(const std::vector<CsvCell>& headings, const std::optional<std::string>& type,
            CsvFaults& faults);

 private:
  void FindBands(const std::vector<CsvCell>& headings, CsvFaults& faults);
  void FindChannels(const std::vector<CsvCell>& headings, const std::optional<std::string>& type,
                    CsvFaults& faults);
  void FindHeaderKeys(const std::vector<CsvCell>& headings, CsvFaults& faults);
};

/// The labels of the channels of a colour space of the vocabulary, in channel order.
const std::vector<std::string>& ChannelLabels(const std::string& color_space);

/// The heading for a header key of samples.
std::string HeadingFor(const std::string& key);

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TOOL_CSVLAYOUT_H
