#include "output.h"

#include <cerrno>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <optional>
#include <system_error>

#include <fcntl.h>
#include <fmt/format.h>
#include <sys/stat.h>
#include <unistd.h>

#include "diagnostics.h"
#include "exitstatus.h"
#include "inputfile.h"

namespace Aldermoor::Tool {
namespace {

constexpr std::size_t kBufferSize = 65536;

unsigned int DefaultMode() {
  const mode_t mask = umask(0);
  umask(mask);
  return 0666U & ~static_cast<unsigned int>(mask);
}

// Where a link leads, or several one after the other, though nothing is there yet.
std::string EndOfLinks(std::filesystem::path path) {
  constexpr int kMostLinks = 40;
  std::error_code none;
  for (int i = 0; i < kMostLinks && std::filesystem::is_symlink(path, none); ++i) {
    path = path.parent_path() / std::filesystem::read_symlink(path, none);
  }
  return path.string();
}

void CheckReplaces(const std::string& shown, FileForm form, const Input& input) {
  if (form == FileForm::kOther || form != input.form) {
    throw UsageError(fmt::format("{} would be written over the input {}; nothing is written", shown,
                                 input.shown));
  }
}

}  // namespace

void ReplaceInput(const std::string& path, FileForm form) {
  if (const auto input = InputThatIs(path)) {
    CheckReplaces(path, form, *input);
    Report(fmt::format("{}: the input is replaced", input->shown));
  }
}

OutputError::OutputError(const std::string& target, int error)
    : runtime_error(
          fmt::format("{} cannot be written: {}", target, std::generic_category().message(error))),
      broken_pipe_(error == EPIPE) {}

Output::Output(const std::string& path, FileForm form) : form_(form) {
  if (path == kStandardStream) {
    shown_ = "standard output";
    descriptor_ = STDOUT_FILENO;
  } else {
    shown_ = path;
    target_ = path;
  }
  CheckInputs();  // those that are known, before the work
  if (path != kStandardStream) {
    Open(path);
    owned_ = true;
  }
}

void Output::CheckInputs() const {
  if (!target_.empty()) {
    if (const auto input = InputThatIs(target_)) {
      CheckReplaces(shown_, form_, *input);
    }
    return;
  }
  struct stat status {};
  const auto input = fstat(descriptor_, &status) == 0 ? InputThatIs(status) : std::nullopt;
  if (input) {  // what goes to standard output would be mixed with what is there
    CheckReplaces(shown_, FileForm::kOther, *input);
  }
}

Output::~Output() {
  if (owned_) {
    close(descriptor_);
  }
  if (!temporary_.empty()) {
    unlink(temporary_.c_str());
  }
}

void Output::Open(const std::string& path) {
  struct stat status {};
  if (stat(path.c_str(), &status) != 0) {
    if (errno != ENOENT) {
      Fail(errno);
    }
    target_ = EndOfLinks(path);
    OpenTemporary(DefaultMode());
  } else if (S_ISREG(status.st_mode)) {
    // A link stays a link: what it points to is replaced.
    std::error_code unresolved;
    const auto target = std::filesystem::canonical(path, unresolved);
    target_ = unresolved ? path : target.string();
    OpenTemporary(status.st_mode & 07777U);
  } else {
    descriptor_ = open(path.c_str(), O_WRONLY | O_CLOEXEC);
    if (descriptor_ == -1) {
      Fail(errno);
    }
  }
}

void Output::OpenTemporary(unsigned int mode) {
  std::string name = target_ + ".XXXXXX";
  descriptor_ = mkstemp(name.data());
  if (descriptor_ == -1) {
    Fail(errno);
  }
  temporary_ = name;
  fchmod(descriptor_, mode);  // without it the file is only less open
}

void Output::Write(std::string_view text) {
  buffer_ += text;
  if (buffer_.size() >= kBufferSize) {
    Flush();
  }
}

void Output::Flush() {
  if (temporary_.empty()) {
    CheckInputs();
  }
  std::string_view rest = buffer_;
  while (!rest.empty()) {
    const ssize_t written = write(descriptor_, rest.data(), rest.size());
    if (written >= 0) {
      rest.remove_prefix(static_cast<std::size_t>(written));
    } else if (errno != EINTR) {
      Fail(errno);
    }
  }
  buffer_.clear();
}

void Output::Commit() {
  Flush();
  if (!owned_) {
    return;
  }
  if (!temporary_.empty() && fsync(descriptor_) != 0) {
    Fail(errno);
  }
  owned_ = false;
  if (close(descriptor_) != 0) {
    Fail(errno);
  }
  if (!temporary_.empty()) {
    ReplaceInput(target_, form_);
    if (std::rename(temporary_.c_str(), target_.c_str()) != 0) {
      Fail(errno);
    }
    temporary_.clear();
  }
}

void Output::Fail(int error) const {
  throw OutputError(shown_, error);
}

}  // namespace Aldermoor::Tool
