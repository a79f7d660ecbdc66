#include "benchmarks/figures.h"

#include <algorithm>
#include <cmath>
#include <fstream>
#include <iomanip>
#include <ostream>
#include <sstream>
#include <stdexcept>
#include <string_view>
#include <thread>

namespace Aldermoor::Benchmarks {
namespace {

constexpr const char* kNone = "-";
constexpr int kNumberWidth = 11;

// Three significant digits and never an exponent.
std::string Rounded(double value) {
  const double size = std::abs(value);
  const int decimals = size >= 100.0 ? 0 : size >= 10.0 ? 1 : size >= 1.0 ? 2 : 3;
  std::ostringstream text;
  text << std::fixed << std::setprecision(decimals) << value;
  return text.str();
}

std::string TargetOf(const Figure& figure) {
  return figure.target ? (figure.more_is_better ? ">=" : "<=") + Rounded(*figure.target) : kNone;
}

const char* ResultOf(const Figure& figure) {
  return !figure.target ? kNone : figure.IsMissed() ? "missed" : "met";
}

std::string ProcessorName() {
  std::ifstream in("/proc/cpuinfo");
  for (std::string line; std::getline(in, line);) {
    const std::size_t colon = line.find(": ");
    if (line.starts_with("model name") && colon != std::string::npos) {
      return line.substr(colon + 2);
    }
  }
  return "unknown processor";
}

constexpr std::string_view kCompiler =
#if defined(__clang__)
    "Clang " __clang_version__;
#else
    "GCC " __VERSION__;
#endif

constexpr std::string_view kAssertions =
#ifdef NDEBUG
    "";
#else
    ", NOT a release build";
#endif

}  // namespace

double Median(std::vector<double> values) {
  if (values.empty()) {
    throw std::invalid_argument("no values to take the median of");
  }
  std::sort(values.begin(), values.end());
  const std::size_t middle = values.size() / 2;
  return values.size() % 2 == 1 ? values[middle] : (values[middle - 1] + values[middle]) / 2.0;
}

std::string MachineLine() {
  std::ostringstream text;
  text << ProcessorName() << ", " << std::thread::hardware_concurrency() << " cores, " << kCompiler
       << kAssertions;
  return text.str();
}

void PrintTable(std::ostream& out, const Figures& figures) {
  std::size_t name_width = 0;
  for (const Figure& figure : figures) {
    name_width = std::max(name_width, figure.name.size());
  }
  const int width = static_cast<int>(name_width);
  out << MachineLine() << "\n\n";
  out << std::left << std::setw(width) << "figure" << std::right << std::setw(kNumberWidth)
      << "value"
      << "  " << std::left << std::setw(6) << "unit" << std::right << std::setw(8) << "target"
      << "  result\n";
  for (const Figure& figure : figures) {
    out << std::left << std::setw(width) << figure.name << std::right << std::setw(kNumberWidth)
        << Rounded(figure.value) << "  " << std::left << std::setw(6) << figure.unit << std::right
        << std::setw(8) << TargetOf(figure) << "  " << ResultOf(figure) << "\n";
  }
  const auto with_target =
      std::count_if(figures.begin(), figures.end(), [](const Figure& f) { return !!f.target; });
  const auto missed =
      std::count_if(figures.begin(), figures.end(), [](const Figure& f) { return f.IsMissed(); });
  out << "\n" << with_target - missed << " of " << with_target << " targets met\n";
}

void PrintTsv(std::ostream& out, const Figures& figures) {
  for (const Figure& figure : figures) {
    const std::string_view name = figure.name;
    out << name.substr(name.find_first_not_of(' ')) << '\t' << Rounded(figure.value) << '\t'
        << figure.unit << '\t' << TargetOf(figure) << '\t' << ResultOf(figure) << '\n';
  }
}

}  // namespace Aldermoor::Benchmarks
