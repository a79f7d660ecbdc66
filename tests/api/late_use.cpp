// A static object that is made before the library keeps anything for the process, and so goes after
// whatever would go then.

#include <cstdio>
#include <cstdlib>
#include <memory>
#include <string>
#include <vector>

#include "aldermoor/measure/light.h"
#include "aldermoor/utilities/filesystem/file.h"
#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/spectrum.h"
#include "aldermoor/vexdoc/vex.h"
#include "aldermoor/vexdoc/xmlplatform.h"

namespace {

using namespace Aldermoor::Vexdoc;
using Aldermoor::Utilities::FileSystem::File;
using Aldermoor::Utilities::Tools::SmartPointer;

std::string path;

Conditions Measured(const char* type) {
  Conditions conditions;
  for (const auto& [key, value] : {std::pair{"Physical.WavelengthSpectrumMin", "380nm"},
                                   {"Physical.WavelengthSpectrumMax", "730nm"},
                                   {"Physical.NumberOfDataPointsSpectrum", "36"},
                                   {"Physical.SpectrumType", type}}) {
    conditions.AddAttribute(key, value);
  }
  return conditions;
}

// Ends the process with a failure at any exception, of which nobody is left to hear.
void UseTheLibrary() noexcept {
  VEX document("late");
  Sample sample("white");
  sample.AddSampleAttribute(SmartPointer<SampleAttribute>(
      new Spectrum(Measured("Remission"), std::vector<float>(36, 1.0F))));
  document.AddSample("set", sample);
  Conditions lab;
  lab.AddAttribute("ColorSpaceDescription.Type", "CIELab");
  const auto color =
      document.FindSample("set", "white")->GetSampleAttribute("VEXColorVector", lab, true);
  std::printf("L* %g ", static_cast<double>(dynamic_cast<ColorVector&>(*color).GetData()[0]));
  File file(path);
  document.SaveXML(file, true);
  std::printf("saved ");
  VEX again;
  again.LoadXML(file, false);
  std::printf(again.GetName() == "late" ? "loaded " : "lost ");
  Conditions light = Measured("Emission");
  light.AddAttribute("Colorimetric.Illumination", "Emission");
  const Spectrum equal_energy(light, std::vector<float>(36, 1.0F));
  std::printf(Aldermoor::Measure::ColorRenderingOf(equal_energy).index > 0.0F ? "reconstructed\n"
                                                                              : "dark\n");
  std::fflush(stdout);
}

struct Late {
  Late() = default;
  Late(const Late&) = delete;
  Late& operator=(const Late&) = delete;
  ~Late() { UseTheLibrary(); }
};

// The platform goes after the object that needs it.
std::unique_ptr<XMLPlatform> platform = std::make_unique<XMLPlatform>();
Late late;

}  // namespace

int main(int argc, char** argv) {
  if (argc != 2) {
    return EXIT_FAILURE;
  }
  path = argv[1];
  Conditions conditions;
  conditions.AddAttribute("first", "use");
  (void)SharedConditions(conditions);  // what is kept for the process is made behind `late`
  return EXIT_SUCCESS;
}
