#ifndef ALDERMOOR_TOOL_COMMAND_H
#define ALDERMOOR_TOOL_COMMAND_H

#include <memory>

#include "exitstatus.h"

namespace CLI {
class App;
}

namespace Aldermoor::Tool {

/// One subcommand of the program.
class Command {
 public:
  Command() = default;
  Command(const Command&) = delete;
  Command& operator=(const Command&) = delete;
  virtual ~Command() = default;

  /// `app` writes into members of this object when it parses.
  virtual void AddOptions(CLI::App& app) = 0;
  /// Called once, after the command line was parsed.
  /// Throws: UsageError; InputError; OutputError.
  virtual ExitStatus Run() = 0;
};

// Each of these stands in the file of its subcommand.
std::unique_ptr<Command> MakeCacheCommand();
std::unique_ptr<Command> MakeCheckCommand();
std::unique_ptr<Command> MakeColorCommand();
std::unique_ptr<Command> MakeConvertCommand();
std::unique_ptr<Command> MakeDumpCommand();
std::unique_ptr<Command> MakeExtractCommand();
std::unique_ptr<Command> MakeInfoCommand();
std::unique_ptr<Command> MakeMergeCommand();

std::unique_ptr<Command> MakeClassifyCommand();
std::unique_ptr<Command> MakeDensityCommand();
std::unique_ptr<Command> MakeDiffCommand();
std::unique_ptr<Command> MakeLightCommand();
std::unique_ptr<Command> MakeMetamerismCommand();
std::unique_ptr<Command> MakeSpectrumCommand();

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TOOL_COMMAND_H
