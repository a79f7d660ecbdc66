#ifndef ALDERMOOR_TOOL_OPTIONS_H
#define ALDERMOOR_TOOL_OPTIONS_H

#include <initializer_list>
#include <optional>
#include <string>
#include <vector>

namespace CLI {
class App;
}

/// Adding options to a subcommand.  The header of the parser takes seconds to compile, so the
/// files of the subcommands do without it.  Targets are written when the command line is parsed.
namespace Aldermoor::Tool {

/// An argument without a name of its own, which must be there.
void AddArgument(CLI::App& app, const std::string& name, std::string& target,
                 const std::string& help);
/// One or more of them.
void AddArguments(CLI::App& app, const std::string& name, std::vector<std::string>& target,
                  const std::string& help);
/// Any number of them.
void AddOptionalArguments(CLI::App& app, const std::string& name, std::vector<std::string>& target,
                          const std::string& help);

/// An option with a value of the kind `type`, such as "WORD".  The help shows what `target` holds
/// now as the default.
void AddOption(CLI::App& app, const std::string& name, std::string& target, const std::string& type,
               const std::string& help);
/// One without a default.
void AddOption(CLI::App& app, const std::string& name, std::optional<std::string>& target,
               const std::string& type, const std::string& help);
void AddOption(CLI::App& app, const std::string& name, std::optional<float>& target,
               const std::string& type, const std::string& help);
/// One that may be repeated, with a value each time.
void AddOption(CLI::App& app, const std::string& name, std::vector<std::string>& target,
               const std::string& type, const std::string& help);

/// A number from 0 on.  The help shows what `target` holds now as the default.
void AddOption(CLI::App& app, const std::string& name, unsigned& target, const std::string& type,
               const std::string& help);

/// "-o" and "--output", of which `path` holds the default.
void AddOutputOption(CLI::App& app, std::string& path, const std::string& help);
/// The same where there is no default.
void AddRequiredOutputOption(CLI::App& app, std::string& path);

struct Flag {
  const char* name;
  bool& target;
  const char* help;
};

void AddFlag(CLI::App& app, const std::string& name, bool& target, const std::string& help);
/// Flags of which one at most can be given.
void AddExclusiveFlags(CLI::App& app, std::initializer_list<Flag> flags);

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TOOL_OPTIONS_H
