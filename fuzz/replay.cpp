// Replays inputs without libFuzzer: every file in a directory. The last one that is named was at fault.

#include <filesystem>
#include <fstream>
#include <iostream>
#include <iterator>
#include <set>
#include <string>

#include "fuzz/fuzz.h"

int main(int argc, char** argv) {
  namespace files = std::filesystem;
  if (argc != 2 || !files::is_directory(argv[1])) {
    std::cerr << "Usage: " << *argv << " DIRECTORY" << std::endl;
    return 2;
  }
  std::set<files::path> inputs;
  for (const auto& entry : files::directory_iterator(argv[1])) inputs.insert(entry.path());
  for (const files::path& input : inputs) {
    std::cerr << input.string() << std::endl;
    std::ifstream file(input, std::ios::binary);
    const std::string bytes((std::istreambuf_iterator<char>(file)), {});
    LLVMFuzzerTestOneInput(reinterpret_cast<const std::uint8_t*>(bytes.data()), bytes.size());
  }
  return inputs.empty() ? 1 : 0;
}
