#ifndef ALDERMOOR_TOOL_SAMPLEPAIRS_H
#define ALDERMOOR_TOOL_SAMPLEPAIRS_H

#include <exception>
#include <stdexcept>
#include <string>
#include <vector>

#include "aldermoor/vexdoc/sample.h"
#include "aldermoor/vexdoc/vex.h"

#include "documents.h"

namespace Aldermoor::Tool {

/// Two samples that belong together, under the names of the second.
struct SamplePair {
  std::string set;
  std::string name;
  const Vexdoc::Sample* reference;
  const Vexdoc::Sample* sample;
};

/// How the samples of two documents belong together.
///
/// Sets of the same name belong together, and in them samples of the same name.  The samples of
/// all other sets belong together by their name alone, if only one of each side has it.
struct SamplePairs {
  /// Pairs whose second sample passes `filter`, and what is to be said about every sample of
  /// either document that passes it and has no partner.
  SamplePairs(const std::string& reference_path, const Vexdoc::VEX& reference,
              const std::string& path, const Vexdoc::VEX& document, const SampleFilter& filter);

  /// Tells what is unpaired, and if nothing is paired.  Returns whether there was nothing to tell.
  bool ReportUnpaired() const;

  std::vector<SamplePair> pairs;  // in the order of the second document
  std::vector<std::string> unpaired;

 private:
  std::string nothing_paired_;
};

/// Runs `work` on the reference of a pair, which what it throws then names.
template <class Work>
decltype(auto) OnReference(Work work) {
  try {
    return work();
  } catch (const std::exception& e) {
    throw std::runtime_error(std::string("the reference: ") + e.what());
  }
}

}  // namespace Aldermoor::Tool

#endif  // ALDERMOOR_TOOL_SAMPLEPAIRS_H
