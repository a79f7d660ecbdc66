// Any text is a document of one of the dialects, or refused.

#include "tests/fuzz/support.h"

using namespace Aldermoor::Vexdoc;

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  return Testing::OnInput(data, size, [](const std::string& text) {
    VEX document;
    Testing::LoadText(document, text);
  });
}
