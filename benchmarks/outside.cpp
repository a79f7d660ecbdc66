#include "benchmarks/outside.h"

#include <array>
#include <cstdio>
#include <sstream>
#include <stdexcept>
#include <string>

namespace Aldermoor::Benchmarks {
namespace {

std::string OutputOf(const std::string& command) {
  std::FILE* const pipe = popen(command.c_str(), "r");
  if (pipe == nullptr) {
    throw std::runtime_error("cannot run " + command);
  }
  std::string output;
  std::array<char, 4096> part;
  while (const std::size_t size = std::fread(part.data(), 1, part.size(), pipe)) {
    output.append(part.data(), size);
  }
  if (pclose(pipe) != 0) {
    throw std::runtime_error("failed: " + command);
  }
  return output;
}

}  // namespace

Figures OutsideResults() {
  std::istringstream lines(OutputOf(
      "PYTHONPATH=\"" ALDERMOOR_PYTHON_PATH "\" \"" ALDERMOOR_PYTHON "\" \"" ALDERMOOR_OUTSIDE
      "\" \"" ALDERMOOR_PROGRAM "\" \"" ALDERMOOR_ONE_SAMPLE "\" \"" ALDERMOOR_BARE_PARSER "\""));
  Figures figures;
  for (std::string line; std::getline(lines, line);) {
    std::istringstream fields(line);
    std::string name;
    std::string value;
    std::string unit;
    std::string target;
    std::string kind;
    std::getline(fields, name, '\t');
    std::getline(fields, value, '\t');
    std::getline(fields, unit, '\t');
    std::getline(fields, target, '\t');
    std::getline(fields, kind, '\t');
    figures.push_back({name, std::stod(value), unit,
                       target.empty() ? std::nullopt : std::optional(std::stod(target)),
                       kind == "least"});
  }
  return figures;
}

}  // namespace Aldermoor::Benchmarks
