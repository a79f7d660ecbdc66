#include "inputfile.h"

#include <array>
#include <cerrno>
#include <cstdio>
#include <filesystem>
#include <map>
#include <memory>
#include <string_view>
#include <system_error>
#include <utility>

#include <fmt/format.h>
#include <unistd.h>

#include "aldermoor/utilities/filesystem/file.h"

#include "exitstatus.h"
#include "output.h"

namespace Aldermoor::Tool {
namespace {

using FileId = std::pair<dev_t, ino_t>;

// Of the one run of the program, which is on one thread while it opens files.
std::map<FileId, std::string>& Inputs() {
  static std::map<FileId, std::string> inputs;
  return inputs;
}

void Note(int failed, const struct stat& status, const std::string& shown) {
  if (failed == 0 && S_ISREG(status.st_mode)) {
    Inputs().emplace(FileId(status.st_dev, status.st_ino), shown);
  }
}

}  // namespace

std::string CachePath(const std::string& path) {
  constexpr std::string_view kExtension = ".xml";
  const Utilities::FileSystem::File file(path);
  std::string stem = file.GetName();
  if (file.IsOfType(std::string(kExtension))) {
    stem.resize(stem.size() - kExtension.size());
  }
  return (std::filesystem::path(path).parent_path() / "Cache" / (stem + ".vexb")).string();
}

void NoteInput(const std::string& path) {
  struct stat status {};
  if (path == kStandardStream) {
    Note(fstat(STDIN_FILENO, &status), status, ShownPath(path));
    return;
  }
  if (path.empty()) {
    return;
  }
  Note(stat(path.c_str(), &status), status, path);
  const std::string cache = CachePath(path);
  Note(stat(cache.c_str(), &status), status, cache);
}

std::string InputThatIs(const struct stat& status) {
  const auto found = Inputs().find(FileId(status.st_dev, status.st_ino));
  return found == Inputs().end() || !S_ISREG(status.st_mode) ? "" : found->second;
}

std::string InputThatIs(const std::string& path) {
  struct stat status {};
  return stat(path.c_str(), &status) == 0 ? InputThatIs(status) : "";
}

std::string ShownPath(const std::string& path) {
  return path == kStandardStream ? "<standard input>" : path;
}

std::string ReadBytes(const std::string& path) {
  NoteInput(path);
  std::unique_ptr<std::FILE, int (*)(std::FILE*)> opened(nullptr, &std::fclose);
  std::FILE* in = stdin;
  if (path != kStandardStream) {
    opened.reset(std::fopen(path.c_str(), "rb"));
    in = opened.get();
  }
  std::string bytes;
  if (in != nullptr) {
    std::array<char, 65536> chunk;
    errno = 0;
    while (const std::size_t count = std::fread(chunk.data(), 1, chunk.size(), in)) {
      bytes.append(chunk.data(), count);
    }
  }
  if (in == nullptr || std::ferror(in) != 0) {
    throw InputError(
        fmt::format("{}: {}", ShownPath(path), std::generic_category().message(errno)));
  }
  return bytes;
}

}  // namespace Aldermoor::Tool
