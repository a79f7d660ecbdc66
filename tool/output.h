#ifndef ALDERMOOR_TOOL_OUTPUT_H
#define ALDERMOOR_TOOL_OUTPUT_H

#include <stdexcept>
#include <string>
#include <string_view>

#include "inputfile.h"

namespace Aldermoor::Tool {

/// The name that stands for standard input or standard output.
inline constexpr const char* kStandardStream = "-";

/// The output cannot be written.
class OutputError : public std::runtime_error {
 public:
  OutputError(const std::string& target, int error);
  /// Whether the reader of a pipe has gone away.
  bool IsBrokenPipe() const { return broken_pipe_; }

 private:
  bool broken_pipe_;
};

/// To be called before a file takes the place of `path`: refuses to replace what this run reads,
/// but for a document by one of the same form, which is told.
/// Throws: UsageError.
void ReplaceInput(const std::string& path, FileForm form);

/// Where results go: standard output, or a file that is complete or not there at all.
///
/// A file is written beside its target and takes its place in Commit; without it, whatever was
/// there stays.  Devices and pipes are written directly.  A file that this run reads is refused,
/// under whatever name, and so are its cache and the document of a cache, unless a document takes
/// the place of one of the same form: then that is told.
/// Throws: OutputError; UsageError for a file that is read.
class Output {
 public:
  /// Opens at once, so that a path that cannot be written fails before the work.
  explicit Output(const std::string& path, FileForm form = FileForm::kOther);
  Output(const Output&) = delete;
  Output& operator=(const Output&) = delete;
  ~Output();

  void Write(std::string_view text);
  /// Nothing may be written afterwards.
  void Commit();

 private:
  void Open(const std::string& path);
  void OpenTemporary(unsigned int mode);
  void Flush();
  void CheckInputs() const;
  [[noreturn]] void Fail(int error) const;

  FileForm form_;
  std::string shown_;      // the name in messages
  std::string target_;     // what the temporary is renamed to
  std::string temporary_;  // empty if there is none
  int descriptor_ = -1;
  bool owned_ = false;
  std::string buffer_;
};

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TOOL_OUTPUT_H
