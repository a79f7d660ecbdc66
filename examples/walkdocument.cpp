// Walks a document through filters:  walkdocument FILE
//
// Counts the samples that can give a colour for a D50 booth, whether it is stored or computed, and
// lists what every sample holds under conditions of a measured reflectance.

#include <cstdio>
#include <exception>

#include "aldermoor/vexdoc/vex.h"
#include "aldermoor/vexdoc/xmlplatform.h"

using namespace Aldermoor::Vexdoc;
using Aldermoor::Utilities::FileSystem::File;

int main(int argc, char** argv) try {
  if (argc != 2) {
    std::fputs("usage: walkdocument FILE\n", stderr);
    return 2;
  }
  const XMLPlatform platform;
  VEX document;
  document.LoadXML(File(argv[1]), false);

  Conditions booth;
  booth.AddAttribute("ColorSpaceDescription.Type", "CIELab");
  booth.AddAttribute("Colorimetric.Illumination", "D50");
  booth.AddAttribute("Colorimetric.Observer", "TwoDegree");
  int colors = 0;
  for (auto i = document.GetFirstSample(booth, "VEXColorVector", ""); i.HasNext(); ++i) {
    ++colors;
  }
  std::printf("%d samples have a colour for D50\n", colors);

  Conditions measured;
  measured.AddAttribute("Physical.SpectrumType", "Remission");
  for (auto i = document.GetFirstSample(""); i.HasNext(); ++i) {
    const auto sample = i.Dereference();
    std::printf("%s:", sample->GetName().c_str());
    for (auto k = sample->GetFirstSampleAttribute(measured); k.HasNext(); k.Move2NextMatch()) {
      std::printf(" %s", k.Dereference()->GetType().c_str());
    }
    std::printf("\n");
  }
  return 0;
} catch (const std::exception& e) {
  std::fprintf(stderr, "walkdocument: %s\n", e.what());
  return 1;
}
