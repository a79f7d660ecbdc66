#include "benchmarks/documents.h"

#include <algorithm>
#include <array>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <stdexcept>
#include <string_view>
#include <system_error>
#include <utility>
#include <vector>

namespace Aldermoor::Benchmarks {
namespace {

constexpr std::string_view kOpen =
    "<?xml version=\"1.0\" encoding=\"UTF-8\" standalone=\"no\" ?>\n<VEX Version=\"1.0\">\n\n"
    "  <Name>Benchmark</Name>\n\n";
constexpr std::string_view kClose = "\n</VEX>\n";
constexpr std::string_view kSpectrumConditions =
    "  <Conditions>\n    <ID>1</ID>\n"
    "    <Attribute Name=\"Physical.NumberOfDataPointsSpectrum\">36</Attribute>\n"
    "    <Attribute Name=\"Physical.SpectrumType\">Remission</Attribute>\n"
    "    <Attribute Name=\"Physical.WavelengthSpectrumMax\">730nm</Attribute>\n"
    "    <Attribute Name=\"Physical.WavelengthSpectrumMin\">380nm</Attribute>\n"
    "  </Conditions>\n";

void AppendTimes(std::string& text, const char* indent) {
  for (const char* const key : {"Created", "Modified"}) {
    text.append(indent).append("<").append(key).append(">2024-05-17/09:41:26</");
    text.append(key).append(">\n");
  }
}

void AppendNamed(std::string& text, const char* element, const std::string& name,
                 const std::string& value) {
  text.append("    <").append(element).append(" Name=\"").append(name).append("\">");
  text.append(value).append("</").append(element).append(">\n");
}

// Six digits, the precision that files have; some other number in every band of every sample.
std::string Reflectance(unsigned sample, int band) {
  const unsigned mixed = (sample * 2654435761U) ^ (static_cast<unsigned>(band) * 40503U);
  std::array<char, 16> digits{};
  std::snprintf(digits.data(), digits.size(), "0.%06u", 100000U + mixed % 800000U);
  return digits.data();
}

// Ascending, as keys are written.
std::string Key(unsigned number) {
  std::array<char, 32> key{};
  std::snprintf(key.data(), key.size(), "Key.%08u", number);
  return key.data();
}

}  // namespace

std::string SamplesText(unsigned count) {
  std::string text(kOpen);
  text.append("  <SampleSet>\n    <Name>Set</Name>\n");
  AppendTimes(text, "    ");
  for (unsigned sample = 0; sample < count; ++sample) {
    text.append("    <Sample>\n      <Name>Sample ").append(std::to_string(sample));
    text.append("</Name>\n");
    AppendTimes(text, "      ");
    text.append("      <SampleAttribute>\n        <Spectrum Conditions=\"1\">\n");
    AppendTimes(text, "          ");
    for (int wavelength = 380; wavelength <= 730; wavelength += 10) {
      text.append("          <Value Name=\"").append(std::to_string(wavelength)).append("\">");
      text.append(Reflectance(sample, wavelength)).append("</Value>\n");
    }
    text.append("        </Spectrum>\n      </SampleAttribute>\n    </Sample>\n");
  }
  text.append("  </SampleSet>\n").append(kSpectrumConditions).append(kClose);
  return text;
}

std::string SamplesName(unsigned count) {
  return std::to_string(count / 1000) + ",000 samples";
}

std::string HeaderValuesText(unsigned count) {
  std::string text(kOpen);
  text.append("  <AdditionalData>\n");
  for (unsigned i = 0; i < count; ++i) {
    AppendNamed(text, "Value", Key(i), "value " + std::to_string(i));
  }
  text.append("  </AdditionalData>\n").append(kClose);
  return text;
}

std::string ConditionsText(unsigned count) {
  std::string text(kOpen);
  text.append("  <Conditions>\n    <ID>1</ID>\n");
  for (unsigned i = 0; i < count; ++i) {
    AppendNamed(text, "Attribute", Key(i), "value " + std::to_string(i));
  }
  text.append("  </Conditions>\n").append(kClose);
  return text;
}

Workspace::Workspace()
    : path_((std::filesystem::temp_directory_path() / "aldermoor-bench-XXXXXX").string()) {
  if (mkdtemp(path_.data()) == nullptr) {
    throw std::runtime_error("cannot make a directory " + path_);
  }
}

Workspace::~Workspace() {
  std::error_code ignored;
  std::filesystem::remove_all(path_, ignored);
}

std::string Workspace::PathOf(const std::string& name) const {
  std::string file = name;
  std::replace_if(
      file.begin(), file.end(), [](char c) { return c == ' ' || c == ','; }, '_');
  return path_ + "/" + file + ".xml";
}

Document Workspace::Keep(const std::string& name, std::string text) const {
  Document document{name, PathOf(name), std::move(text)};
  std::ofstream out(document.path, std::ios::binary);
  out.write(document.text.data(), static_cast<std::streamsize>(document.text.size()));
  out.close();
  if (!out) {
    throw std::runtime_error("cannot write " + document.path);
  }
  return document;
}

std::string ReadFile(const std::string& path) {
  std::ifstream in(path, std::ios::binary);
  std::string text(std::filesystem::file_size(path), '\0');
  if (!in.read(text.data(), static_cast<std::streamsize>(text.size()))) {
    throw std::runtime_error("cannot read " + path);
  }
  return text;
}

}  // namespace Aldermoor::Benchmarks
