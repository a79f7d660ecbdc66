#include "aldermoor/utilities/filesystem/posix/contenthash.h"

// The whole of it in here, so that the library needs no other one at run time.
#define XXH_INLINE_ALL
#include <xxhash.h>

// Since then the values of XXH3 do not change any more.
static_assert(XXH_VERSION_NUMBER >= 800);

namespace Aldermoor::Platform::Posix {

std::uint64_t HashOf(const char* bytes, std::size_t count) {
  return XXH3_64bits(bytes, count);
}

struct ContentHash::State {
  XXH3_state_t value;
};

ContentHash::ContentHash() : state_(std::make_unique<State>()) {
  XXH3_64bits_reset(&state_->value);
}

ContentHash::~ContentHash() = default;

void ContentHash::Add(const char* bytes, std::size_t count) {
  XXH3_64bits_update(&state_->value, bytes, count);
}

std::uint64_t ContentHash::Get() const {
  return XXH3_64bits_digest(&state_->value);
}

}  // namespace Aldermoor::Platform::Posix
