// Loads a document, changes what it knows and saves it; what it does not know comes through:
//   keepunknown small.xml copy.xml

#include <cstdio>
#include <exception>

#include "aldermoor/vexdoc/vex.h"
#include "aldermoor/vexdoc/xmlplatform.h"

using namespace Aldermoor::Vexdoc;
using Aldermoor::Utilities::FileSystem::File;

int main(int argc, char** argv) try {
  if (argc != 3) {
    std::fputs("usage: keepunknown FILE COPY\n", stderr);
    return 2;
  }
  const XMLPlatform platform;
  VEX document;
  document.LoadXML(File(argv[1]), false);
  int unknown = 0;
  for (auto i = document.GetFirstSample(""); i.HasNext(); ++i) {
    const auto sample = i.Dereference();
    sample->SetDescription("seen");
    for (auto k = sample->GetFirstSampleAttribute(); k.HasNext(); k.Move2NextMatch()) {
      unknown += k.Dereference()->GetType() == "VEXUnknownSampleAttribute" ? 1 : 0;
    }
  }
  File copy(argv[2]);
  document.SaveXML(copy, false);
  std::printf("%d attributes of unknown kinds kept\n", unknown);
  return 0;
} catch (const std::exception& e) {
  std::fprintf(stderr, "keepunknown: %s\n", e.what());
  return 1;
}
