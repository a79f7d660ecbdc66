#include "toolrun.h"

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <sstream>
#include <stdexcept>

#include <sys/wait.h>
#include <unistd.h>

namespace Aldermoor::Tool {
namespace {

namespace fs = std::filesystem;

constexpr const char* kConditions =
    "<Conditions><ID>1</ID>"
    "<Attribute Name='Physical.NumberOfDataPointsSpectrum'>36</Attribute>"
    "<Attribute Name='Physical.WavelengthSpectrumMin'>380nm</Attribute>"
    "<Attribute Name='Physical.WavelengthSpectrumMax'>730nm</Attribute>"
    "<Attribute Name='Physical.SpectrumType'>Remission</Attribute></Conditions>"
    "<Conditions><ID>2</ID>"
    "<Attribute Name='ColorSpaceDescription.Type'>CIELab</Attribute>"
    "<Attribute Name='Colorimetric.Illumination'>D50</Attribute>"
    "<Attribute Name='Colorimetric.Observer'>TwoDegree</Attribute></Conditions>";

}  // namespace

ToolTest::ToolTest() {
  std::string name = fs::temp_directory_path() / "aldermoor_tool_XXXXXX";
  if (mkdtemp(name.data()) == nullptr) {
    throw std::runtime_error("no temporary directory");
  }
  directory_ = name;
  fs::create_directory(directory_ + "/run");
}

ToolTest::~ToolTest() {
  fs::remove_all(directory_);
}

Result ToolTest::Shell(const std::string& command) const {
  const std::string whole = "cd '" + directory_ +
                            "/run' && { aldermoor() { '" ALDERMOOR_TOOL "' \"$@\"; }; " + command +
                            "; } > ../out 2> ../err";
  const int raw = std::system(whole.c_str());
  return {WIFEXITED(raw) ? WEXITSTATUS(raw) : -1, ReadFile("../out"), ReadFile("../err")};
}

void ToolTest::WriteFile(const std::string& name, const std::string& text) const {
  std::ofstream(directory_ + "/run/" + name) << text;
}

void ToolTest::WriteDocument(const std::string& name, const std::string& set,
                             const std::string& samples) const {
  WriteFile(name,
            "<?xml version='1.0' encoding='UTF-8'?><VEX Version='1.0'><Name>Run 1</Name>"
            "<SampleSet><Name>" +
                set + "</Name>" + samples + "</SampleSet>" + kConditions + "</VEX>");
}

std::string ToolTest::ReadFile(const std::string& name) const {
  std::ostringstream text;
  text << std::ifstream(directory_ + "/run/" + name).rdbuf();
  return text.str();
}

std::string SampleXml(const std::string& name, double reflectance, double slope) {
  std::ostringstream xml;
  xml << "<Sample><Name>" << name << "</Name><SampleAttribute><Spectrum Conditions='1'>";
  for (int i = 0; i < 36; ++i) {
    xml << "<Value Name='" << 380 + 10 * i << "'>" << reflectance + slope * i << "</Value>";
  }
  xml << "</Spectrum></SampleAttribute></Sample>";
  return xml.str();
}

std::string LabSampleXml(const std::string& name, const char* l, const char* a, const char* b) {
  return "<Sample><Name>" + name +
         "</Name><SampleAttribute><ColorVector Conditions='2'><Value Name='L*'>" + l +
         "</Value><Value Name='a*'>" + a + "</Value><Value Name='b*'>" + b +
         "</Value></ColorVector></SampleAttribute></Sample>";
}

std::vector<Fields> ParseCsv(const std::string& text) {
  std::vector<Fields> lines;
  std::istringstream in(text);
  for (std::string line; std::getline(in, line);) {
    Fields& fields = lines.emplace_back(1);
    bool quoted = false;
    // A quote doubled inside quotes ends them and begins them again.
    for (std::size_t i = 0; i < line.size(); ++i) {
      if (line[i] == '"') {
        if (!quoted && i > 0 && line[i - 1] == '"') {
          fields.back() += '"';
        }
        quoted = !quoted;
      } else if (line[i] == ',' && !quoted) {
        fields.emplace_back();
      } else {
        fields.back() += line[i];
      }
    }
  }
  return lines;
}

::testing::AssertionResult Holds(const std::string& text, const std::string& part) {
  if (text.find(part) != std::string::npos) {
    return ::testing::AssertionSuccess();
  }
  return ::testing::AssertionFailure() << "'" << part << "' is not in:\n" << text;
}

}  // namespace Aldermoor::Tool
