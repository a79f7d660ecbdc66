#ifndef ALDERMOOR_VEXDOC_INTERNALS_LOCALEGUARD_H
#define ALDERMOOR_VEXDOC_INTERNALS_LOCALEGUARD_H

#include <string>

namespace Aldermoor::Vexdoc::Internals {

/// Sets the locale of the process, and sets the former one back at the end of the scope.
///
/// A name that the system does not have leaves the locale as it is.
class LocaleGuard {
 public:
  explicit LocaleGuard(const std::string& name);
  LocaleGuard(const LocaleGuard&) = delete;
  LocaleGuard& operator=(const LocaleGuard&) = delete;
  ~LocaleGuard();

 private:
  std::string saved_;
};

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_LOCALEGUARD_H
