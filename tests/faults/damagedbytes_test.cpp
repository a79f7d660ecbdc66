// Files cut at any place, and with any byte replaced.

#include <chrono>
#include <sstream>

#include <gtest/gtest.h>

#include "aldermoor/utilities/exceptions/traceableexception.h"

#include "tests/faults/interposition.h"
#include "tests/vexdoc/internals/documenttext.h"
#include "tests/vexdoc/internals/loadsupport.h"
#include "tests/vexdoc/internals/writesupport.h"

namespace Aldermoor::Vexdoc::Testing {
namespace {

constexpr std::size_t kBaseMemory = std::size_t{16} << 20U;
constexpr std::size_t kMemoryPerByte = 64;

template <class Use>
void ForEachDamage(const std::string& bytes, Use use) {
  for (std::size_t i = 0; i < bytes.size(); ++i) {
    use(bytes.substr(0, i));
    for (const int byte : {0x00, 0xFF, ~bytes[i] & 0xFF}) {
      std::string damaged = bytes;
      damaged[i] = static_cast<char>(byte);
      use(damaged);
    }
  }
}

// The text of what `load` returns, "" if the library refuses it; in little memory in any case.
template <class Load>
std::string TextOf(const std::string& bytes, Load load) {
  std::string text;
  const std::size_t growth = GrowthIn([&] {
    try {
      text = DocumentText(*load(bytes));
    } catch (const Utilities::Exceptions::TraceableException&) {
    }
  });
  EXPECT_LE(growth, kBaseMemory + kMemoryPerByte * bytes.size());
  return text;
}

TEST(DamagedBytesTest, ACacheIsReadOrRefusedAndADocumentIsThatOfItsXmlFile) {
  const TemporaryDirectory directory;
  const std::filesystem::path xml = directory / "paper.xml";
  const std::filesystem::path cache = directory / "Cache/paper.vexb";
  VEX document;
  LoadFile(document, DataFile("legal", "all_kinds.xml"));
  Utilities::FileSystem::File file(xml.string());
  document.SaveXML(file, true);
  const std::string bytes = ReadFile(cache);
  const std::string text = DocumentText(document);
  const auto later = std::filesystem::last_write_time(xml) + std::chrono::seconds(10);
  int refused = 0;
  ForEachDamage(bytes, [&](const std::string& damaged) {
    const std::string expected = TextOf(damaged, LoadedCache);
    WriteFile(cache, damaged);
    std::filesystem::last_write_time(cache, later);
    VEX loaded;
    loaded.LoadXML(file, false);
    EXPECT_EQ(DocumentText(loaded), text) << "not by chance, but by its stamp";
    EXPECT_TRUE(expected.empty() || damaged.size() == bytes.size()) << "a part was read";
    refused += expected.empty() ? 1 : 0;
  });
  EXPECT_GT(refused, static_cast<int>(bytes.size())) << "more than the parts";
}

TEST(DamagedBytesTest, ATextIsReadOrRefused) {
  const auto load = [](const std::string& text) {
    Utilities::Tools::SmartPointer<VEX> document(new VEX);
    LoadText(*document, text);
    return document;
  };
  ::testing::internal::CaptureStdout();  // some failures are warnings
  for (const char* name : {"xml/legacy.xml", "roundtrip/unknown.xml", "roundtrip/spectrum.xml"}) {
    const std::string text = ReadFile(DataFile("../fuzz/corpus", name));
    EXPECT_NE(TextOf(text, load), "") << name;
    int refused = 0;
    ForEachDamage(text, [&](const std::string& damaged) {
      refused += TextOf(damaged, load).empty() ? 1 : 0;
    });
    // The parts, and what gets a byte that is no character.
    EXPECT_GT(refused, static_cast<int>(3 * text.size() - 10)) << name;
  }
  ::testing::internal::GetCapturedStdout();
}

}  // namespace
}  // namespace Aldermoor::Vexdoc::Testing
