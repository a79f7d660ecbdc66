// Colours of many spectra at once, in two threads, and how far each is from the first of them.

#include <array>
#include <iostream>
#include <span>
#include <thread>
#include <vector>

#include "aldermoor/measure/context.h"

using Aldermoor::Measure::Context;
using Aldermoor::Measure::kBands;

int main() {
  // A ramp of greys, one spectrum of 36 reflectances behind the other.
  constexpr std::size_t kGreys = 10000;
  std::vector<float> spectra;
  for (std::size_t i = 0; i < kGreys; ++i) {
    spectra.insert(spectra.end(), kBands, static_cast<float>(i) / static_cast<float>(kGreys - 1));
  }

  Aldermoor::Vexdoc::Conditions lab;
  lab.AddAttribute("ColorSpaceDescription.Type", "CIELab");
  lab.AddAttribute("ColorSpaceDescription.DeltaEFormula", "2000");
  lab.AddAttribute("Colorimetric.Illumination", "D65");
  lab.AddAttribute("Colorimetric.Observer", "TenDegree");
  const Context context(lab);

  std::vector<float> colors(3 * kGreys);
  std::vector<float> differences(kGreys);
  const auto work = [&](std::size_t first, std::size_t count) {
    const auto part = std::span(spectra).subspan(first * kBands, count * kBands);
    context.ConvertSpectra(part, std::span(colors).subspan(3 * first, 3 * count));
    context.CompareSpectra(std::span(spectra).first(kBands), part,
                           std::span(differences).subspan(first, count));
  };
  {
    const std::jthread other(work, 0, kGreys / 2);
    work(kGreys / 2, kGreys - kGreys / 2);
  }
  std::cout << "the lightest grey has L* = " << colors[3 * (kGreys - 1)] << " and is "
            << differences.back() << " from black\n";
}
