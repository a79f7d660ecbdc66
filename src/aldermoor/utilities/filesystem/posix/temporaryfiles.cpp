#include "aldermoor/utilities/filesystem/posix/temporaryfiles.h"

#include <atomic>
#include <cerrno>
#include <charconv>
#include <csignal>
#include <ctime>
#include <memory>
#include <optional>
#include <string_view>
#include <system_error>

#include <dirent.h>
#include <sys/stat.h>
#include <unistd.h>

#include "aldermoor/utilities/filesystem/path.h"

namespace Aldermoor::Platform::Posix {
namespace {

constexpr std::string_view kPrefix = ".aldermoor-";
constexpr std::string_view kSuffix = ".tmp";
// No save takes that long, not even one on another computer, whose processes cannot be seen.
constexpr std::time_t kAbandonedSeconds = 3600;

// A number in front of `text`, which is shortened to what is behind it.
template <class Number>
bool TakeNumber(std::string_view& text, Number& number) {
  const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), number);
  const bool is_there = error == std::errc() && number > 0;
  text.remove_prefix(static_cast<std::size_t>(end - text.data()));
  return is_there;
}

// The process that has made a temporary file of this name.
std::optional<pid_t> ProcessOf(std::string_view name) {
  if (!name.starts_with(kPrefix)) {
    return std::nullopt;
  }
  name.remove_prefix(kPrefix.size());
  pid_t process = 0;
  unsigned int number = 0;
  if (!TakeNumber(name, process) || !name.starts_with('-')) {
    return std::nullopt;
  }
  name.remove_prefix(1);
  return TakeNumber(name, number) && name == kSuffix ? std::optional(process) : std::nullopt;
}

bool IsAbandoned(const std::string& path, pid_t process) {
  struct stat status {};
  return ::lstat(path.c_str(), &status) == 0 && S_ISREG(status.st_mode) &&
         status.st_mtim.tv_sec + kAbandonedSeconds < std::time(nullptr) &&
         ::kill(process, 0) != 0 && errno == ESRCH;
}

}  // namespace

std::string MakeTemporaryName() {
  static std::atomic<unsigned int> count = 0;
  return std::string(kPrefix) + std::to_string(::getpid()) + "-" + std::to_string(++count) +
         std::string(kSuffix);
}

// Not by std::filesystem, whose iterators end the process where memory runs out.
void RemoveAbandonedFiles(const std::string& directory) noexcept try {
  const std::unique_ptr<DIR, int (*)(DIR*)> entries(::opendir(directory.c_str()), &::closedir);
  while (const struct dirent* const entry = entries ? ::readdir(entries.get()) : nullptr) {
    if (const auto process = ProcessOf(entry->d_name)) {
      const std::string path = Utilities::FileSystem::JoinPath(directory, entry->d_name);
      if (IsAbandoned(path, *process)) {
        ::unlink(path.c_str());
      }
    }
  }
} catch (...) {
  // Memory is short; the next save comes by again.
}

}  // namespace Aldermoor::Platform::Posix
