#include <gtest/gtest.h>

#include "aldermoor/vexdoc/xmlplatform.h"

int main(int argc, char** argv) {
  const Aldermoor::Vexdoc::XMLPlatform platform;
  ::testing::InitGoogleTest(&argc, argv);
  return RUN_ALL_TESTS();
}
