// Uses the installed library from outside: builds a sample, reads the shipped chart, computes a
// colour of each, and catches a failure.  Prints the colours; exits with 0 if all went well.

#include <cmath>
#include <cstdio>
#include <exception>
#include <vector>

#include <aldermoor/utilities/exceptions/exceptions.h>
#include <aldermoor/version.h>
#include <aldermoor/vexdoc/colorvector.h>
#include <aldermoor/vexdoc/recipe.h>
#include <aldermoor/vexdoc/spectrum.h>
#include <aldermoor/vexdoc/vex.h>
#include <aldermoor/vexdoc/vexexception.h>
#include <aldermoor/vexdoc/xmlplatform.h>

using namespace Aldermoor;
using Utilities::FileSystem::File;
using Utilities::Tools::DynamicCast;
using Utilities::Tools::SmartPointer;

namespace {

Vexdoc::Conditions Lab() {
  Vexdoc::Conditions conditions;
  conditions.AddAttribute("ColorSpaceDescription.Type", "CIELab");
  conditions.AddAttribute("Colorimetric.Illumination", "D50");
  conditions.AddAttribute("Colorimetric.Observer", "TwoDegree");
  return conditions;
}

float Lightness(const Vexdoc::Sample& sample) {
  const auto color =
      DynamicCast<Vexdoc::ColorVector>(sample.GetSampleAttribute("VEXColorVector", Lab(), false));
  std::printf("%s: %s %g\n", sample.GetName().c_str(), color->GetDatastore()[0].first.c_str(),
              static_cast<double>(color->GetDatastore()[0].second));
  return color->GetDatastore()[0].second;
}

Vexdoc::Sample GreySample() {
  Vexdoc::Conditions measured;
  measured.AddAttribute("Physical.WavelengthSpectrumMin", "380nm");
  measured.AddAttribute("Physical.WavelengthSpectrumMax", "730nm");
  measured.AddAttribute("Physical.NumberOfDataPointsSpectrum", "36");
  measured.AddAttribute("Physical.SpectrumType", "Remission");
  Vexdoc::Sample sample("grey");
  sample.AddSampleAttribute(SmartPointer<Vexdoc::SampleAttribute>(
      new Vexdoc::Spectrum(measured, std::vector<float>(36, 0.18418652F))));
  return sample;
}

bool FailureArrivesWhole(const Vexdoc::VEX& document) {
  try {
    document.FindSample("chart", "no such patch");
  } catch (const Utilities::Exceptions::TraceableException& e) {
    return dynamic_cast<const std::out_of_range*>(&e) != nullptr && !e.where().empty();
  }
  return false;
}

}  // namespace

int main(int argc, char** argv) try {
  const Vexdoc::XMLPlatform platform;
  Vexdoc::VEX document("lab run");
  document.AddSample("made here", GreySample());
  // L* = 50 by definition: Y/Yn is ((50 + 16) / 116)³.
  const bool grey = std::abs(Lightness(*document.FindSample("made here", "grey")) - 50) < 0.001F;
  document.LoadXML(File(argc > 1 ? argv[1] : "chart24.xml"), false);
  const bool red = std::abs(Lightness(*document.FindSample("chart", "red")) - 42.28F) < 0.01F;
  std::printf("with the headers of version %s\n", ALDERMOOR_VERSION);
  return grey && red && FailureArrivesWhole(document) ? 0 : 1;
} catch (const std::exception& e) {
  std::fprintf(stderr, "consumer: %s\n", e.what());
  return 1;
}
