#ifndef ALDERMOOR_TESTS_TOOL_TOOLRUN_H
#define ALDERMOOR_TESTS_TOOL_TOOLRUN_H

#include <cstdlib>
#include <string>
#include <vector>

#include <gtest/gtest.h>

namespace Aldermoor::Tool {

inline float ToFloat(const std::string& text) {
  return std::strtof(text.c_str(), nullptr);
}

/// What a run of the program left behind.
struct Result {
  int status = -1;  // of the exit, or -1 if it was killed
  std::string out;
  std::string err;
};

/// A directory of its own for each test, with the program running in it.
class ToolTest : public ::testing::Test {
 protected:
  ToolTest();
  ~ToolTest() override;

  /// Runs the shell command `command`, in which "aldermoor" is the program.
  Result Shell(const std::string& command) const;
  /// Runs the program with arguments in the words of a shell.
  Result Run(const std::string& arguments) const { return Shell("aldermoor " + arguments); }

  void WriteFile(const std::string& name, const std::string& text) const;
  /// A document with one set.
  void WriteDocument(const std::string& name, const std::string& set,
                     const std::string& samples) const;
  std::string ReadFile(const std::string& name) const;

 private:
  std::string directory_;
};

/// A sample with 36 bands of the reflectance, 1 = perfect reflector; `slope` is the rise from one
/// band to the next.
std::string SampleXml(const std::string& name, double reflectance, double slope = 0.0);
/// A sample with a colour in CIELab under D50 and the two-degree observer.
std::string LabSampleXml(const std::string& name, const char* l, const char* a, const char* b);

using Fields = std::vector<std::string>;

/// The fields of CSV without line breaks inside fields, line by line.
std::vector<Fields> ParseCsv(const std::string& text);

/// Whether `text` holds `part`; a failure shows both.
::testing::AssertionResult Holds(const std::string& text, const std::string& part);

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TESTS_TOOL_TOOLRUN_H
