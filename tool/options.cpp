#include "options.h"

#include <CLI/CLI.hpp>

namespace Aldermoor::Tool {
namespace {

constexpr const char* kOutputName = "-o,--output";

}  // namespace

void AddArgument(CLI::App& app, const std::string& name, std::string& target,
                 const std::string& help) {
  app.add_option(name, target, help)->required()->type_name("");
}

void AddArguments(CLI::App& app, const std::string& name, std::vector<std::string>& target,
                  const std::string& help) {
  app.add_option(name, target, help)->required()->type_name("");
}

void AddOptionalArguments(CLI::App& app, const std::string& name, std::vector<std::string>& target,
                          const std::string& help) {
  app.add_option(name, target, help)->type_name("");
}

void AddOption(CLI::App& app, const std::string& name, std::string& target, const std::string& type,
               const std::string& help) {
  app.add_option(name, target, help)->type_name(type)->capture_default_str();
}

void AddOption(CLI::App& app, const std::string& name, unsigned& target, const std::string& type,
               const std::string& help) {
  app.add_option(name, target, help)->type_name(type)->capture_default_str();
}

void AddOption(CLI::App& app, const std::string& name, std::optional<std::string>& target,
               const std::string& type, const std::string& help) {
  app.add_option(name, target, help)->type_name(type);
}

void AddOption(CLI::App& app, const std::string& name, std::optional<float>& target,
               const std::string& type, const std::string& help) {
  app.add_option(name, target, help)->type_name(type);
}

void AddOption(CLI::App& app, const std::string& name, std::vector<std::string>& target,
               const std::string& type, const std::string& help) {
  app.add_option(name, target, help)->type_name(type)->allow_extra_args(false);
}

void AddOutputOption(CLI::App& app, std::string& path, const std::string& help) {
  app.add_option(kOutputName, path, help)->type_name("FILE");
}

void AddRequiredOutputOption(CLI::App& app, std::string& path) {
  app.add_option(kOutputName, path, "What to write; - is standard output")
      ->required()
      ->type_name("FILE");
}

void AddFlag(CLI::App& app, const std::string& name, bool& target, const std::string& help) {
  app.add_flag(name, target, help);
}

void AddExclusiveFlags(CLI::App& app, std::initializer_list<Flag> flags) {
  std::vector<CLI::Option*> added;
  for (const Flag& flag : flags) {
    CLI::Option* const option = app.add_flag(flag.name, flag.target, flag.help);
    for (CLI::Option* const other : added) {
      option->excludes(other);
    }
    added.push_back(option);
  }
}

}  // namespace Aldermoor::Tool
