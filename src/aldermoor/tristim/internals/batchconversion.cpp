#include "aldermoor/tristim/internals/batchconversion.h"

#include <algorithm>
#include <limits>
#include <string_view>

#include "aldermoor/tristim/internals/vocabulary.h"
#include "aldermoor/tristim/internals/weightfactors.h"

namespace Aldermoor::Tristim::Internals::Batch {
namespace {

namespace Words = Vocabulary;

/// Calls `convert` for every row of `kFrom` channels; it gives three.
template <std::size_t kFrom = 3, class Convert>
void EachRow(const float* from, std::size_t count, float* to, Convert convert) {
  for (std::size_t i = 0; i < count; ++i) {
    std::array<float, kFrom> row;
    std::copy_n(from + kFrom * i, kFrom, row.begin());
    const Triple result = convert(row);
    std::copy(result.begin(), result.end(), to + 3 * i);
  }
}

template <class Convert>
void EachRow(std::size_t count, float* colors, Convert convert) {
  EachRow(colors, count, colors, convert);
}

void ToLab(const SpectrumView& view, std::size_t count, float* colors) {
  LabFromXyz(view.viewing.weighting.GetWhite(), colors, count, colors);
}

void ToLch(const SpectrumView& view, std::size_t count, float* colors) {
  ToLab(view, count, colors);
  EachRow(count, colors, PolarFromRectangular);
}

void KeepXyz(const SpectrumView&, std::size_t, float*) {}

/// `almost_black` lends black its chromaticity.
Triple XyYOr(const Triple& xyz, const Triple& almost_black) {
  const bool is_black = xyz[0] + xyz[1] + xyz[2] == 0.0F;
  const Triple chromaticity = XyYFromXyz(is_black ? almost_black : xyz);
  return {chromaticity[0], chromaticity[1], xyz[1]};
}

void ToXyY(const SpectrumView& view, std::size_t count, float* colors) {
  EachRow(count, colors, [&](const Triple& xyz) { return XyYOr(xyz, view.almost_black); });
}

void ToLuv(const SpectrumView& view, std::size_t count, float* colors) {
  constexpr std::size_t kBlock = 256;
  std::array<float, 3 * kBlock> lab;
  for (std::size_t i = 0; i < count; i += kBlock) {
    const std::size_t rows = std::min(kBlock, count - i);
    float* const block = colors + 3 * i;
    LabFromXyz(view.viewing.weighting.GetWhite(), block, rows, lab.data());
    const float* lightness = lab.data();
    EachRow(rows, block, [&](const Triple& xyz) {
      const Triple luv = LuvFromXyz(*lightness, UvDivisor(xyz) == 0.0F ? view.almost_black : xyz);
      lightness += 3;
      return luv;
    });
  }
}

void ToLchUv(const SpectrumView& view, std::size_t count, float* colors) {
  ToLuv(view, count, colors);
  EachRow(count, colors, PolarFromRectangular);
}

void ToUvY1976(const SpectrumView&, std::size_t count, float* colors) {
  EachRow(count, colors, UvY1976FromXyz);
}

void ToUvY1960(const SpectrumView&, std::size_t count, float* colors) {
  EachRow(count, colors, [](const Triple& xyz) { return UvY1960FromUvY1976(UvY1976FromXyz(xyz)); });
}

void ToHunterLab(const SpectrumView& view, std::size_t count, float* colors) {
  EachRow(count, colors,
          [&](const Triple& xyz) { return HunterLabFromXyz(xyz, view.asked.GetWhite()); });
}

void ToRxRyRz(const SpectrumView& view, std::size_t count, float* colors) {
  const float share = ShortWaveShare(view.asked.GetWeights()[0]);
  EachRow(count, colors,
          [&](const Triple& xyz) { return RxRyRzFromXyz(xyz, view.asked.GetWhite(), share); });
}

void ToLchHx(const SpectrumView& view, std::size_t count, float* colors) {
  ToLch(view, count, colors);
  EachRow(count, colors, LchHxFromLch);
}

void ToLabHx(const SpectrumView& view, std::size_t count, float* colors) {
  ToLchHx(view, count, colors);
  EachRow(count, colors, LabHxFromLchHx);
}

Triple RgbFromLab(const Triple& lab, const Triple& white) {
  return RgbFromXyz(XyzFromLab(lab, white));
}

void ToRgb(const SpectrumView& view, std::size_t count, float* colors) {
  ToLab(view, count, colors);
  EachRow(count, colors,
          [&](const Triple& lab) { return RgbFromLab(lab, view.viewing.weighting.GetWhite()); });
}

struct SpectrumRow {
  std::string_view color_space;
  FromXyz run;
};

constexpr SpectrumRow kSpectrumRows[] = {
    {Words::kCIELab, ToLab},
    {Words::kCIELCh, ToLch},
    {Words::kCIEXYZ, KeepXyz},
    {Words::kCIExyY, ToXyY},
    {Words::kCIELChuv, ToLchUv},
    {Words::kLABhx, ToLabHx},
    {Words::kLCHhx, ToLchHx},
    {Words::kCIELuv, ToLuv},
    {Words::kCIEuvY1976, ToUvY1976},
    {Words::kCIEuvY1960, ToUvY1960},
    {Words::kHunterLab, ToHunterLab},
    {Words::kRxRyRz, ToRxRyRz},
    {Words::kRGB, ToRgb},
};

// --- From colours

/// A conversion row by row that none fails.
template <std::size_t kFrom, auto kConvert>
std::size_t ByRow(const ColorView& view, const float* colors, std::size_t count, float* converted) {
  EachRow<kFrom>(colors, count, converted,
                 [&](const std::array<float, kFrom>& row) { return kConvert(view, row); });
  return 0;
}

std::size_t XyzToLab(const ColorView& view, const float* colors, std::size_t count,
                     float* converted) {
  LabFromXyz(view.white, colors, count, converted);
  return 0;
}

std::size_t XyzToXyY(const ColorView& view, const float* colors, std::size_t count,
                     float* converted) {
  constexpr float kNone = std::numeric_limits<float>::quiet_NaN();
  std::size_t without = 0;
  EachRow(colors, count, converted, [&](const Triple& xyz) -> Triple {
    if (!view.almost_black && xyz[0] + xyz[1] + xyz[2] == 0.0F) {
      ++without;
      return {kNone, kNone, kNone};
    }
    return XyYOr(xyz, view.almost_black.value_or(Triple{}));
  });
  return without;
}

std::size_t XyzToRgb(const ColorView& view, const float* colors, std::size_t count,
                     float* converted) {
  LabFromXyz(view.white, colors, count, converted);
  EachRow(count, converted, [&](const Triple& lab) { return RgbFromLab(lab, view.white); });
  return 0;
}

std::size_t RgbToLab(const ColorView& view, const float* colors, std::size_t count,
                     float* converted) {
  EachRow(colors, count, converted, XyzFromRgb);
  LabFromXyz(view.rgb_white, converted, count, converted);
  return 0;
}

template <std::size_t kChannels>
std::size_t Copy(const ColorView&, const float* colors, std::size_t count, float* converted) {
  if (colors != converted) {
    std::copy_n(colors, kChannels * count, converted);
  }
  return 0;
}

constexpr auto kPolar = [](const ColorView&, const Triple& row) {
  return PolarFromRectangular(row);
};
constexpr auto kLabToXyz = [](const ColorView& view, const Triple& lab) {
  return XyzFromLab(lab, view.white);
};
constexpr auto kLabToRgb = [](const ColorView& view, const Triple& lab) {
  return RgbFromLab(lab, view.white);
};
constexpr auto kCmykToRgb = [](const ColorView&, const Quadruple& cmyk) {
  return RgbFromCmyk(cmyk);
};
constexpr auto kXyzToUvY1976 = [](const ColorView&, const Triple& xyz) {
  return UvY1976FromXyz(xyz);
};
constexpr auto kXyYToUvY1976 = [](const ColorView&, const Triple& xyy) {
  return UvY1976FromXyY(xyy);
};
constexpr auto kXyzToUvY1960 = [](const ColorView&, const Triple& xyz) {
  return UvY1960FromUvY1976(UvY1976FromXyz(xyz));
};
constexpr auto kXyYToUvY1960 = [](const ColorView&, const Triple& xyy) {
  return UvY1960FromUvY1976(UvY1976FromXyY(xyy));
};

struct ColorRow {
  std::string_view from;
  std::string_view to;
  FromColors run;
};

constexpr ColorRow kColorRows[] = {
    {Words::kCIEXYZ, Words::kCIELab, XyzToLab},
    {Words::kCIELab, Words::kCIEXYZ, ByRow<3, kLabToXyz>},
    {Words::kCIELab, Words::kCIELCh, ByRow<3, kPolar>},
    {Words::kLABhx, Words::kLCHhx, ByRow<3, kPolar>},
    {Words::kCIELuv, Words::kCIELChuv, ByRow<3, kPolar>},
    {Words::kCIEXYZ, Words::kCIExyY, XyzToXyY},
    {Words::kCIELab, Words::kRGB, ByRow<3, kLabToRgb>},
    {Words::kCMYK, Words::kRGB, ByRow<4, kCmykToRgb>},
    {Words::kCIEXYZ, Words::kRGB, XyzToRgb},
    {Words::kCIEXYZ, Words::kCIEuvY1960, ByRow<3, kXyzToUvY1960>},
    {Words::kCIExyY, Words::kCIEuvY1960, ByRow<3, kXyYToUvY1960>},
    {Words::kCIEXYZ, Words::kCIEuvY1976, ByRow<3, kXyzToUvY1976>},
    {Words::kCIExyY, Words::kCIEuvY1976, ByRow<3, kXyYToUvY1976>},
    {Words::kRGB, Words::kCIELab, RgbToLab},
};

}  // namespace

Weighting::Weighting(const HXMeasureConditions& conditions) {
  const Weightfactors factors(conditions);
  for (unsigned short axis = 0; axis < 3; ++axis) {
    std::copy_n(factors[axis], HXSpectrum::kBands, weights_[axis].begin());
    white_[axis] = factors.GetFilterSum(axis);
  }
}

namespace {

bool IsEmission(const HXMeasureConditions& conditions) {
  return conditions.GetIllumination().GetIlluminationType() == IlluminationType::kEmission;
}

HXMeasureConditions AsSeen(const HXMeasureConditions& conditions, bool is_emission) {
  HXMeasureConditions seen = conditions;
  if (is_emission) {
    seen.SetIllumination(HXIllumination(IlluminationType::kEmission));
  }
  return seen;
}

}  // namespace

Viewing::Viewing(const HXMeasureConditions& conditions, bool is_emission,
                 const std::optional<HXSpectrum::Bands>& paper_white)
    : weighting(AsSeen(conditions, is_emission)) {
  const bool is_relative = !is_emission && conditions.GetWhiteBase() == WhiteBase::Paper;
  lacks_paper = is_relative && !paper_white;
  black_is_relative = is_relative && !IsEmission(conditions);
  if (is_relative) {
    paper = paper_white;
  }
}

Triple Viewing::GetAlmostBlack() const {
  HXSpectrum::Bands values;
  values.fill(kAlmostBlack);
  Triple xyz;
  XyzFromSpectra(weighting.GetWeights(), black_is_relative ? GetPaper() : nullptr,
                 {values.data(), 0}, 1, xyz.data());
  return xyz;
}

FromXyz FindFromXyz(const std::string& color_space) {
  const auto* const row =
      std::find_if(std::begin(kSpectrumRows), std::end(kSpectrumRows),
                   [&](const SpectrumRow& r) { return r.color_space == color_space; });
  return row == std::end(kSpectrumRows) ? nullptr : row->run;
}

FromColors FindFromColors(const std::string& from, const std::string& to) {
  if (from == to) {
    return from == Words::kCMYK ? Copy<4> : Copy<3>;
  }
  const auto* const row =
      std::find_if(std::begin(kColorRows), std::end(kColorRows),
                   [&](const ColorRow& r) { return r.from == from && r.to == to; });
  return row == std::end(kColorRows) ? nullptr : row->run;
}

}  // namespace Aldermoor::Tristim::Internals::Batch
