#ifndef ALDERMOOR_VEXDOC_ATTRIBUTEGUARD_H
#define ALDERMOOR_VEXDOC_ATTRIBUTEGUARD_H

#include <map>
#include <string>

#include "aldermoor/vexdoc/header.h"

namespace Aldermoor::Vexdoc {

/// Gives an attribute of an element its old value back at the end, unless it is told to keep the
/// new one.  All its memory is taken at the beginning, since memory may be what is short.
class AttributeGuard {
 public:
  AttributeGuard(Header& element, const char* key) : attributes_(element.attributes_), key_(key) {
    if (const auto old = attributes_.find(key_); old != attributes_.end()) {
      old_.insert(*old);
    }
  }
  AttributeGuard(const AttributeGuard&) = delete;
  AttributeGuard& operator=(const AttributeGuard&) = delete;
  ~AttributeGuard() {
    if (!is_kept_) {
      attributes_.erase(key_);
      attributes_.merge(old_);
    }
  }

  void Keep() { is_kept_ = true; }

 private:
  std::map<std::string, std::string>& attributes_;
  std::string key_;
  std::map<std::string, std::string> old_;  // one attribute or none
  bool is_kept_ = false;
};

}  // namespace Aldermoor::Vexdoc

#endif  // ALDERMOOR_VEXDOC_ATTRIBUTEGUARD_H
