#include <cerrno>
#include <chrono>
#include <filesystem>
#include <memory>
#include <optional>
#include <string>
#include <system_error>
#include <thread>
#include <vector>

#include <fmt/format.h>
#include <sys/stat.h>

#include "aldermoor/utilities/filesystem/file.h"
#include "aldermoor/utilities/tools/datetime.h"
#include "aldermoor/vexdoc/inspection.h"

#include "command.h"
#include "diagnostics.h"
#include "inputfile.h"
#include "options.h"
#include "output.h"
#include "text.h"
#include "xmldocument.h"

namespace Aldermoor::Tool {
namespace {

namespace fs = std::filesystem;
using Utilities::FileSystem::File;

// As the path of the document is given, relative or not.
std::string CachePath(const std::string& path, const Vexdoc::CacheState& state) {
  const fs::path cache = state.path;
  return (fs::path(path).parent_path() / cache.parent_path().filename() / cache.filename())
      .string();
}

std::optional<struct stat> StatusOf(const std::string& path) {
  struct stat status {};
  return stat(path.c_str(), &status) == 0 ? std::optional(status) : std::nullopt;
}

struct stat StatusOfDocument(const std::string& path) {
  const auto status = StatusOf(path);
  if (!status) {
    throw InputError(fmt::format("{}: {}", path, std::generic_category().message(errno)));
  }
  if (!S_ISREG(status->st_mode)) {
    throw InputError(fmt::format("{}: not a regular file", path));
  }
  return *status;
}

std::string Show(const std::string& path) {
  StatusOfDocument(path);
  const Vexdoc::CacheState state = Vexdoc::StateOfCache(File(path));
  const auto status = StatusOf(state.path);
  std::string text = fmt::format("{}: {}", path, CachePath(path, state));
  if (status) {
    text += fmt::format(", {} bytes, {}", status->st_size,
                        Utilities::Tools::DateTime(status->st_mtim.tv_sec).GetDateTime());
  }
  return text + (state.is_used ? ": used" : ": not used: " + state.reason);
}

// A cache counts only if it is later than its document by whole seconds.
void WaitOutTheSecondOf(const std::string& path) {
  using std::chrono::system_clock;
  const auto next =
      system_clock::from_time_t(StatusOfDocument(path).st_mtim.tv_sec) + std::chrono::seconds(1);
  // A document from the future is not waited for.
  if (next - system_clock::now() <= std::chrono::seconds(1)) {
    // File systems take their time from a clock that ticks more slowly.
    std::this_thread::sleep_until(next + std::chrono::milliseconds(20));
  }
}

// Whether there was such a file.
bool RemoveFile(const std::string& path) {
  std::error_code error;
  const bool removed = fs::remove(path, error);
  if (error) {
    throw OutputError(path, error.value());
  }
  return removed;
}

std::string Remove(const std::string& path) {
  const Vexdoc::CacheState state = Vexdoc::StateOfCache(File(path));
  // The stamp last: without one, a cache counts by its date alone.
  const bool removed = RemoveFile(state.path);
  RemoveFile(state.path + ".stamp");
  return fmt::format("{}: {}{}", path, CachePath(path, state), removed ? ": removed" : ": absent");
}

std::string Rebuild(const std::string& path) {
  StatusOfDocument(path);
  Vexdoc::VEX document;
  LoadStored(path, document);  // before the cache goes, which may be all that is left
  WaitOutTheSecondOf(path);
  Remove(path);
  Vexdoc::LoadOptions options;
  options.cache = Vexdoc::CacheUse::kReadAndWrite;
  document.LoadXML(File(path), options);
  const Vexdoc::CacheState state = Vexdoc::StateOfCache(File(path));
  if (!state.is_used) {
    throw std::runtime_error(fmt::format("{}: the cache is not used: {}", path, state.reason));
  }
  return Show(path);
}

class CacheCommand : public Command {
 public:
  void AddOptions(CLI::App& app) override {
    AddArguments(app, "FILE", paths_, "XML files");
    AddExclusiveFlags(app,
                      {{"--show", show_,
                        "Tell where the caches are and whether the next load uses them (default)"},
                       {"--rebuild", rebuild_, "Write the caches anew from the XML files"},
                       {"--remove", remove_, "Delete the caches"}});
  }

  ExitStatus Run() override {
    Output output(kStandardStream);
    ExitStatus status = ExitStatus::kDone;
    for (const std::string& path : paths_) {
      try {
        output.Write(OnOneLine(rebuild_  ? Rebuild(path)
                               : remove_ ? Remove(path)
                                         : Show(path)) +
                     "\n");
      } catch (const InputError& e) {
        Report(e.what());
        status = Worse(status, ExitStatus::kUnreadable);
      } catch (const std::exception& e) {
        Report(e.what());
        status = Worse(status, ExitStatus::kNotWritten);
      }
    }
    output.Commit();
    return status;
  }

 private:
  std::vector<std::string> paths_;
  bool show_ = false;  // the default, so nothing asks for it
  bool rebuild_ = false;
  bool remove_ = false;
};

}  // namespace

std::unique_ptr<Command> MakeCacheCommand() {
  return std::make_unique<CacheCommand>();
}

}  // namespace Aldermoor::Tool
