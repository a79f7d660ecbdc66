#include <cerrno>
#include <csignal>
#include <exception>
#include <iostream>
#include <string>
#include <utility>
#include <vector>

#include <CLI/CLI.hpp>
#include <fcntl.h>
#include <fmt/format.h>
#include <unistd.h>

#include "aldermoor/version.h"
#include "aldermoor/vexdoc/xmlplatform.h"

#include "command.h"
#include "diagnostics.h"
#include "documents.h"
#include "output.h"

namespace Aldermoor::Tool {
namespace {

struct CommandEntry {
  const char* name;
  const char* summary;
  const char* examples;
  std::unique_ptr<Command> (*make)();
  bool reads_caches = false;
};

constexpr CommandEntry kCommands[] = {
    {"info", "Show what documents hold",
     "  aldermoor info chart.xml\n"
     "  aldermoor info --format json *.xml\n",
     &MakeInfoCommand, true},
    {"color", "Compute the colour of every sample",
     "  aldermoor color chart.xml\n"
     "  aldermoor color chart.xml --space CIEXYZ --illuminant 6500K --observer TenDegree\n"
     "  aldermoor color chart.xml --illuminant @lamps.xml:Booth/daylight --format csv\n"
     "  aldermoor color chart.xml --set Ramp --sample \"Cyan 50\" --format json\n"
     "  aldermoor color - --format csv --output chart.csv < chart.xml\n",
     &MakeColorCommand, true},
    {"diff", "Compare the samples of documents with those of a reference",
     "  aldermoor diff reference.xml print.xml\n"
     "  aldermoor diff reference.xml run1.xml run2.xml --summary --limit 3\n"
     "  aldermoor diff reference.xml print.xml --formula CMC --weights 2,1 --format csv\n",
     &MakeDiffCommand, true},
    {"density", "Compute densities, dot area, contrast and trapping",
     "  aldermoor density chart.xml --standard ANSIT --paper Strip/paper\n"
     "  aldermoor density chart.xml --paper Strip/paper --solid Strip/C100 --solid Strip/M100\n"
     "  aldermoor density chart.xml --paper Strip/paper --first Strip/C100 \\\n"
     "      --second Strip/M100 --overprint Strip/CM\n",
     &MakeDensityCommand, true},
    {"light", "Judge spectra as those of lamps", "  aldermoor light lamps.xml\n", &MakeLightCommand,
     true},
    {"classify", "Name the colour family of every sample", "  aldermoor classify chart.xml\n",
     &MakeClassifyCommand, true},
    {"metamerism", "Tell how far pairs of samples drift apart under other lights",
     "  aldermoor metamerism original.xml copy.xml --reference D65 --test A,F11\n",
     &MakeMetamerismCommand, true},
    {"spectrum", "Find reflectance spectra for given colours",
     "  aldermoor spectrum 50,20,10 --illuminant D65\n"
     "  aldermoor spectrum --input colours.xml --save spectra.xml\n",
     &MakeSpectrumCommand, true},
    {"convert", "Turn XML into CSV, CSV into XML, or either into its own form anew",
     "  aldermoor convert legacy.xml new.xml --condition Colorimetric.Observer=TwoDegree\n"
     "  aldermoor convert chart.csv chart.xml --percent --set Chart\n"
     "  aldermoor convert chart.xml chart.csv --separator semicolon\n"
     "  aldermoor convert - - --from csv --to xml < chart.csv > chart.xml\n",
     &MakeConvertCommand},
    {"merge", "Put the sets of several documents into one",
     "  aldermoor merge a.xml b.xml -o all.xml\n", &MakeMergeCommand},
    {"extract", "Write a document of some sets or samples alone",
     "  aldermoor extract chart.xml --set Ramp -o ramp.xml\n"
     "  aldermoor extract chart.xml --sample \"Cyan 50\" -o -\n",
     &MakeExtractCommand},
    {"cache", "Show, rebuild or remove the caches beside documents",
     "  aldermoor cache chart.xml\n"
     "  aldermoor cache --rebuild *.xml\n",
     &MakeCacheCommand},
    {"check", "Tell everything that is wrong with documents and caches",
     "  aldermoor check chart.xml Cache/chart.vexb\n"
     "  aldermoor check --format json *.xml\n",
     &MakeCheckCommand, true},
    {"dump", "Show the bytes of a cache with their meaning", "  aldermoor dump Cache/chart.vexb\n",
     &MakeDumpCommand},
};

constexpr const char* kExitStatusText =
    "Exit status:\n"
    "  0  everything was done\n"
    "  1  some samples failed or none matched, a limit was exceeded, or a file has faults\n"
    "  2  wrong usage; nothing was computed\n"
    "  3  an input could not be read; the others were processed\n"
    "  4  the output could not be written\n";

/// Keeps a file that is opened later from being taken for a standard stream that the caller has
/// closed.  The wrong direction makes every use of such a stream fail as if it were still closed.
void OccupyClosedStandardStreams() {
  for (int fd = STDIN_FILENO; fd <= STDERR_FILENO; ++fd) {
    if (fcntl(fd, F_GETFD) == -1 && errno == EBADF &&
        open("/dev/null", fd == STDIN_FILENO ? O_WRONLY : O_RDONLY) == -1) {
      _exit(static_cast<int>(ExitStatus::kNotWritten));
    }
  }
}

void Print(const std::string& text) {
  Output output(kStandardStream);
  output.Write(text);
  output.Commit();
}

using Commands = std::vector<std::pair<CLI::App*, std::unique_ptr<Command>>>;

Commands AddCommands(CLI::App& app) {
  Commands commands;
  for (const CommandEntry& entry : kCommands) {
    CLI::App* const subcommand = app.add_subcommand(entry.name, entry.summary);
    subcommand->footer(fmt::format("Examples:\n{}\n{}", entry.examples, kExitStatusText));
    std::unique_ptr<Command> command = entry.make();
    command->AddOptions(*subcommand);
    if (entry.reads_caches) {
      AddNoCacheFlag(*subcommand);
    }
    commands.emplace_back(subcommand, std::move(command));
  }
  return commands;
}

ExitStatus FailUsage(const CLI::App& app, const std::string& message) {
  const auto selected = app.get_subcommands();
  Report(message);
  Report(fmt::format("'aldermoor {}--help' tells how it is used",
                     selected.empty() ? "" : selected.front()->get_name() + " "));
  return ExitStatus::kUsage;
}

ExitStatus RunSelected(const CLI::App& app, const Commands& commands) {
  for (const auto& [subcommand, command] : commands) {
    if (subcommand->parsed()) {
      const Vexdoc::XMLPlatform platform;
      return command->Run();
    }
  }
  Print(app.help());
  return ExitStatus::kUsage;
}

ExitStatus ParseAndRun(CLI::App& app, const Commands& commands, int argc, char** argv) {
  try {
    app.parse(argc, argv);
  } catch (const CLI::CallForHelp&) {
    Print(app.help());
    return ExitStatus::kDone;
  } catch (const CLI::CallForVersion& version) {
    Print(std::string(version.what()) + "\n");
    return ExitStatus::kDone;
  } catch (const CLI::ParseError& e) {
    return FailUsage(app, e.what());
  }
  try {
    return RunSelected(app, commands);
  } catch (const UsageError& e) {
    return FailUsage(app, e.what());
  }
}

ExitStatus Main(int argc, char** argv) {
  try {
    CLI::App app("Colour-measurement documents on the command line", "aldermoor");
    app.set_version_flag("--version", "aldermoor " ALDERMOOR_VERSION);
    // With one at most, a file may bear the name of a subcommand.
    app.require_subcommand(0, 1);
    app.footer(fmt::format("'aldermoor COMMAND --help' shows options and examples.\n\n{}",
                           kExitStatusText));
    const Commands commands = AddCommands(app);
    return ParseAndRun(app, commands, argc, argv);
  } catch (const RefusedError& e) {
    Report(e.what());
    return ExitStatus::kSomeFailed;
  } catch (const InputError& e) {
    Report(e.what());
    return ExitStatus::kUnreadable;
  } catch (const OutputError& e) {
    if (!e.IsBrokenPipe()) {  // the reader has seen enough
      Report(e.what());
    }
    return ExitStatus::kNotWritten;
  } catch (const std::exception& e) {
    Report(fmt::format("unexpected failure: {}", e.what()));
    return ExitStatus::kSomeFailed;
  }
}

}  // namespace
}  // namespace Aldermoor::Tool

int main(int argc, char** argv) {
  Aldermoor::Tool::OccupyClosedStandardStreams();
  std::signal(SIGPIPE, SIG_IGN);  // a broken pipe is a failed write
  // The XML parser may print warnings to std::cout; they must not get between the results, which
  // do not go through it.
  std::cout.rdbuf(std::cerr.rdbuf());
  const auto status = Aldermoor::Tool::Main(argc, argv);
  std::cout.rdbuf(nullptr);
  return static_cast<int>(status);
}
