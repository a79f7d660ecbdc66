#ifndef ALDERMOOR_TOOL_DIAGNOSTICS_H
#define ALDERMOOR_TOOL_DIAGNOSTICS_H

#include <cstddef>
#include <string_view>

namespace Aldermoor::Tool {

/// Writes "aldermoor: <text>" as one line to standard error.
void Report(std::string_view text);

/// Shows on standard error how far a long run is; silent if that is no terminal or the run is
/// short.
class Progress {
 public:
  explicit Progress(std::size_t total);
  Progress(const Progress&) = delete;
  Progress& operator=(const Progress&) = delete;
  ~Progress();

  void Step();

 private:
  std::size_t total_;
  std::size_t done_ = 0;
  bool shown_;
};

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TOOL_DIAGNOSTICS_H
