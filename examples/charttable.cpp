// Prints every sample of a document under two sets of conditions, as CIELab and CIELCh, with XYZ
// and the colour for a display:  charttable chart24.xml

#include <cstdio>
#include <exception>
#include <string>
#include <vector>

#include "aldermoor/vexdoc/colorvector.h"
#include "aldermoor/vexdoc/vex.h"
#include "aldermoor/vexdoc/xmlplatform.h"

using namespace Aldermoor::Vexdoc;
using Aldermoor::Utilities::FileSystem::File;

namespace {

Conditions Under(const char* illuminant, const char* observer, const char* space) {
  Conditions conditions;
  conditions.AddAttribute("Colorimetric.Illumination", illuminant);
  conditions.AddAttribute("Colorimetric.Observer", observer);
  conditions.AddAttribute("ColorSpaceDescription.Type", space);
  return conditions;
}

std::vector<double> Channels(const Sample& sample, const Conditions& conditions) {
  using Aldermoor::Utilities::Tools::DynamicCast;
  const auto color =
      DynamicCast<ColorVector>(sample.GetSampleAttribute("VEXColorVector", conditions, false));
  std::vector<double> values;
  for (const auto& channel : color->GetDatastore()) {
    values.push_back(static_cast<double>(channel.second));
  }
  return values;
}

void PrintLabAndLch(const Sample& sample, const char* illuminant, const char* observer) {
  const auto lab = Channels(sample, Under(illuminant, observer, "CIELab"));
  const auto lch = Channels(sample, Under(illuminant, observer, "CIELCh"));
  std::printf(" |%7.2f%8.2f%8.2f%8.2f%8.2f", lab[0], lab[1], lab[2], lch[1], lch[2]);
}

void Print(const Sample& sample) {
  std::printf("%-14s", sample.GetName().c_str());
  PrintLabAndLch(sample, "D50", "TwoDegree");
  PrintLabAndLch(sample, "D65", "TenDegree");
  const auto xyz = Channels(sample, Under("D50", "TwoDegree", "CIEXYZ"));
  const auto rgb = Channels(sample, Under("D65", "TwoDegree", "RGB"));
  std::printf(" |%7.2f%7.2f%7.2f | #%02x%02x%02x\n", xyz[0], xyz[1], xyz[2],
              static_cast<unsigned>(rgb[0]), static_cast<unsigned>(rgb[1]),
              static_cast<unsigned>(rgb[2]));
}

}  // namespace

int main(int argc, char** argv) try {
  if (argc != 2) {
    std::fputs("usage: charttable FILE\n", stderr);
    return 2;
  }
  const XMLPlatform platform;
  VEX document;
  document.LoadXML(File(argv[1]), false);
  std::printf("%-14s |%-39s |%-39s |%-21s | %s\n", "", " D50/2", " D65/10", " D50/2", "D65/2");
  std::printf("%-14s |%7s%8s%8s%8s%8s |%7s%8s%8s%8s%8s |%7s%7s%7s | %s\n", "patch", "L*", "a*",
              "b*", "C*", "h", "L*", "a*", "b*", "C*", "h", "X", "Y", "Z", "display");
  for (const auto& [set_name, set] : document.GetSampleSets()) {
    for (const auto& [name, sample] : set->GetSamples()) {
      Print(*sample);
    }
  }
  return 0;
} catch (const std::exception& e) {
  std::fprintf(stderr, "charttable: %s\n", e.what());
  return 1;
}
