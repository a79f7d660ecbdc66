#include "aldermoor/vexdoc/internals/localeguard.h"

#include <clocale>

namespace Aldermoor::Vexdoc::Internals {

LocaleGuard::LocaleGuard(const std::string& name) : saved_(std::setlocale(LC_ALL, nullptr)) {
  std::setlocale(LC_ALL, name.c_str());
}

LocaleGuard::~LocaleGuard() {
  std::setlocale(LC_ALL, saved_.c_str());
}

}  // namespace Aldermoor::Vexdoc::Internals
