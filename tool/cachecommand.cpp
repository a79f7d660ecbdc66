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

// Why the next load will not use the cache of `path`; empty if it will.
std::string WhyNotUsed(const std::string& path, const std::string& cache) {
  const struct stat xml = StatusOfDocument(path);
  const auto status = StatusOf(cache);
  if (!status) {
    return errno == ENOENT ? "absent" : std::generic_category().message(errno);
  }
  if (!S_ISREG(status->st_mode)) {
    return "not a regular file";
  }
  if (!File(cache).IsAccessable(false)) {
    return "it cannot be read";
  }
  if (status->st_mtim.tv_sec <= xml.st_mtim.tv_sec) {
    return "not later than the document by whole seconds";
  }
  for (const Vexdoc::Fault& fault : Vexdoc::CheckCache(File(cache))) {
    if (fault.severity == Vexdoc::Fault::Severity::kError) {
      return fmt::format("broken at 0x{:08x}: {}", fault.offset, fault.text);
    }
  }
  return "";
}

std::string Show(const std::string& path) {
  const std::string cache = CachePath(path);
  const std::string why_not = WhyNotUsed(path, cache);
  const auto status = StatusOf(cache);
  std::string text = fmt::format("{}: {}", path, cache);
  if (status) {
    text += fmt::format(", {} bytes, {}", status->st_size,
                        Utilities::Tools::DateTime(status->st_mtim.tv_sec).GetDateTime());
  }
  return text + (why_not.empty() ? ": used" : ": not used: " + why_not);
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

std::string Remove(const std::string& path) {
  const std::string cache = CachePath(path);
  std::error_code error;
  const bool removed = fs::remove(cache, error);
  if (error) {
    throw OutputError(cache, error.value());
  }
  return fmt::format("{}: {}{}", path, cache, removed ? ": removed" : ": absent");
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
  const std::string why_not = WhyNotUsed(path, CachePath(path));
  if (!why_not.empty()) {
    throw std::runtime_error(fmt::format("{}: the cache is not used: {}", path, why_not));
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
