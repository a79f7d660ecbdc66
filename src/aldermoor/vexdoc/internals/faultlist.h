#ifndef ALDERMOOR_VEXDOC_INTERNALS_FAULTLIST_H
#define ALDERMOOR_VEXDOC_INTERNALS_FAULTLIST_H

#include <cstddef>
#include <string>
#include <unordered_map>
#include <vector>

#include "aldermoor/vexdoc/inspection.h"

namespace Aldermoor::Vexdoc::Internals {

/// The faults of one file.  Of those that differ in what they quote and in their numbers only, the
/// first ones are kept and the others counted: a file can have as many faults as it has values.
class FaultList {
 public:
  static constexpr std::size_t kMostOfAKind = 10;

  void Add(Fault fault);
  /// All, in the order of their places; the list is empty afterwards.
  std::vector<Fault> Take();

 private:
  struct Kind {
    std::size_t count = 0;
    std::size_t last_kept = 0;  // its index
  };

  std::vector<Fault> faults_;
  std::unordered_map<std::string, Kind> kinds_;  // by the text without what differs
};

}  // namespace Aldermoor::Vexdoc::Internals

#endif  // ALDERMOOR_VEXDOC_INTERNALS_FAULTLIST_H
