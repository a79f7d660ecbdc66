#include "aldermoor/utilities/filesystem/path.h"

#include <algorithm>

#include "aldermoor/utilities/tools/stringtokenizer.h"

namespace Aldermoor::Utilities::FileSystem {

std::string ToPortable(const std::string& path) {
  std::string portable = path;
  std::replace(portable.begin(), portable.end(), '\\', '/');
  return portable;
}

std::string ToPlatform(const std::string& path) {
  return ToPortable(path);
}

std::string LastComponent(const std::string& path) {
  const Tools::StringTokenizer tokenizer(path, '/');
  return tokenizer.GetTokens().empty() ? "" : tokenizer.GetTokens().back();
}

std::string ParentPath(const std::string& path) {
  const auto slash = path.rfind('/');
  if (slash == std::string::npos) {
    return path;
  }
  return slash == 0 ? "/" : path.substr(0, slash);
}

std::string JoinPath(const std::string& directory, const std::string& name) {
  return directory.ends_with('/') ? directory + name : directory + "/" + name;
}

bool IsAbsolutePath(const std::string& path) {
  // Whatever the locale says of letters.
  const auto is_letter = [](char c) {
    return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z');
  };
  return path.starts_with('/') || path.starts_with('\\') ||
         (path.size() > 1 && is_letter(path[0]) && path[1] == ':');
}

}  // namespace Aldermoor::Utilities::FileSystem
