// Runs the target on every file of the folders that are named.

#include "tests/fuzz/support.h"

int main(int argc, char** argv) {
  for (int i = 1; i < argc; ++i) {
    const std::filesystem::directory_iterator files(argv[i]);
    if (files == std::filesystem::directory_iterator()) {
      std::cerr << argv[i] << " is empty\n";
      return 1;
    }
    for (const auto& entry : files) {
      const std::string bytes = Aldermoor::Vexdoc::Testing::ReadFile(entry.path());
      std::cerr << entry.path().string() << std::endl;  // the last one is at fault
      LLVMFuzzerTestOneInput(reinterpret_cast<const std::uint8_t*>(bytes.data()), bytes.size());
    }
  }
  return 0;
}
