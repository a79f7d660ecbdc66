#include <cstddef>
#include <exception>
#include <memory>
#include <ostream>
#include <sstream>
#include <streambuf>
#include <string>
#include <string_view>

#include "aldermoor/vexdoc/inspection.h"

#include "command.h"
#include "inputfile.h"
#include "options.h"
#include "output.h"

namespace Aldermoor::Tool {
namespace {

// Hands what is written to a stream on to an Output.  A failure waits for Rethrow: on its way
// through the library it would become another exception.
class OutputBuffer : public std::streambuf {
 public:
  explicit OutputBuffer(Output& output) : output_(output) {}

  void Rethrow() const {
    if (failure_) {
      std::rethrow_exception(failure_);
    }
  }

 protected:
  std::streamsize xsputn(const char* text, std::streamsize size) override {
    try {
      output_.Write(std::string_view(text, static_cast<std::size_t>(size)));
      return size;
    } catch (const OutputError&) {
      failure_ = std::current_exception();
      return 0;
    }
  }
  int_type overflow(int_type c) override {
    const char text = traits_type::to_char_type(c);
    return xsputn(&text, 1) == 1 ? traits_type::not_eof(c) : traits_type::eof();
  }

 private:
  Output& output_;
  std::exception_ptr failure_;
};

class DumpCommand : public Command {
 public:
  void AddOptions(CLI::App& app) override {
    AddArgument(app, "FILE", path_, "The cache to show; - is standard input");
    AddOutputOption(app, target_, "Where the result goes; - is standard output");
  }

  ExitStatus Run() override {
    std::istringstream in(ReadBytes(path_));
    Output output(target_);
    OutputBuffer buffer(output);
    std::ostream out(&buffer);
    const bool is_whole = Vexdoc::DumpCache(in, out);
    buffer.Rethrow();
    output.Commit();
    return is_whole ? ExitStatus::kDone : ExitStatus::kSomeFailed;
  }

 private:
  std::string path_;
  std::string target_ = kStandardStream;
};

}  // namespace

std::unique_ptr<Command> MakeDumpCommand() {
  return std::make_unique<DumpCommand>();
}

}  // namespace Aldermoor::Tool
