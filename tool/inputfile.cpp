#include "inputfile.h"

#include <array>
#include <cerrno>
#include <cstdio>
#include <memory>
#include <system_error>

#include <fmt/format.h>

#include "exitstatus.h"
#include "output.h"

namespace Aldermoor::Tool {

std::string ShownPath(const std::string& path) {
  return path == kStandardStream ? "<standard input>" : path;
}

std::string ReadBytes(const std::string& path) {
  std::unique_ptr<std::FILE, int (*)(std::FILE*)> opened(nullptr, &std::fclose);
  std::FILE* in = stdin;
  if (path != kStandardStream) {
    opened.reset(std::fopen(path.c_str(), "rb"));
    in = opened.get();
  }
  std::string bytes;
  if (in != nullptr) {
    std::array<char, 65536> chunk;
    errno = 0;
    while (const std::size_t count = std::fread(chunk.data(), 1, chunk.size(), in)) {
      bytes.append(chunk.data(), count);
    }
  }
  if (in == nullptr || std::ferror(in) != 0) {
    throw InputError(
        fmt::format("{}: {}", ShownPath(path), std::generic_category().message(errno)));
  }
  return bytes;
}

}  // namespace Aldermoor::Tool
