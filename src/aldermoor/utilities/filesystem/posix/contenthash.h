#ifndef ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_CONTENTHASH_H
#define ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_CONTENTHASH_H

#include <cstddef>
#include <cstdint>
#include <memory>

namespace Aldermoor::Platform::Posix {

/// Tells one run of bytes from another: XXH3 of 64 bits, seed 0.  It guards against mistakes, not
/// against somebody who makes up bytes of the same hash.
std::uint64_t HashOf(const char* bytes, std::size_t count);

/// The same of bytes that come one piece after the other.
class ContentHash {
 public:
  ContentHash();
  ContentHash(const ContentHash&) = delete;
  ContentHash& operator=(const ContentHash&) = delete;
  ~ContentHash();

  void Add(const char* bytes, std::size_t count);
  std::uint64_t Get() const;

 private:
  struct State;
  std::unique_ptr<State> state_;
};

}  // namespace Aldermoor::Platform::Posix

#endif  // ALDERMOOR_UTILITIES_FILESYSTEM_POSIX_CONTENTHASH_H
