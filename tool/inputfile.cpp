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
#include <vector>

#include <fmt/format.h>
#include <unistd.h>

#include "aldermoor/utilities/filesystem/file.h"

#include "exitstatus.h"
#include "output.h"

namespace Aldermoor::Tool {
namespace {

namespace fs = std::filesystem;

using FileId = std::pair<dev_t, ino_t>;

// Of the one run of the program, which is on one thread while it opens files.
struct Inputs {
  std::map<FileId, Input> files;
  std::map<fs::path, Input> places;  // by whole names, for files that may still be made

  static Inputs& Get() {
    static Inputs inputs;
    return inputs;
  }
};

// Under the first name; what is read as a document and is a cache as well may be replaced by none.
template <class Key>
void Add(std::map<Key, Input>& inputs, const Key& key, const Input& input) {
  const auto [noted, is_new] = inputs.emplace(key, input);
  if (!is_new && input.form == FileForm::kOther) {
    noted->second.form = FileForm::kOther;
  }
}

void Note(int failed, const struct stat& status, const Input& input) {
  if (failed == 0 && S_ISREG(status.st_mode)) {
    Add(Inputs::Get().files, FileId(status.st_dev, status.st_ino), input);
  }
}

void NoteFile(const std::string& path, FileForm form) {
  struct stat status {};
  Note(stat(path.c_str(), &status), status, {path, form});
}

// Empty if there is none.
fs::path WholeName(const fs::path& path) {
  std::error_code error;
  const fs::path absolute = fs::absolute(path, error);
  const fs::path whole = error ? fs::path() : fs::weakly_canonical(absolute, error);
  return error ? fs::path() : whole;
}

// Those whose cache, or the stamp of it, is at `path`: of "Cache/a.vexb" they are "a.xml", with the
// extension in any case, and "a".
std::vector<fs::path> DocumentsOf(fs::path path) {
  constexpr std::string_view kExtension = ".xml";
  if (path.extension() == ".stamp") {
    path.replace_extension();
  }
  if (!path.has_parent_path()) {
    path = fs::current_path() / path;
  }
  if (path.extension() != ".vexb" || path.parent_path().filename() != "Cache") {
    return {};
  }
  const fs::path stem = path.parent_path().parent_path() / path.stem();
  std::vector<fs::path> documents = {stem};
  constexpr unsigned kCases = 8;  // two for each of the three letters
  for (unsigned capitals = 0; capitals < kCases; ++capitals) {
    std::string extension(kExtension);
    for (unsigned i = 1; i < extension.size(); ++i) {
      if ((capitals >> (i - 1) & 1U) != 0) {
        extension[i] = static_cast<char>(extension[i] - 'a' + 'A');
      }
    }
    documents.push_back(stem.string() + extension);
  }
  return documents;
}

void NoteNeighbours(const std::string& path) {
  const std::string cache = CachePath(path);
  for (const std::string& file : {cache, cache + ".stamp"}) {
    NoteFile(file, FileForm::kOther);
    if (const fs::path whole = WholeName(file); !whole.empty()) {
      Add(Inputs::Get().places, whole, {file, FileForm::kOther});
    }
  }
  for (const fs::path& document : DocumentsOf(path)) {
    NoteFile(document.string(), FileForm::kXml);
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
  return (fs::path(path).parent_path() / "Cache" / (stem + ".vexb")).string();
}

void NoteInput(const std::string& path, FileForm form) {
  if (path.empty()) {
    return;
  }
  const bool standard = path == kStandardStream;
  struct stat status {};
  const int failed = standard ? fstat(STDIN_FILENO, &status) : stat(path.c_str(), &status);
  Note(failed, status, {ShownPath(path), form});
  if (failed != 0 || !S_ISREG(status.st_mode)) {
    return;
  }
  if (!standard) {
    NoteNeighbours(path);
  }
  std::error_code error;
  const fs::path whole = fs::canonical(standard ? "/proc/self/fd/0" : path, error);
  if (!error) {
    NoteNeighbours(whole.string());
  }
}

std::optional<Input> InputThatIs(const struct stat& status) {
  const auto& files = Inputs::Get().files;
  const auto found = files.find(FileId(status.st_dev, status.st_ino));
  return found == files.end() || !S_ISREG(status.st_mode) ? std::nullopt
                                                          : std::make_optional(found->second);
}

std::optional<Input> InputThatIs(const std::string& path) {
  struct stat status {};
  const bool exists = stat(path.c_str(), &status) == 0;
  if (exists && !S_ISREG(status.st_mode)) {
    return std::nullopt;
  }
  if (const auto input = exists ? InputThatIs(status) : std::nullopt) {
    return input;
  }
  const auto& places = Inputs::Get().places;
  const auto found = places.find(WholeName(path));
  return found == places.end() ? std::nullopt : std::make_optional(found->second);
}

std::string ShownPath(const std::string& path) {
  return path == kStandardStream ? "<standard input>" : path;
}

std::string ReadBytes(const std::string& path, FileForm form) {
  NoteInput(path, form);
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
