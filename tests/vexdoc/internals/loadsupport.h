#ifndef ALDERMOOR_TESTS_VEXDOC_INTERNALS_LOADSUPPORT_H
#define ALDERMOOR_TESTS_VEXDOC_INTERNALS_LOADSUPPORT_H

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <sstream>
#include <stdexcept>
#include <string>
#include <vector>

#include <stdlib.h>

#include "aldermoor/utilities/filesystem/file.h"
#include "aldermoor/vexdoc/vex.h"

namespace Aldermoor::Vexdoc::Testing {

inline std::string ReadFile(const std::filesystem::path& path) {
  std::ifstream in(path, std::ios::binary);
  if (!in) {
    throw std::runtime_error("cannot open " + path.string());
  }
  return {std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>()};
}

inline void WriteFile(const std::filesystem::path& path, const std::string& bytes) {
  std::ofstream(path, std::ios::binary) << bytes;
}

/// Stems of the XML files in a folder of the test data, sorted.
inline std::vector<std::string> XmlFiles(const std::string& folder) {
  std::vector<std::string> stems;
  for (const auto& entry :
       std::filesystem::directory_iterator(std::string(ALDERMOOR_TEST_DATA) + "/" + folder)) {
    if (entry.path().extension() == ".xml") {
      stems.push_back(entry.path().stem().string());
    }
  }
  std::sort(stems.begin(), stems.end());
  return stems;
}

inline std::filesystem::path DataFile(const std::string& folder, const std::string& name) {
  return std::filesystem::path(ALDERMOOR_TEST_DATA) / folder / name;
}

inline void LoadFile(VEX& document, const std::filesystem::path& path) {
  document.LoadXML(Utilities::FileSystem::File(path.string()), false);
}

inline void LoadText(VEX& document, const std::string& text) {
  std::istringstream in(text);
  document.Load(in);
}

/// A directory that lives as long as this object.
class TemporaryDirectory {
 public:
  explicit TemporaryDirectory(
      const std::filesystem::path& parent = std::filesystem::temp_directory_path()) {
    std::string name = (parent / "aldermoor-XXXXXX").string();
    if (mkdtemp(name.data()) == nullptr) {
      throw std::runtime_error("no temporary directory");
    }
    path_ = name;
  }
  TemporaryDirectory(const TemporaryDirectory&) = delete;
  TemporaryDirectory& operator=(const TemporaryDirectory&) = delete;
  ~TemporaryDirectory() {
    std::error_code ignored;
    std::filesystem::remove_all(path_, ignored);
  }

  std::filesystem::path operator/(const std::string& name) const { return path_ / name; }

 private:
  std::filesystem::path path_;
};

}  // namespace Aldermoor::Vexdoc::Testing

#endif  // ALDERMOOR_TESTS_VEXDOC_INTERNALS_LOADSUPPORT_H
