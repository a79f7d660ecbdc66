#include "aldermoor/vexdoc/internals/cachestamp.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cstdio>
#include <ctime>

#include "aldermoor/utilities/exceptions/frame.h"
#include "aldermoor/utilities/filesystem/posix/contenthash.h"

namespace Aldermoor::Vexdoc::Internals {

using Platform::Posix::HashOf;

namespace {

constexpr std::int64_t kNanoseconds = 1'000'000'000;
// Three ticks of the slowest clock that a kernel is built with.
constexpr std::int64_t kResolution = 30'000'000;
// Where the file system keeps whole seconds, and some keep even ones only.
constexpr std::int64_t kCoarseResolution = 2 * kNanoseconds;

constexpr const char* kHead = "cache stamp 1";
constexpr const char* kUnfinished = "cache stamp 1, unfinished\n";

std::int64_t ToNanoseconds(const struct timespec& time) {
  return static_cast<std::int64_t>(time.tv_sec) * kNanoseconds + time.tv_nsec;
}

bool HasWholeSeconds(std::int64_t time) {
  return time % kNanoseconds == 0;
}

std::string Hex(std::uint64_t value) {
  std::array<char, 17> digits{};
  std::snprintf(digits.data(), digits.size(), "%016llx", static_cast<unsigned long long>(value));
  return digits.data();
}

// The line up to the hash of itself, which ends it: a damaged stamp must not fit by chance.
std::string WithHash(const std::string& line) {
  return line + " line-hash=" + Hex(HashOf(line.data(), line.size())) + "\n";
}

// Takes " NAME=VALUE" from the front of `text`; keeps to what ToText writes only as far as it must,
// since the whole line is compared in the end.
template <class Number>
bool Take(std::string_view& text, std::string_view name, Number& value, int base = 10) {
  if (!text.starts_with(' ') || !text.substr(1).starts_with(name)) {
    return false;
  }
  text.remove_prefix(1 + name.size());
  const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), value, base);
  text.remove_prefix(static_cast<std::size_t>(end - text.data()));
  return error == std::errc();
}

}  // namespace

FileState::FileState(const struct stat& status)
    : size(static_cast<std::uint64_t>(status.st_size)),
      inode(status.st_ino),
      modified(ToNanoseconds(status.st_mtim)),
      changed(ToNanoseconds(status.st_ctim)) {}

XmlReading::XmlReading(std::int64_t clock, const struct stat& status, std::string_view bytes)
    : state(status), hash(HashOf(bytes.data(), bytes.size())), verified(clock) {
  state.size = bytes.size();  // of a file that grew meanwhile, what was read
}

std::int64_t XmlReading::Now() {
  struct timespec now {};
  ::clock_gettime(CLOCK_REALTIME_COARSE, &now);
  return ToNanoseconds(now);
}

bool XmlReading::IsSettled() const {
  const bool is_coarse = HasWholeSeconds(state.modified) && HasWholeSeconds(state.changed);
  return std::max(state.modified, state.changed) + (is_coarse ? kCoarseResolution : kResolution) <
         verified;
}

std::string CacheStamp::ToText() const try {
  std::string line = kHead;
  const auto add = [&line](const char* name, const std::string& value) {
    line.append(" ").append(name).append(value);
  };
  add("xml-size=", std::to_string(xml.state.size));
  add("modified=", std::to_string(xml.state.modified));
  add("changed=", std::to_string(xml.state.changed));
  add("inode=", std::to_string(xml.state.inode));
  add("xml-hash=", Hex(xml.hash));
  add("verified=", std::to_string(xml.verified));
  add("cache-size=", std::to_string(cache.size));
  add("cache-hash=", Hex(cache.hash));
  add("exact=", is_exact ? "1" : "0");
  return WithHash(line);
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::CacheStamp::ToText)

std::optional<CacheStamp> CacheStamp::FromText(std::string_view text) try {
  constexpr int kHexadecimal = 16;
  const std::string_view whole = text;
  if (!text.starts_with(kHead)) {
    return std::nullopt;
  }
  text.remove_prefix(std::string_view(kHead).size());
  CacheStamp stamp;
  int exact = 0;
  const bool is_read =
      Take(text, "xml-size=", stamp.xml.state.size) &&
      Take(text, "modified=", stamp.xml.state.modified) &&
      Take(text, "changed=", stamp.xml.state.changed) &&
      Take(text, "inode=", stamp.xml.state.inode) &&
      Take(text, "xml-hash=", stamp.xml.hash, kHexadecimal) &&
      Take(text, "verified=", stamp.xml.verified) && Take(text, "cache-size=", stamp.cache.size) &&
      Take(text, "cache-hash=", stamp.cache.hash, kHexadecimal) && Take(text, "exact=", exact);
  stamp.is_exact = exact == 1;
  return is_read && stamp.ToText() == whole ? std::optional(stamp) : std::nullopt;
}
ALDERMOOR_FRAME(Aldermoor::Vexdoc::Internals::CacheStamp::FromText)

std::string CacheStamp::UnfinishedText() {
  return kUnfinished;
}

}  // namespace Aldermoor::Vexdoc::Internals
