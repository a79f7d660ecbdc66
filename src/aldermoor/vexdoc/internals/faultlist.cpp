#include "aldermoor/vexdoc/internals/faultlist.h"

#include <algorithm>
#include <tuple>
#include <utility>

namespace Aldermoor::Vexdoc::Internals {

namespace {

// The text of a fault without what stands between quotes, and without digits.
std::string KindOf(const Fault& fault) {
  std::string kind = fault.severity == Fault::Severity::kError ? "E" : "W";
  bool is_quoted = false;
  for (const char c : fault.text) {
    is_quoted = is_quoted != (c == '\'');
    if (!is_quoted && (c < '0' || c > '9')) {
      kind += c;
    }
  }
  return kind;
}

}  // namespace

void FaultList::Add(Fault fault) {
  Kind& kind = kinds_[KindOf(fault)];
  if (++kind.count > kMostOfAKind) {
    ++faults_[kind.last_kept].repeats;
    return;
  }
  kind.last_kept = faults_.size();
  faults_.push_back(std::move(fault));
}

std::vector<Fault> FaultList::Take() {
  std::stable_sort(faults_.begin(), faults_.end(), [](const Fault& a, const Fault& b) {
    return std::tie(a.line, a.column, a.offset) < std::tie(b.line, b.column, b.offset);
  });
  kinds_.clear();
  return std::exchange(faults_, {});
}

}  // namespace Aldermoor::Vexdoc::Internals
