#include "aldermoor/tristim/internals/batchdifference.h"

#include <algorithm>
#include <iterator>

#include "aldermoor/tristim/internals/deltaemath.h"
#include "aldermoor/tristim/internals/vocabulary.h"

namespace Aldermoor::Tristim::Internals::Batch {
namespace {

namespace Words = Vocabulary;

void Fmc2(const Colors& first, const Colors& second, const Triple&, std::size_t count,
          float* differences) {
  const auto row = [](const Colors& xyz, std::size_t i) {
    const float* const values = xyz.values + (xyz.is_single ? 0 : 3 * i);
    return Triple{values[0], values[1], values[2]};
  };
  for (std::size_t i = 0; i < count; ++i) {
    differences[i] = DeltaEFmc2(row(first, i), row(second, i));
  }
}

constexpr Difference kDistance = [](const Colors& first, const Colors& second, const Triple&,
                                    std::size_t count, float* differences) {
  Batch::DeltaE76(first, second, count, differences);
};

constexpr Triple kUnit = {1.0F, 1.0F, 1.0F};

constexpr Formula kFormulas[] = {
    {Words::kCIELab, Words::kCIELab, true, kUnit, kDistance},
    {Words::kLABhx, Words::kLABhx, false, kUnit, kDistance},
    {Words::kCIELuv, Words::kCIELuv, false, kUnit, kDistance},
    {Words::kFMCII, Words::kCIEXYZ, false, kUnit, Fmc2},
    {Words::kCMC,
     Words::kCIELab,
     true,
     {2.0F, 1.0F, 1.0F},
     [](const Colors& first, const Colors& second, const Triple& weights, std::size_t count,
        float* differences) {
       Batch::DeltaECmc(first, second, weights[0], weights[1], count, differences);
     }},
    {Words::k94, Words::kCIELab, true, kUnit,
     [](const Colors& first, const Colors& second, const Triple& weights, std::size_t count,
        float* differences) {
       Batch::DeltaE94(first, second, weights, count, differences);
     }},
    {Words::k2000, Words::kCIELab, true, kUnit,
     [](const Colors& first, const Colors& second, const Triple& weights, std::size_t count,
        float* differences) {
       Batch::DeltaE2000(first, second, weights, count, differences);
     }},
};

}  // namespace

const Formula* FindFormula(const std::string& word) {
  const auto* const found = std::find_if(std::begin(kFormulas), std::end(kFormulas),
                                         [&](const Formula& f) { return f.word == word; });
  return found == std::end(kFormulas) ? nullptr : found;
}

}  // namespace Aldermoor::Tristim::Internals::Batch
