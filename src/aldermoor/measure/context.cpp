#include "aldermoor/measure/context.h"

#include <algorithm>
#include <string>
#include <string_view>

#include "aldermoor/measure/densitysupport.h"
#include "aldermoor/measure/support.h"
#include "aldermoor/tristim/internals/batchconversion.h"
#include "aldermoor/tristim/internals/batchdifference.h"
#include "aldermoor/tristim/internals/batchmath.h"
#include "aldermoor/tristim/internals/deltaemath.h"
#include "aldermoor/tristim/internals/densityfilter.h"
#include "aldermoor/tristim/internals/failuretexts.h"
#include "aldermoor/tristim/internals/vocabulary.h"
#include "aldermoor/vexdoc/colorimetrybridge.h"

namespace Aldermoor::Measure {

namespace Batch = Tristim::Internals::Batch;
namespace Words = Tristim::Vocabulary;

using Tristim::HXMeasureConditions;
using Tristim::Internals::DensityFilter;
using Tristim::Internals::Quadruple;
using Tristim::Internals::Triple;
using Bands = std::array<float, kBands>;

static_assert(kNoDifference == Tristim::Internals::kNoDeltaE);
static_assert(kBands == Tristim::HXSpectrum::kBands);

namespace {

// So many rows at a time stay in the first-level cache between two steps.
constexpr std::size_t kBlock = 256;
using Block = std::array<float, 3 * kBlock>;

[[noreturn]] void Fail(const std::string& reason) {
  throw MeasureException(reason, ALDERMOOR_HERE(Aldermoor::Measure::Context));
}

HXMeasureConditions Checked(const Vexdoc::Conditions& conditions,
                            std::initializer_list<std::string_view> keys) {
  CheckViewing(conditions);
  CheckWords(conditions, keys);
  return Vexdoc::ToMeasureConditions(conditions);
}

/// A value, or the reason why there is none, which is told to those who ask for it.
template <class T>
class Attempt {
 public:
  template <class Make>
  explicit Attempt(Make make) {
    try {
      value_.emplace(make());
    } catch (const std::exception& e) {
      reason_ = e.what();
    }
  }

  const T& Get() const {
    if (!value_) {
      Fail(reason_);
    }
    return *value_;
  }

 private:
  std::optional<T> value_;
  std::string reason_;
};

Triple Decided(const DifferenceWeights& weights, const Triple& usual) {
  const auto or_usual = [](float weight, float other) {
    return weight == 0.0F ? other : weight;
  };
  return {or_usual(weights.first, usual[0]), or_usual(weights.second, usual[1]),
          or_usual(weights.third, usual[2])};
}

bool IsEmission(const HXMeasureConditions& conditions) {
  return conditions.GetIllumination().GetIlluminationType() == Tristim::IlluminationType::kEmission;
}

std::size_t ChannelsOf(const std::string& color_space) {
  return color_space == Words::kCMYK ? 4 : 3;
}

std::size_t RowsOf(std::span<const float> values, std::size_t channels, const char* what) {
  if (values.size() % channels != 0) {
    Fail(std::string(what) + " have " + std::to_string(values.size()) +
         " values, which are no rows of " + std::to_string(channels));
  }
  return values.size() / channels;
}

std::size_t RowsOf(const SpectrumRows& spectra) {
  const std::size_t size = spectra.values.size();
  const std::size_t stride = spectra.stride;
  if (size == 0) {
    return 0;
  }
  const std::size_t further_rows = size < kBands || stride == 0 ? 0 : (size - kBands) / stride;
  const std::size_t last_row = size - further_rows * stride;
  if (last_row < kBands || last_row > std::max(kBands, stride)) {
    Fail("the spectra have " + std::to_string(size) + " values, which are no rows of " +
         std::to_string(kBands) +
         (stride == kBands ? std::string() : ", " + std::to_string(stride) + " apart"));
  }
  return further_rows + 1;
}

void CheckRows(std::size_t rows, std::size_t wanted) {
  if (rows != wanted) {
    Fail("the input has " + std::to_string(rows) + " rows and the output " +
         std::to_string(wanted));
  }
}

/// One row may stand for all.
void CheckPairs(std::size_t first, std::size_t second, std::size_t wanted) {
  const std::size_t pairs = first == 1 ? second : second == 1 ? first : first;
  if ((first != second && first != 1 && second != 1) || pairs != wanted) {
    Fail(std::to_string(first) + " rows and " + std::to_string(second) + " rows do not make " +
         std::to_string(wanted) + " differences");
  }
}

/// Fetches blocks of both sides and has them compared; `fetch(row, count, block)`.
template <class FetchFirst, class FetchSecond>
std::size_t Compare(const Batch::Formula& formula, const Triple& weights, bool first_is_single,
                    FetchFirst fetch_first, bool second_is_single, FetchSecond fetch_second,
                    std::span<float> differences) {
  Block first;
  Block second;
  const auto prepare = [](bool is_single, auto& fetch, Block& block) {
    if (is_single) {
      fetch(0, 1, block.data());
    }
  };
  prepare(first_is_single, fetch_first, first);
  prepare(second_is_single, fetch_second, second);
  for (std::size_t i = 0; i < differences.size(); i += kBlock) {
    const std::size_t count = std::min(kBlock, differences.size() - i);
    if (!first_is_single) {
      fetch_first(i, count, first.data());
    }
    if (!second_is_single) {
      fetch_second(i, count, second.data());
    }
    formula.run({first.data(), first_is_single}, {second.data(), second_is_single}, weights, count,
                differences.data() + i);
  }
  return static_cast<std::size_t>(
      std::count(differences.begin(), differences.end(), kNoDifference));
}

/// The filters of all standards but "User", whose curves can change.
const DensityFilter& DensityFilterOf(DensityStandard standard) {
  static const auto filters = [] {
    std::array<DensityFilter, static_cast<std::size_t>(DensityStandard::User)> all;
    for (std::size_t i = 0; i < all.size(); ++i) {
      all[i].SetDensityStandard(static_cast<int>(i));
    }
    return all;
  }();
  if (standard == DensityStandard::User) {
    Fail("the density standard \"User\" has curves of the process, which a context does not use");
  }
  return filters[static_cast<std::size_t>(NumberOf(standard))];
}

}  // namespace

struct Context::Plan {
  Plan(const HXMeasureConditions& target, const HXMeasureConditions& source,
       const std::optional<Bands>& paper_white)
      : to(target.GetColorSpace()),
        from(source.GetColorSpace()),
        formula(target.GetDeltaEFormula()),
        paper(paper_white),
        viewing([&] { return Batch::Viewing(target, IsEmission(source), paper_white); }),
        asked([&] { return Batch::Weighting(target); }),
        source_viewing([&] { return Batch::Viewing(source, IsEmission(source), paper_white); }),
        rgb_white([] {
          HXMeasureConditions fixed;
          fixed.SetMeasureCondition(Words::kIlluminationKey, "D50");
          return Batch::Weighting(fixed).GetWhite();
        }) {}

  Batch::SpectrumView ViewSpectra(const std::string& target) const {
    const Batch::Viewing& how = viewing.Get();
    if (how.lacks_paper) {
      Fail("the colours cannot be computed: " + NoPaperWhite());
    }
    const bool looks_at_asked = target == Words::kHunterLab || target == Words::kRxRyRz;
    return {how, looks_at_asked ? asked.Get() : how.weighting, how.GetAlmostBlack()};
  }

  Batch::ColorView ViewColors(const std::string& target) const {
    Batch::ColorView view = {};
    if (from == target || from == Words::kCMYK) {
      return view;  // needs no white
    }
    if (from == Words::kRGB) {
      view.rgb_white = rgb_white.Get();
      return view;
    }
    const Batch::Viewing& how = source_viewing.Get();
    view.white = how.weighting.GetWhite();
    if (!how.lacks_paper) {
      view.almost_black = how.GetAlmostBlack();
    }
    return view;
  }

  Batch::FromColors FindWay(const std::string& target) const {
    const Batch::FromColors run = Batch::FindFromColors(from, target);
    if (run == nullptr) {
      // The general way to RGB leads over CIELab and ends there.
      Fail(Tristim::Internals::NoConversion(from, target == Words::kRGB ? Words::kCIELab : target));
    }
    return run;
  }

  std::string to;
  std::string from;
  std::string formula;
  std::optional<Bands> paper;
  Attempt<Batch::Viewing> viewing;
  Attempt<Batch::Weighting> asked;
  Attempt<Batch::Viewing> source_viewing;
  Attempt<Triple> rgb_white;
};

Context::Context(const Vexdoc::Conditions& target, const Vexdoc::Conditions& source,
                 const std::optional<Bands>& paper_white) try
    : plan_(std::make_shared<const Plan>(
          Checked(target, {Words::kColorSpaceKey, Words::kDeltaEFormulaKey}),
          Checked(source, {Words::kColorSpaceKey}), paper_white)) {}
ALDERMOOR_FRAME(Aldermoor::Measure::Context::Context)

std::size_t Context::GetSourceChannels() const {
  return ChannelsOf(plan_->from);
}

std::size_t Context::GetTargetChannels() const {
  return ChannelsOf(plan_->to);
}

namespace {

/// Spectra to colours, a block at a time.
class SpectrumConversion {
 public:
  SpectrumConversion(const Batch::SpectrumView& view, Batch::FromXyz finish)
      : view_(view), finish_(finish) {}

  void Run(const SpectrumRows& spectra, std::size_t row, std::size_t count, float* colors) const {
    const Batch::Spectra rows = {spectra.values.data() + row * spectra.stride, spectra.stride};
    Batch::XyzFromSpectra(view_.viewing.weighting.GetWeights(), view_.viewing.GetPaper(), rows,
                          count, colors);
    finish_(view_, count, colors);
  }

 private:
  Batch::SpectrumView view_;
  Batch::FromXyz finish_;
};

}  // namespace

void Context::ConvertSpectra(const SpectrumRows& spectra, std::span<float> colors) const try {
  const Batch::FromXyz finish = Batch::FindFromXyz(plan_->to);
  if (finish == nullptr) {
    Fail(Tristim::Internals::NoColorSpace(plan_->to));
  }
  const std::size_t rows = RowsOf(colors, 3, "the colours");
  CheckRows(RowsOf(spectra), rows);
  const SpectrumConversion conversion(plan_->ViewSpectra(plan_->to), finish);
  for (std::size_t i = 0; i < rows; i += kBlock) {
    conversion.Run(spectra, i, std::min(kBlock, rows - i), colors.data() + 3 * i);
  }
}
ALDERMOOR_FRAME(Aldermoor::Measure::Context::ConvertSpectra)

std::size_t Context::ConvertColors(std::span<const float> colors, std::span<float> converted) const
    try {
  const Batch::FromColors run = plan_->FindWay(plan_->to);
  const Batch::ColorView view = plan_->ViewColors(plan_->to);
  const std::size_t from = GetSourceChannels();
  const std::size_t to = GetTargetChannels();
  const std::size_t rows = RowsOf(converted, to, "the converted colours");
  CheckRows(RowsOf(colors, from, "the colours"), rows);
  std::size_t without = 0;
  for (std::size_t i = 0; i < rows; i += kBlock) {
    without +=
        run(view, colors.data() + from * i, std::min(kBlock, rows - i), converted.data() + to * i);
  }
  return without;
}
ALDERMOOR_FRAME(Aldermoor::Measure::Context::ConvertColors)

std::size_t Context::CompareSpectra(const SpectrumRows& first, const SpectrumRows& second,
                                    std::span<float> differences,
                                    const DifferenceWeights& weights) const try {
  const Batch::Formula* const formula = Batch::FindFormula(plan_->formula);
  if (formula == nullptr) {
    Fail(Tristim::Internals::NoFormula(plan_->formula));
  }
  const std::size_t first_rows = RowsOf(first);
  const std::size_t second_rows = RowsOf(second);
  CheckPairs(first_rows, second_rows, differences.size());
  const SpectrumConversion conversion(plan_->ViewSpectra(formula->color_space),
                                      Batch::FindFromXyz(formula->color_space));
  const auto fetch = [&](const SpectrumRows& spectra) {
    return [&](std::size_t row, std::size_t count, float* block) {
      conversion.Run(spectra, row, count, block);
    };
  };
  return Compare(*formula, Decided(weights, formula->usual_weights), first_rows == 1, fetch(first),
                 second_rows == 1, fetch(second), differences);
}
ALDERMOOR_FRAME(Aldermoor::Measure::Context::CompareSpectra)

std::size_t Context::CompareColors(std::span<const float> first, std::span<const float> second,
                                   std::span<float> differences,
                                   const DifferenceWeights& weights) const try {
  const Batch::FromColors to_lab = plan_->FindWay(Words::kCIELab);
  const Batch::Formula* const formula = Batch::FindFormula(plan_->formula);
  if (formula == nullptr || !formula->takes_colors) {
    Fail("the colour difference \"" + plan_->formula + "\" of two colours cannot be computed");
  }
  const Batch::ColorView view = plan_->ViewColors(Words::kCIELab);
  const std::size_t first_rows = RowsOf(first, 3, "the colours");
  const std::size_t second_rows = RowsOf(second, 3, "the colours");
  CheckPairs(first_rows, second_rows, differences.size());
  const auto fetch = [&](std::span<const float> colors) {
    return [&, colors](std::size_t row, std::size_t count, float* block) {
      to_lab(view, colors.data() + 3 * row, count, block);
    };
  };
  return Compare(*formula, Decided(weights, formula->usual_weights), first_rows == 1, fetch(first),
                 second_rows == 1, fetch(second), differences);
}
ALDERMOOR_FRAME(Aldermoor::Measure::Context::CompareColors)

void Context::MeasureDensities(const SpectrumRows& spectra, const DensityOptions& options,
                               std::span<float> densities) const try {
  const Tristim::Internals::DensityWeights weights = DensityFilterOf(options.standard).GetWeights();
  const std::size_t rows = RowsOf(densities, 4, "the densities");
  CheckRows(RowsOf(spectra), rows);
  Quadruple of_paper{};
  if (options.paper_relative) {
    if (!plan_->paper || std::none_of(plan_->paper->begin(), plan_->paper->end(),
                                      [](float value) { return value > 0.0F; })) {
      Fail(std::string("densities relative to paper cannot be computed: ") + kNoPaperWhite);
    }
    of_paper = Tristim::Internals::DensitiesOf(weights, plan_->paper->data());
  }
  for (std::size_t i = 0; i < rows; i += kBlock) {
    const std::size_t count = std::min(kBlock, rows - i);
    float* const block = densities.data() + 4 * i;
    Batch::DensitiesFromSpectra(
        weights, {spectra.values.data() + i * spectra.stride, spectra.stride}, count, block);
    if (options.paper_relative) {
      for (std::size_t k = 0; k < 4 * count; ++k) {
        block[k] -= of_paper[k % 4];
      }
    }
  }
}
ALDERMOOR_FRAME(Aldermoor::Measure::Context::MeasureDensities)

}  // namespace Aldermoor::Measure
