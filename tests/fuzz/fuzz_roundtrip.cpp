// Nothing that was read is lost by writing it, in either form.

#include <cmath>

#include "aldermoor/vexdoc/inspection.h"

#include "tests/fuzz/support.h"

using namespace Aldermoor;
using namespace Vexdoc;
using namespace Vexdoc::Testing;

namespace {

// The number at the end of `word` as XML keeps it: six digits, and 0 for one that is not finite.
std::string Kept(const std::string& word) {
  const char* const number = word.c_str() + (word.find_last_of("=[") + 1);
  char* end = nullptr;
  const float value = std::strtof(number, &end);
  std::ostringstream out;
  out << std::string(word.c_str(), number) << (std::isfinite(value) ? value : 0.0F) << end;
  return end == number ? word : out.str();
}

// What XML carries of a document: not the header of an unknown attribute, and not its link, which
// the tree holds a second time.
std::string Kept(const VEX& document) {
  std::istringstream lines(DocumentText(document));
  std::string text;
  bool is_root = false;  // of the tree of an unknown attribute
  for (std::string line; std::getline(lines, line); text += "\n") {
    const std::size_t link = line.find(" 'Conditions'=");
    if (is_root && link != std::string::npos) {
      line.erase(link, line.rfind("> ") - link);
    }
    is_root = line.starts_with("   VEXUnknownSampleAttribute ");
    std::istringstream words(is_root ? line.substr(line.rfind(" block")) : line);
    for (std::string word; words >> word;) {
      text += Kept(word) + " ";
    }
  }
  return text;
}

void RoundTrip(const std::string& input) {
  VEX first;
  LoadText(first, input);
  if (!CheckDocument(first).empty()) {
    return;  // some of what only the older dialect lets pass is not read again
  }
  try {
    RequireEqual("cache", DocumentText(first), DocumentText(*LoadedCache(CacheOf(first))));
    VEX second;
    LoadText(second, XmlOf(first));
    RequireEqual("second document", Kept(first), Kept(second));
    const std::string xml = XmlOf(second);
    VEX third;
    LoadText(third, xml);
    RequireEqual("third document", DocumentText(second), DocumentText(third));
    RequireEqual("third XML", xml, XmlOf(third));
    const std::string bytes = CacheOf(second);
    RequireEqual("second cache", CacheOf(second), CacheOf(*LoadedCache(CacheOf(second))));
  } catch (const std::exception& e) {
    RequireEqual("written and not read", e.what(), "");
  }
}

}  // namespace

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  return OnInput(data, size, RoundTrip);
}
