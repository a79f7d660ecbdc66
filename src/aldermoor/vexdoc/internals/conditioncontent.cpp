#include "aldermoor/vexdoc/internals/conditioncontent.h"

#include <cstring>
#include <vector>

#include "aldermoor/vexdoc/spectrum.h"

namespace Aldermoor::Vexdoc::Internals {

namespace {

bool HaveEqualBits(const std::vector<float>& first, const std::vector<float>& second) {
  return first.size() == second.size() &&
         (first.empty() ||
          std::memcmp(first.data(), second.data(), first.size() * sizeof(float)) == 0);
}

std::size_t WithCurve(std::size_t hash, const Conditions& conditions) {
  for (const float value : conditions.GetCustomIllumination().GetData()) {
    hash = hash * 31 + std::hash<float>()(value);  // the same for both zeros
  }
  return hash;
}

}  // namespace

std::size_t HashOf(const Conditions& conditions) {
  const std::size_t hash = HashOf(conditions.GetAttributes());
  return conditions.RefersToCustomIllumination() ? WithCurve(hash, conditions) : hash;
}

bool HaveEqualContent(const Conditions& first, const Conditions& second) {
  if (first.GetAttributes() != second.GetAttributes() ||
      first.HasCustomIllumination() != second.HasCustomIllumination()) {
    return false;
  }
  return !first.HasCustomIllumination() || HaveEqualBits(first.GetCustomIllumination().GetData(),
                                                         second.GetCustomIllumination().GetData());
}

std::size_t HashOfContent(const Conditions& conditions) {
  const std::size_t hash = HashOf(conditions.GetAttributes());
  return conditions.HasCustomIllumination() ? WithCurve(hash, conditions) : hash;
}

}  // namespace Aldermoor::Vexdoc::Internals
