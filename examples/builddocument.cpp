// Builds a document in memory and saves it, with a cache beside it:  builddocument ramp.xml
//
// The document is a grey ramp: eleven flat spectra from black to white, each with its recipe.

#include <cstdio>
#include <exception>
#include <string>
#include <vector>

#include "aldermoor/vexdoc/recipe.h"
#include "aldermoor/vexdoc/spectrum.h"
#include "aldermoor/vexdoc/vex.h"
#include "aldermoor/vexdoc/xmlplatform.h"

using namespace Aldermoor::Vexdoc;
using Aldermoor::Utilities::FileSystem::File;
using Attribute = Aldermoor::Utilities::Tools::SmartPointer<SampleAttribute>;

namespace {

constexpr std::size_t kBands = 36;

Conditions MeasuredReflectance() {
  Conditions conditions;
  conditions.AddAttribute("Physical.WavelengthSpectrumMin", "380nm");
  conditions.AddAttribute("Physical.WavelengthSpectrumMax", "730nm");
  conditions.AddAttribute("Physical.NumberOfDataPointsSpectrum", std::to_string(kBands));
  conditions.AddAttribute("Physical.SpectrumType", "Remission");
  return conditions;
}

// All samples are measured alike; the library stores equal conditions once, also in the file.
Sample Step(int percent, const Conditions& conditions) {
  const std::vector<float> reflectance(kBands, static_cast<float>(percent) / 100.0F);
  const float black = static_cast<float>(100 - percent);
  Sample sample("Grey " + std::to_string(percent));
  sample.SetAttribute("Operator", "R. S.");  // any key of your own goes into the file
  sample.AddSampleAttribute(Attribute(new Spectrum(conditions, reflectance)));
  sample.AddSampleAttribute(
      Attribute(new Recipe(conditions, "inks", 1.5F, "paper", {{"black", black}})));
  return sample;
}

}  // namespace

int main(int argc, char** argv) try {
  if (argc != 2) {
    std::fputs("usage: builddocument FILE\n", stderr);
    return 2;
  }
  const XMLPlatform platform;
  VEX document("Grey ramp");
  document.SetDescription("Eleven steps from black to white");
  const Conditions conditions = MeasuredReflectance();
  for (int percent = 0; percent <= 100; percent += 10) {
    document.AddSample("Ramp", Step(percent, conditions));  // makes the set where it is missing
  }
  File file(argv[1]);
  document.SaveXML(file, true);
  std::printf("%u samples in %s\n", document.GetSampleSet("Ramp")->Size(), file.GetName().c_str());
  return 0;
} catch (const std::exception& e) {
  std::fprintf(stderr, "builddocument: %s\n", e.what());
  return 1;
}
