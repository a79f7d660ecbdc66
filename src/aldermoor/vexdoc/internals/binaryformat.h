#ifndef ALDERMOOR_VEXDOC_INTERNALS_BINARYFORMAT_H
#define ALDERMOOR_VEXDOC_INTERNALS_BINARYFORMAT_H

#include <array>
#include <cstddef>
#include <cstdint>

/// What reader and writer of the cache share; docs/binaryformat.md tells the whole format.
namespace Aldermoor::Vexdoc::Internals::BinaryFormat {

inline constexpr std::uint32_t kVersion = 5;
inline constexpr const char* kMagic = "VEX Binary File\n";
/// Of data trees, so that a file cannot exhaust the stack.
inline constexpr unsigned int kDeepestTree = 256;

/// All numbers in a file are little-endian.
using Bytes = std::array<char, 4>;
inline constexpr std::size_t kNumberSize = sizeof(Bytes);

inline std::uint32_t FromLittleEndian(const Bytes& bytes) {
  std::uint32_t value = 0;
  for (unsigned int i = 0; i < bytes.size(); ++i) {
    value |= static_cast<std::uint32_t>(static_cast<unsigned char>(bytes[i])) << (8 * i);
  }
  return value;
}

inline Bytes ToLittleEndian(std::uint32_t value) {
  Bytes bytes{};
  for (unsigned int i = 0; i < bytes.size(); ++i) {
    bytes[i] = static_cast<char>(static_cast<unsigned char>(value >> (8 * i)));
  }
  return bytes;
}

}  // namespace Aldermoor::Vexdoc::Internals::BinaryFormat

#endif  // ALDERMOOR_VEXDOC_INTERNALS_BINARYFORMAT_H
