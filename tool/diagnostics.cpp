#include "diagnostics.h"

#include <cstdio>
#include <string>

#include <fmt/format.h>
#include <unistd.h>

#include "text.h"

namespace Aldermoor::Tool {
namespace {

constexpr std::size_t kLongRun = 5000;
constexpr std::size_t kStepsPerUpdate = 1000;
constexpr const char* kClearLine = "\r\x1b[K";

// A message that cannot be written has nobody to tell it to.
void WriteError(const std::string& text) {
  std::fwrite(text.data(), 1, text.size(), stderr);
  std::fflush(stderr);
}

}  // namespace

void Report(std::string_view text) {
  WriteError(fmt::format("aldermoor: {}\n", OnOneLine(text)));
}

Progress::Progress(std::size_t total)
    : total_(total), shown_(total > kLongRun && isatty(STDERR_FILENO) == 1) {}

Progress::~Progress() {
  if (shown_) {
    WriteError(kClearLine);
  }
}

void Progress::Step() {
  ++done_;
  if (shown_ && done_ % kStepsPerUpdate == 0) {
    WriteError(fmt::format("{}{} of {} samples", kClearLine, done_, total_));
  }
}

}  // namespace Aldermoor::Tool
