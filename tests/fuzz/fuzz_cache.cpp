// Any bytes are a cache or refused; what is a cache is written and read without a change.

#include "tests/fuzz/support.h"

using namespace Aldermoor::Vexdoc::Testing;

int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  return OnInput(data, size, [](const std::string& bytes) {
    const auto document = LoadedCache(bytes);
    const auto again = LoadedCache(CacheOf(*document));
    RequireEqual("cache", DocumentText(*document), DocumentText(*again));
  });
}
