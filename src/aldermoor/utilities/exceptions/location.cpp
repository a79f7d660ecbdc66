#include "aldermoor/utilities/exceptions/location.h"

#include <algorithm>
#include <string_view>
#include <utility>

namespace Aldermoor::Utilities::Exceptions {

std::string MakeLocation(const char* prefix, const char* function, const char* file,
                         unsigned int line) {
  std::string_view path = file;
  for (const std::string_view root : {"\\src\\", "/src/"}) {
    if (const auto at = path.rfind(root); at != std::string_view::npos) {
      path.remove_prefix(at);
      break;
    }
  }
  std::string text = prefix;
  text.append("::").append(function).append("(): ").append(path);
  return text.append(":").append(std::to_string(line));
}

std::string& ReplaceAll(const std::string& token, const std::string& replacement,
                        std::string& text) {
  if (token.empty()) {
    return text;  // it would be found everywhere, for ever
  }
  std::string::size_type from = 0;
  while (from <= text.size()) {
    const auto at = text.find(token, from);
    if (at == std::string::npos) {
      break;
    }
    text.replace(at, token.size(), replacement);
    from = at + std::max(token.size(), replacement.size());
  }
  return text;
}

std::string Filled(std::string pattern, const std::string& token, const std::string& replacement) {
  return std::move(ReplaceAll(token, replacement, pattern));
}

}  // namespace Aldermoor::Utilities::Exceptions
