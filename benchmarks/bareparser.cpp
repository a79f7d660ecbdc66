// The start that no program with this XML parser can undercut: the loading of the parser and of the
// libraries that it brings along, and its own set-up.
#include <xercesc/util/PlatformUtils.hpp>

int main() {
  xercesc::XMLPlatformUtils::Initialize();
  xercesc::XMLPlatformUtils::Terminate();
}
