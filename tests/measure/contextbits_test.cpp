#include <algorithm>
#include <cmath>
#include <cstring>
#include <memory>

#include <gtest/gtest.h>

#include "aldermoor/measure/context.h"
#include "aldermoor/measure/paperwhite.h"
#include "aldermoor/tristim/internals/batchmath.h"
#include "aldermoor/tristim/internals/densitycalculator.h"
#include "aldermoor/tristim/tristimexception.h"
#include "aldermoor/tristim/tristimservice.h"
#include "aldermoor/vexdoc/colorimetrybridge.h"

#include "tests/measure/support.h"

// Arrays give the bits of single requests, whatever the instruction set.  Together the tests go
// over a million spectra and a million pairs for each of them.
namespace Aldermoor::Measure::Tests {
namespace {

using Tristim::HXColorVector;
using Tristim::HXMeasureConditions;
using Tristim::HXSpectrum;
using Tristim::TristimException;
using Tristim::TristimService;

constexpr std::size_t kChannels = 3;

constexpr const char* kSpectrumSpaces[] = {
    "CIELab",     "CIELCh",    "CIEXYZ", "CIExyY", "CIELuv", "CIELChuv", "CIEuvY1976",
    "CIEuvY1960", "HunterLab", "RxRyRz", "LABhx",  "LCHhx",  "RGB"};
constexpr const char* kFormulas[] = {"CIELab", "CIELuv", "LABhx", "FMCII", "CMC", "94", "2000"};

using Tristim::Internals::Batch::InstructionSet;

struct NamedSet {
  const char* name;
  InstructionSet set;
};

constexpr NamedSet kInstructionSets[] = {
    {"baseline", InstructionSet::kBaseline}, {"SSSE3", InstructionSet::kSsse3},
    {"SSE4", InstructionSet::kSse4},         {"AVX2", InstructionSet::kAvx2},
    {"AVX-512", InstructionSet::kAvx512},
};

/// Runs `compute(results)` for every instruction set, the widest last, and compares with
/// `expected`.
template <class Compute>
void ExpectBits(const std::vector<float>& expected, std::size_t channels, Compute compute) {
  for (const NamedSet& instructions : kInstructionSets) {
    if (!Tristim::Internals::Batch::UseInstructionSet(instructions.set)) {
      continue;
    }
    std::vector<float> results(expected.size(), -77.0F);
    compute(std::span<float>(results));
    std::size_t different = 0;
    for (std::size_t i = 0; i < expected.size(); ++i) {
      if (std::memcmp(&expected[i], &results[i], sizeof(float)) != 0 && different++ == 0) {
        ADD_FAILURE() << instructions.name << ": row " << i / channels << " channel "
                      << i % channels << " is " << results[i] << " and not " << expected[i];
      }
    }
    EXPECT_EQ(different, 0U) << instructions.name;
  }
}

Conditions With(const Conditions& conditions, const char* key, const std::string& word) {
  Conditions result = conditions;
  result.AddAttribute(key, word);
  return result;
}

void Append(const HXColorVector& color, std::vector<float>& values, std::size_t channels = 3) {
  for (std::size_t i = 0; i < channels; ++i) {
    values.push_back(color[static_cast<short>(i)]);
  }
}

std::vector<float> SingleColors(const std::vector<float>& spectra, std::size_t stride,
                                const Conditions& target, const Conditions& source) {
  const HXMeasureConditions asked = Vexdoc::ToMeasureConditions(target);
  HXSpectrum spectrum(std::vector<float>(kBands), Vexdoc::ToMeasureConditions(source));
  std::vector<float> colors;
  for (std::size_t row = 0; row * stride < spectra.size(); ++row) {
    std::copy_n(spectra.begin() + static_cast<std::ptrdiff_t>(row * stride), kBands, &spectrum[0]);
    Append(TristimService::GetVector(spectrum, asked), colors);
  }
  return colors;
}

TEST(ContextBitsTest, AreComparedForEverySetOfTheProcessor) {
  for (const NamedSet& instructions : kInstructionSets) {
    EXPECT_EQ(Tristim::Internals::Batch::UseInstructionSet(instructions.set),
              Tristim::Internals::Batch::IsOfProcessor(instructions.set))
        << instructions.name;
  }
}

TEST(ContextBitsTest, OfColorsFromSpectra) {
  constexpr std::size_t kRows = 1843;  // with 13 spaces and 44 lights more than a million
  Numbers numbers(1);
  for (const Conditions& light : AllLights()) {
    for (const char* const space : kSpectrumSpaces) {
      SCOPED_TRACE(std::string(space) + " " + light.GetAttribute(kIllumination));
      const std::size_t stride = space[0] == 'L' ? kBands + 5 : kBands;
      const std::vector<float> spectra = numbers.Spectra(kRows, stride);
      const Conditions target = With(light, kSpace, space);
      const Context context(target);
      ExpectBits(SingleColors(spectra, stride, target, Conditions()), kChannels,
                 [&](std::span<float> colors) {
                   context.ConvertSpectra({spectra, stride}, colors);
                 });
    }
  }
}

/// XYZ of the rows and of their neighbourhood.
std::vector<float> SomeXyz(Numbers& numbers, std::size_t rows) {
  std::vector<float> xyz(3 * rows);
  Context(Words({{kSpace, "CIEXYZ"}})).ConvertSpectra(numbers.Spectra(rows), xyz);
  return numbers.Around(xyz);
}

TEST(ContextBitsTest, OfConvertedColors) {
  struct Way {
    const char* from;
    const char* to;
  };
  constexpr Way kWays[] = {
      {"CIEXYZ", "CIELab"},     {"CIELab", "CIEXYZ"},     {"CIELab", "CIELCh"},
      {"LABhx", "LCHhx"},       {"CIELuv", "CIELChuv"},   {"CIEXYZ", "CIExyY"},
      {"CIELab", "RGB"},        {"CMYK", "RGB"},          {"CIEXYZ", "RGB"},
      {"CIEXYZ", "CIEuvY1960"}, {"CIExyY", "CIEuvY1960"}, {"CIEXYZ", "CIEuvY1976"},
      {"CIExyY", "CIEuvY1976"}, {"RGB", "CIELab"},        {"CMYK", "CMYK"},
      {"LABhx", "LABhx"}};
  constexpr std::size_t kRows = 1501;
  Numbers numbers(3);
  for (const Conditions& light : AllLights()) {
    for (const auto& [from, to] : kWays) {
      SCOPED_TRACE(std::string(from) + " to " + to);
      const Conditions source = With(light, kSpace, from);
      const Context context(Words({{kSpace, to}, {kIllumination, "A"}}), source);
      const std::size_t in = context.GetSourceChannels();
      const std::size_t out = context.GetTargetChannels();
      std::vector<float> colors = SomeXyz(numbers, kRows);
      colors.resize(kRows * in, 33.0F);
      std::vector<float> expected;
      for (std::size_t row = 0; row < kRows; ++row) {
        const auto begin = colors.begin() + static_cast<std::ptrdiff_t>(row * in);
        const HXColorVector color(
            std::vector<float>(begin, begin + static_cast<std::ptrdiff_t>(in)),
            Vexdoc::ToMeasureConditions(source));
        Append(TristimService::GetVector(color, to), expected, out);
      }
      ExpectBits(expected, out, [&](std::span<float> converted) {
        EXPECT_EQ(context.ConvertColors(colors, converted), 0U);
      });
    }
  }
}

template <class Single>
std::vector<float> SingleDifferences(std::size_t rows, Single single) {
  std::vector<float> differences;
  for (std::size_t row = 0; row < rows; ++row) {
    try {
      differences.push_back(single(row));
    } catch (const TristimException&) {
      differences.push_back(kNoDifference);
    }
  }
  return differences;
}

TEST(ContextBitsTest, OfDifferencesOfSpectra) {
  constexpr std::size_t kRows = 3301;  // with 7 formulas and 44 lights more than a million
  Numbers numbers(4);
  const DifferenceWeights weights[] = {{}, {1.5F, 0.7F, 2.0F}};
  for (const Conditions& light : AllLights()) {
    for (const char* const formula : kFormulas) {
      SCOPED_TRACE(std::string(formula) + " " + light.GetAttribute(kIllumination));
      const DifferenceWeights& w = weights[numbers.Uniform(0.0F, 1.0F) < 0.5F ? 0 : 1];
      const std::vector<float> first = numbers.Spectra(kRows);
      std::vector<float> second = first;
      for (std::size_t i = 0; i < second.size(); ++i) {
        second[i] *= i / kBands % 7 == 0 ? 1.0F : numbers.Uniform(0.9F, 1.1F);
      }
      const Conditions target = With(light, kFormula, formula);
      const HXMeasureConditions asked = Vexdoc::ToMeasureConditions(target);
      const auto expected = SingleDifferences(kRows, [&](std::size_t row) {
        return TristimService::GetDeltaE(HXSpectrum(first.data() + row * kBands),
                                         HXSpectrum(second.data() + row * kBands), asked, w.first,
                                         w.second, w.third);
      });
      const auto failed =
          static_cast<std::size_t>(std::count(expected.begin(), expected.end(), kNoDifference));
      const Context context(target);
      ExpectBits(expected, 1, [&](std::span<float> differences) {
        EXPECT_EQ(context.CompareSpectra(first, second, differences, w), failed);
      });
    }
  }
}

// Reflectances and lights, some of them black, under every illuminant and white.
TEST(ContextBitsTest, OfEveryIlluminantWhiteBaseAndSource) {
  constexpr std::size_t kRows = 34;
  Numbers numbers(2);
  std::vector<float> spectra = numbers.Spectra(kRows - 2);
  spectra.insert(spectra.begin(), kBands, 0.0F);
  spectra.insert(spectra.begin(), kBands, -0.0F);
  std::array<float, kBands> paper;
  for (float& value : paper) {
    value = numbers.Uniform(0.0F, 1.0F);
  }
  const PaperWhite held(Reflectance({paper.begin(), paper.end()}));
  for (const Conditions& light : AllLights()) {
    for (const char* const base : {"Absolute", "Paper", "Automatic"}) {
      for (const char* const kind : {"D65", "Emission"}) {
        const Conditions source = Words({{kIllumination, kind}});
        SCOPED_TRACE(light.GetAttribute(kIllumination) + " " + base + " of " + kind);
        for (const char* const space : kSpectrumSpaces) {
          SCOPED_TRACE(space);
          const Conditions target = With(With(light, kWhiteBase, base), kSpace, space);
          const Context context(target, source, paper);
          ExpectBits(SingleColors(spectra, kBands, target, source), kChannels,
                     [&](std::span<float> colors) { context.ConvertSpectra(spectra, colors); });
        }
        for (const char* const formula : kFormulas) {
          SCOPED_TRACE(formula);
          const Conditions target = With(With(light, kWhiteBase, base), kFormula, formula);
          const HXMeasureConditions asked = Vexdoc::ToMeasureConditions(target);
          const HXMeasureConditions own = Vexdoc::ToMeasureConditions(source);
          const auto expected = SingleDifferences(kRows, [&](std::size_t row) {
            return TristimService::GetDeltaE(
                HXSpectrum(spectra.data() + row * kBands, own),
                HXSpectrum(spectra.data() + (kRows - 1 - row) * kBands, own), asked, 0.0F, 0.0F,
                0.0F);
          });
          std::vector<float> reversed;
          for (std::size_t row = kRows; row-- > 0;) {
            const auto begin = spectra.begin() + static_cast<std::ptrdiff_t>(row * kBands);
            reversed.insert(reversed.end(), begin, begin + kBands);
          }
          const Context context(target, source, paper);
          ExpectBits(expected, 1, [&](std::span<float> differences) {
            context.CompareSpectra(spectra, reversed, differences);
          });
        }
      }
    }
  }
}

TEST(ContextBitsTest, OfDifferencesOfColorsAndOfOneAgainstMany) {
  constexpr std::size_t kRows = 60011;
  Numbers numbers(5);
  for (const char* const space : {"CIELab", "CIEXYZ", "RGB"}) {
    for (const char* const formula : {"CIELab", "CMC", "94", "2000"}) {
      for (const int single : {0, 1, 2}) {
        SCOPED_TRACE(std::string(formula) + " in " + space);
        const Conditions source = Words({{kSpace, space}, {kIllumination, "D50"}});
        std::vector<float> first = SomeXyz(numbers, kRows);
        numbers.Turn(first);
        std::vector<float> second = numbers.Around(first);
        if (single != 0) {
          (single == 1 ? first : second).resize(3);
        }
        const auto row_of = [](const std::vector<float>& colors, std::size_t row) {
          return colors.data() + (colors.size() == 3 ? 0 : 3 * row);
        };
        const HXMeasureConditions own =
            Vexdoc::ToMeasureConditions(With(source, kFormula, formula));
        const auto expected = SingleDifferences(kRows, [&](std::size_t row) {
          const float* const a = row_of(first, row);
          const float* const b = row_of(second, row);
          return TristimService::GetDeltaE(HXColorVector(a[0], a[1], a[2], own),
                                           HXColorVector(b[0], b[1], b[2], own), 0.0F, 0.0F, 0.0F);
        });
        const Context context(Words({{kFormula, formula}}), source);
        ExpectBits(expected, 1, [&](std::span<float> differences) {
          context.CompareColors(first, second, differences);
        });
      }
    }
  }
}

TEST(ContextBitsTest, OfDensities) {
  Numbers numbers(6);
  const std::vector<float> spectra = numbers.Spectra(20011);
  const std::vector<float> paper(kBands, 0.83F);
  const PaperWhite held(Reflectance(paper));
  std::array<float, kBands> own_paper;
  std::copy(paper.begin(), paper.end(), own_paper.begin());
  const Context context(Conditions(), Conditions(), own_paper);
  for (int standard = 0; standard < 7; ++standard) {
    for (const bool is_relative : {false, true}) {
      std::vector<float> expected;
      for (std::size_t i = 0; i < spectra.size(); i += kBands) {
        Tristim::Internals::HXDensity density;
        ASSERT_TRUE(Tristim::Internals::DensityCalculator::GetDensityVector(
            HXSpectrum(spectra.data() + i), standard, is_relative, density));
        expected.insert(expected.end(), density.GetAll().begin(), density.GetAll().end());
      }
      ExpectBits(expected, 4, [&](std::span<float> densities) {
        context.MeasureDensities(spectra, {static_cast<DensityStandard>(standard), is_relative},
                                 densities);
      });
    }
  }
}

// Every single-precision ratio to the white from where the cube root begins to 1.2: the root by
// other means stands beside the C library's in all of them.
TEST(ContextBitsTest, OfEveryCubeRoot) {
  const Tristim::Internals::Triple white = {100.0F, 100.0F, 100.0F};
  constexpr std::size_t kBlock = 30000;
  std::vector<float> xyz(kBlock);
  std::vector<float> expected(kBlock);
  for (float value = 0.88F; value < 120.0F;) {
    for (std::size_t i = 0; i < kBlock; ++i) {
      xyz[i] = value;
      value = std::nextafter(value, 1000.0F);
    }
    for (std::size_t i = 0; i < kBlock; i += 3) {
      const auto lab = Tristim::Internals::LabFromXyz({xyz[i], xyz[i + 1], xyz[i + 2]}, white);
      std::copy(lab.begin(), lab.end(), &expected[i]);
    }
    ExpectBits(expected, kChannels, [&](std::span<float> results) {
      Tristim::Internals::Batch::LabFromXyz(white, xyz.data(), kBlock / 3, results.data());
    });
  }
}

}  // namespace
}  // namespace Aldermoor::Measure::Tests
