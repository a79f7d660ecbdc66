#include "aldermoor/tristim/tristimservice.h"

#include <array>

#include "aldermoor/tristim/internals/colorrenderingcalculator.h"
#include "aldermoor/tristim/internals/colortemperature.h"
#include "aldermoor/tristim/internals/deltaemath.h"
#include "aldermoor/tristim/internals/failuretexts.h"
#include "aldermoor/tristim/internals/lab2spec.h"
#include "aldermoor/tristim/internals/tristimcalculator.h"
#include "aldermoor/tristim/internals/vocabulary.h"
#include "aldermoor/tristim/tristimexception.h"
#include "aldermoor/utilities/exceptions/frame.h"

namespace Aldermoor::Tristim {
namespace {

namespace Words = Vocabulary;
using Calculator = Internals::TristimCalculator;

constexpr char kCalculatorFailed[] = "TristimCalculator";
constexpr char kOutOfRange[] = "TristimCalculator: Conversion out of Range";
constexpr char kRgbFailed[] = "Conversion failed from RGB to XYZ";

using FromSpectrum = bool (*)(const HXSpectrum& spectrum, const HXMeasureConditions& conditions,
                              HXColorVector& out);
using FromVector = bool (*)(const HXColorVector& in, HXColorVector& out);

/// By way of XYZ, for the conversions that look at the type of what they are given.
template <FromVector kFromXyz>
bool ThroughXyz(const HXSpectrum& spectrum, const HXMeasureConditions& conditions,
                HXColorVector& out) {
  HXMeasureConditions as_xyz = conditions;
  as_xyz.SetMeasureCondition(Words::kColorSpaceKey, Words::kCIEXYZ);
  HXColorVector xyz;
  return Calculator::GetVector_CIEXYZ(spectrum, as_xyz, xyz) && kFromXyz(xyz, out);
}

bool SpectrumToRgb(const HXSpectrum& spectrum, const HXMeasureConditions& conditions,
                   HXColorVector& out) {
  HXColorVector lab;
  return Calculator::GetVector_CIELab(spectrum, conditions, lab) &&
         Calculator::GetVector_CIELab_RGB(lab, out);
}

bool AnyToRgb(const HXColorVector& in, HXColorVector& out) {
  return Calculator::GetVector_CIELab_RGB(TristimService::GetVector(in, Words::kCIELab), out);
}

bool RgbToLab(const HXColorVector& in, HXColorVector& out) {
  HXColorVector xyz;
  if (!Calculator::GetVector_RGB_CIEXYZ(in, xyz)) {
    throw TristimException(kRgbFailed,
                           ALDERMOOR_HERE(Aldermoor::Tristim::TristimService::GetVector));
  }
  out = TristimService::GetVector(xyz, Words::kCIELab);
  return true;
}

struct SpectrumRow {
  std::string_view color_space;
  FromSpectrum run;
};

constexpr SpectrumRow kSpectrumRows[] = {
    {Words::kCIELab, Calculator::GetVector_CIELab},
    {Words::kCIELCh, Calculator::GetVector_CIELCh_ab},
    {Words::kCIEXYZ, Calculator::GetVector_CIEXYZ},
    {Words::kCIExyY, Calculator::GetVector_CIExyY},
    {Words::kCIELChuv, Calculator::GetVector_CIELCh_uv},
    {Words::kLABhx, Calculator::GetVector_LABhx},
    {Words::kLCHhx, Calculator::GetVector_LCHhx},
    {Words::kCIELuv, Calculator::GetVector_CIELuv},
    {Words::kCIEuvY1976, ThroughXyz<Calculator::GetVector_CIEuvY1976>},
    {Words::kCIEuvY1960, ThroughXyz<Calculator::GetVector_CIEuvY1960>},
    {Words::kHunterLab, Calculator::GetVector_HunterLab},
    {Words::kRxRyRz, Calculator::GetVector_RxRyRz},
    {Words::kRGB, SpectrumToRgb},
};

/// An empty `from` stands for any.
struct VectorRow {
  std::string_view from;
  std::string_view to;
  FromVector run;
};

// The first row that fits runs, so the general way to RGB stands behind the special ones.
constexpr VectorRow kVectorRows[] = {
    {Words::kCIEXYZ, Words::kCIELab, Calculator::GetVector_CIELab},
    {Words::kCIELab, Words::kCIEXYZ, Calculator::GetVector_CIEXYZ},
    {Words::kCIELab, Words::kCIELCh, Calculator::GetVector_CIELCh_ab},
    {Words::kLABhx, Words::kLCHhx, Calculator::GetVector_CIELCh_ab},
    {Words::kCIELuv, Words::kCIELChuv, Calculator::GetVector_CIELCh_ab},
    {Words::kCIEXYZ, Words::kCIExyY, Calculator::GetVector_CIExyY},
    {Words::kCIELab, Words::kRGB, Calculator::GetVector_CIELab_RGB},
    {Words::kCMYK, Words::kRGB, Calculator::GetVector_CMYK_RGB},
    {"", Words::kRGB, AnyToRgb},
    {Words::kCIEXYZ, Words::kCIEuvY1960, Calculator::GetVector_CIEuvY1960},
    {Words::kCIExyY, Words::kCIEuvY1960, Calculator::GetVector_CIEuvY1960},
    {Words::kCIEXYZ, Words::kCIEuvY1976, Calculator::GetVector_CIEuvY1976},
    {Words::kCIExyY, Words::kCIEuvY1976, Calculator::GetVector_CIEuvY1976},
    {Words::kRGB, Words::kCIELab, RgbToLab},
};

using Delta = bool (*)(const HXColorVector& first, const HXColorVector& second, HXColorVector& out);

struct DeltaRow {
  std::string_view from;
  Delta run;
  const char* to;
};

constexpr DeltaRow kDeltaRows[] = {
    {Words::kCIELab, Calculator::GetVector_DeltaCIELCH_ab, Words::kCIELCh},
    {Words::kCIELuv, Calculator::GetVector_CIELCH_uv, Words::kCIELChuv},
    {Words::kLABhx, Calculator::GetVector_LCHhx_delta, Words::kLCHhx},
};

constexpr float kUsual = 1.0F;
constexpr float kUsualL = 2.0F;  // of CMC

using Weights = std::array<float, 3>;
using DeltaOfSpectra = float (*)(const HXSpectrum& first, const HXSpectrum& second,
                                 const HXMeasureConditions& conditions, const Weights& weights);
using DeltaOfLab = float (*)(const Internals::HXLab& first, const Internals::HXLab& second,
                             const Weights& weights);

using UnweightedDelta = float (*)(const HXSpectrum& first, const HXSpectrum& second,
                                  const HXMeasureConditions& conditions);

template <UnweightedDelta kDelta>
float Unweighted(const HXSpectrum& first, const HXSpectrum& second,
                 const HXMeasureConditions& conditions, const Weights& /*weights*/) {
  return kDelta(first, second, conditions);
}

/// A formula word with its two forms; without the second it is for spectra only.
struct FormulaRow {
  std::string_view formula;
  Weights usual;
  DeltaOfSpectra of_spectra;
  DeltaOfLab of_lab;
};

constexpr FormulaRow kFormulaRows[] = {
    {Words::kCIELab,
     {},
     Unweighted<Calculator::GetDeltaE_CIELAB>,
     [](const Internals::HXLab& first, const Internals::HXLab& second, const Weights&) {
       return Calculator::GetDeltaE_CIELAB(first, second);
     }},
    {Words::kLABhx, {}, Unweighted<Calculator::GetDeltaE_hx>, nullptr},
    {Words::kCIELuv, {}, Unweighted<Calculator::GetDeltaE_CIELUV>, nullptr},
    {Words::kFMCII, {}, Unweighted<Calculator::GetDeltaE_FMCII>, nullptr},
    {Words::kCMC,
     {kUsualL, kUsual, kUsual},
     [](const HXSpectrum& first, const HXSpectrum& second, const HXMeasureConditions& conditions,
        const Weights& w) {
       return Calculator::GetDeltaE_CMC(first, second, conditions, w[0], w[1]);
     },
     [](const Internals::HXLab& first, const Internals::HXLab& second, const Weights& w) {
       return Calculator::GetDeltaE_CMC(first, second, w[0], w[1]);
     }},
    {Words::k94,
     {kUsual, kUsual, kUsual},
     [](const HXSpectrum& first, const HXSpectrum& second, const HXMeasureConditions& conditions,
        const Weights& w) {
       return Calculator::GetDeltaE_94(first, second, conditions, w[0], w[1], w[2]);
     },
     [](const Internals::HXLab& first, const Internals::HXLab& second, const Weights& w) {
       return Calculator::GetDeltaE_94(first, second, w[0], w[1], w[2]);
     }},
    {Words::k2000,
     {kUsual, kUsual, kUsual},
     [](const HXSpectrum& first, const HXSpectrum& second, const HXMeasureConditions& conditions,
        const Weights& w) {
       return Calculator::GetDeltaE_2000(first, second, conditions, w[0], w[1], w[2]);
     },
     [](const Internals::HXLab& first, const Internals::HXLab& second, const Weights& w) {
       return Calculator::GetDeltaE_2000(first, second, w[0], w[1], w[2]);
     }},
};

const FormulaRow* FindFormula(std::string_view formula) {
  for (const FormulaRow& row : kFormulaRows) {
    if (row.formula == formula) {
      return &row;
    }
  }
  return nullptr;
}

Weights WithUsual(Weights weights, const Weights& usual) {
  for (std::size_t i = 0; i < weights.size(); ++i) {
    weights[i] = weights[i] == 0.0F ? usual[i] : weights[i];
  }
  return weights;
}

FromSpectrum FindWay(std::string_view color_space) {
  for (const SpectrumRow& row : kSpectrumRows) {
    if (row.color_space == color_space) {
      return row.run;
    }
  }
  return nullptr;
}

FromVector FindWay(std::string_view from, std::string_view to) {
  for (const VectorRow& row : kVectorRows) {
    if ((row.from.empty() || row.from == from) && row.to == to) {
      return row.run;
    }
  }
  return nullptr;
}

}  // namespace

HXColorVector TristimService::GetVector(const HXSpectrum& spectrum,
                                        const HXMeasureConditions& conditions) try {
  const FromSpectrum run = FindWay(conditions.GetColorSpace());
  if (run == nullptr) {
    throw TristimException(Internals::NoColorSpace(conditions.GetColorSpace()),
                           ALDERMOOR_HERE(Aldermoor::Tristim::TristimService::GetVector));
  }
  HXColorVector out;
  if (!run(spectrum, conditions, out)) {
    throw TristimException(kCalculatorFailed,
                           ALDERMOOR_HERE(Aldermoor::Tristim::TristimService::GetVector));
  }
  return out;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::TristimService::GetVector)

HXColorVector TristimService::GetVector(const HXColorVector& vector,
                                        const std::string& colorSpace) try {
  const std::string& from = vector.GetMeasureConditions().GetColorSpace();
  if (from == colorSpace) {
    return vector;
  }
  const FromVector run = FindWay(from, colorSpace);
  if (run == nullptr) {
    throw TristimException(Internals::NoConversion(from, colorSpace),
                           ALDERMOOR_HERE(Aldermoor::Tristim::TristimService::GetVector));
  }
  HXColorVector out;
  if (!run(vector, out)) {
    throw TristimException(kCalculatorFailed,
                           ALDERMOOR_HERE(Aldermoor::Tristim::TristimService::GetVector));
  }
  if (colorSpace == Words::kRGB) {
    return out;
  }
  // Three channels, and the conditions of the source even where the way led through others.
  HXMeasureConditions conditions = vector.GetMeasureConditions();
  conditions.SetMeasureCondition(Words::kColorSpaceKey, colorSpace);
  return {out[0], out[1], out[2], conditions};
}
ALDERMOOR_FRAME(Aldermoor::Tristim::TristimService::GetVector)

HXColorVector TristimService::GetDeltaVector(const HXColorVector& first,
                                             const HXColorVector& second) try {
  HXMeasureConditions conditions = first.GetMeasureConditions();
  for (const DeltaRow& row : kDeltaRows) {
    if (row.from != first.GetMeasureConditions().GetColorSpace()) {
      continue;
    }
    HXColorVector out;
    if (row.run(first, second, out)) {
      conditions.SetMeasureCondition(Words::kColorSpaceKey, row.to);
      out.SetMeasureConditions(conditions);
      return out;
    }
  }
  throw TristimException(kCalculatorFailed,
                         ALDERMOOR_HERE(Aldermoor::Tristim::TristimService::GetDeltaVector));
}
ALDERMOOR_FRAME(Aldermoor::Tristim::TristimService::GetDeltaVector)

float TristimService::GetDeltaE(const HXSpectrum& first, const HXSpectrum& second,
                                const HXMeasureConditions& conditions, float weight1, float weight2,
                                float weight3) try {
  const FormulaRow* const row = FindFormula(conditions.GetDeltaEFormula());
  if (row == nullptr) {
    throw TristimException(Internals::NoFormula(conditions.GetDeltaEFormula()),
                           ALDERMOOR_HERE(Aldermoor::Tristim::TristimService::GetDeltaE));
  }
  const Weights weights = WithUsual({weight1, weight2, weight3}, row->usual);
  const float difference = row->of_spectra(first, second, conditions, weights);
  if (difference == Internals::kNoDeltaE) {
    throw TristimException(kCalculatorFailed,
                           ALDERMOOR_HERE(Aldermoor::Tristim::TristimService::GetDeltaE));
  }
  return difference;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::TristimService::GetDeltaE)

float TristimService::GetDeltaE(const HXColorVector& first, const HXColorVector& second,
                                float weight1, float weight2, float weight3) try {
  const HXColorVector one = GetVector(first, Words::kCIELab);
  const HXColorVector other = GetVector(second, Words::kCIELab);
  const FormulaRow* const row = FindFormula(first.GetMeasureConditions().GetDeltaEFormula());
  float difference = Internals::kNoDeltaE;
  if (row != nullptr && row->of_lab != nullptr) {
    difference = row->of_lab(one, other, WithUsual({weight1, weight2, weight3}, row->usual));
  }
  if (difference == Internals::kNoDeltaE) {
    throw TristimException(kCalculatorFailed,
                           ALDERMOOR_HERE(Aldermoor::Tristim::TristimService::GetDeltaE));
  }
  return difference;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::TristimService::GetDeltaE)

std::string TristimService::GetColorType(const HXSpectrum& spectrum) try {
  return Internals::ColorFamilyName(Calculator::GetColorType(spectrum));
}
ALDERMOOR_FRAME(Aldermoor::Tristim::TristimService::GetColorType)

float TristimService::GetMetamery(const HXSpectrum& first, const HXSpectrum& second,
                                  const HXMeasureConditions& conditions,
                                  const HXMeasureConditions& testConditions) try {
  const float index =
      Calculator::GetMetamery(first, second, conditions, testConditions.GetIllumination());
  if (index == Internals::kNoDeltaE) {
    throw TristimException(kCalculatorFailed,
                           ALDERMOOR_HERE(Aldermoor::Tristim::TristimService::GetMetamery));
  }
  return index;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::TristimService::GetMetamery)

float TristimService::GetColorTemperature(const HXSpectrum& spectrum) try {
  return Internals::ColorTemperature().GetColorTemperature(spectrum);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::TristimService::GetColorTemperature)

HXSpectrum TristimService::GetSpectrum(const HXColorVector& vector) try {
  constexpr double kMostDeltaE = 0.1;
  constexpr int kMostIterations = 1000;
  static const Internals::Lab2Spec lab_to_spectrum;
  const HXColorVector lab = GetVector(vector, Words::kCIELab);
  HXSpectrum spectrum;
  if (!lab_to_spectrum.GetSpectrum(lab, spectrum, kMostDeltaE, false, kMostIterations)) {
    throw TristimException(kOutOfRange,
                           ALDERMOOR_HERE(Aldermoor::Tristim::TristimService::GetSpectrum));
  }
  return spectrum;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::TristimService::GetSpectrum)

bool TristimService::GetColorRenderingIndex(const HXSpectrum& source, float& index,
                                            std::string& reference) try {
  bool valid = false;
  index = static_cast<float>(
      Internals::ColorRenderingCalculator().GetColorRenderingIndex(source, valid, reference));
  return valid;
}
ALDERMOOR_FRAME(Aldermoor::Tristim::TristimService::GetColorRenderingIndex)

const std::vector<std::string>& TristimService::GetSupportedValues(std::string_view key) try {
  return HXMeasureConditions::GetSupportedValues(key);
}
ALDERMOOR_FRAME(Aldermoor::Tristim::TristimService::GetSupportedValues)

}  // namespace Aldermoor::Tristim
